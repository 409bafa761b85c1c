#include "exit_code.h"

#include <algorithm>
#include <array>

namespace factory_test {

namespace {

constexpr auto kRows = std::to_array<ExitRow>({
    {ExitCode::Passed,
     "all tests passed, or none was to be done (--help, --shot, --monkey and the like)"},
    {ExitCode::Trouble, "the screen cannot be opened, or a file not read or written"},
    {ExitCode::WrongUse, "a wrong option or a wrong plan"},
    {ExitCode::Failed, "a test failed, of whichever unit"},
    {ExitCode::Incomplete, "no test failed, but not all tests of each unit have a verdict"},
    {ExitCode::NotSaved, "a result, or the end of a run, could not be kept"},
});

constexpr auto kFromBestToWorst =
    std::to_array({ExitCode::Passed, ExitCode::Incomplete, ExitCode::Failed, ExitCode::NotSaved});

}  // namespace

std::span<const ExitRow> exitRows() { return kRows; }

ExitCode judgeRun(const ResultBook& book, std::span<const std::string> tests) {
  if (!book.isAllSaved()) return ExitCode::NotSaved;
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

ExitCode worse(ExitCode one, ExitCode other) {
  return std::ranges::find(kFromBestToWorst, one) < std::ranges::find(kFromBestToWorst, other)
             ? other
             : one;
}

}  // namespace factory_test
