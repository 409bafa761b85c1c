#include "questions.h"

#include <string>

#include "language/language.h"
#include "pages/table.h"
#include "plan/judge.h"
#include "run_progress.h"
#include "value_lines.h"

namespace factory_test {

namespace {

// Null: who said so knows why.
const char* wordsOf(Reason failure) {
  switch (failure) {
    case Reason::Limit: return tr("A value is outside its limits, or missing.");
    case Reason::TimeOut: return tr("The time is over.");
    case Reason::Rehearsal: return tr("This failure is a rehearsal.");
    case Reason::Retry:
    case Reason::Unknown:
    case Reason::Operator: break;
  }
  return nullptr;
}

std::string nameOf(const std::string& test) { return tr(testEntries()[placeOf(test)].name); }

// "Failed: Keys, Pinch", or nothing.
std::string failedTests(const ResultBook& book) {
  std::string names;
  for (const std::string& test : book.run().tests) {
    const TestResult* const result = book.find(test);
    if (result == nullptr || result->verdict != Verdict::Fail) continue;
    names.append(names.empty() ? tr("Failed: ") : ", ").append(nameOf(test));
  }
  return names;
}

}  // namespace

Question incompletePass(const Test& test, const PlanStep& step) {
  std::vector<Measure> values = test.values();
  const bool isWithin = judge(Verdict::Pass, values, step) == Verdict::Pass;
  const char* const words =
      isWithin ? tr("The test has not shown or asked all that it must. Pass anyway?")
               : tr("Values are outside their limits or missing: this counts as FAIL. End the "
                    "test?");
  return {tr("Not all was tested"), words, isWithin ? tr("PASS") : tr("FAIL"), tr("GO ON")};
}

Question endOfRun(const ResultBook& book, const char* more) {
  const RunProgress progress = progressOf(book);
  std::string words = progress.allWords() + (book.isAllSaved() ? "" : tr(", not saved"));
  if (progress.failed > 0) words.append("\n").append(failedTests(book));
  if (progress.failed > 0) return {tr("FAIL"), words, tr("END"), more, kFailInk, Title::Huge};
  if (progress.passed == progress.tests) {
    return {tr("PASS"), words, tr("END"), more, kPassInk, Title::Huge};
  }
  return {tr("INCOMPLETE"), words, tr("END"), more, kRowInk, Title::Huge};
}

std::optional<Notice> whyFailed(const PlanStep& step, const std::vector<Measure>& values,
                                Reason failure, uint32_t now) {
  const char* const why = wordsOf(failure);
  if (why == nullptr) return {};
  std::string words = why;
  for (const ValueLine& line : valueLines(values, step)) {
    if (line.isWithin == false) words.append("\n").append(line.words);
  }
  return Notice(nameOf(step.test), tr("FAIL"), kFailInk, words, now);
}

}  // namespace factory_test
