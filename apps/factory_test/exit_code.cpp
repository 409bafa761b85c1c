#include "exit_code.h"

#include <algorithm>
#include <array>

namespace factory_test {

namespace {

constexpr auto kRows = std::to_array<ExitRow>({
    {ExitCode::Passed,
     "all tests passed, or none was to be done (--help, --shot, --monkey and the like)"},
    {ExitCode::Trouble, "the screen cannot be opened, or a file not read or written"},
    {ExitCode::WrongUse, "a wrong option"},
    {ExitCode::Failed, "a test failed"},
    {ExitCode::Incomplete, "no test failed, but not all have a verdict"},
    {ExitCode::NotSaved, "a result could not be kept"},
});

}  // namespace

std::span<const ExitRow> exitRows() { return kRows; }

ExitCode judgeRun(const ResultBook& book, std::span<const std::string> tests) {
  const bool isKept = std::ranges::all_of(
      book.results(), [&](const TestResult& result) { return book.isSaved(result.test); });
  if (!isKept) return ExitCode::NotSaved;
  const auto has = [&](const std::string& test, Verdict verdict) {
    const TestResult* const result = book.find(test);
    return result != nullptr && result->verdict == verdict;
  };
  if (std::ranges::any_of(tests,
                          [&](const std::string& test) { return has(test, Verdict::Fail); })) {
    return ExitCode::Failed;
  }
  const bool isDone =
      std::ranges::all_of(tests, [&](const std::string& test) { return has(test, Verdict::Pass); });
  return isDone ? ExitCode::Passed : ExitCode::Incomplete;
}

}  // namespace factory_test
