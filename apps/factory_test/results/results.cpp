#include "results/results.h"

#include <algorithm>
#include <climits>
#include <system_error>
#include <utility>

#include "results/junit.h"
#include "results/results_json.h"
#include "results/whole_file.h"

namespace factory_test {

namespace {

bool isBlank(const std::string& text) {
  return text.find_first_not_of(" \t\r\n") == std::string::npos;
}

}  // namespace

std::optional<ResultBook> ResultBook::open(const Keeping& places, const RunStart& start,
                                           std::string& error) {
  ResultBook book(places);
  if (!book.lockFiles(error) || !book.resumeFile(error)) return {};
  if (!places.database.empty()) {
    book.database = Database::open(places.database, error);
    if (!book.database) return {};
    if (!places.line.empty()) book.line = std::make_unique<Line>(places.database, places.line);
  }
  if (places.first == FirstRun::AtOnce)
    return book.begin(start, error) ? std::optional(std::move(book)) : std::nullopt;
  book.begun = storable(start);
  return book.saveFiles(error) ? std::optional(std::move(book)) : std::nullopt;
}

bool ResultBook::lockFiles(std::string& error) {
  if (files.isOnlyShown) return true;
  for (const auto& file : {files.json, files.junit}) {
    if (file.empty()) continue;
    auto lock = FileLock::take(file, error);
    if (!lock) return false;
    locks.push_back(std::move(*lock));
  }
  return true;
}

// With a database the file is only looked at: it must not be something else that is written over.
bool ResultBook::resumeFile(std::string& error) {
  std::error_code failure;
  if (files.json.empty() || (!std::filesystem::exists(files.json, failure) && !failure))
    return true;
  const auto text = readFile(files.json, error);
  if (!text) return false;
  if (isBlank(*text)) return true;
  std::string reason;
  auto file = parseResults(*text, reason);
  if (!file) {
    error = files.json.native() + ": " + reason;
    return false;
  }
  if (!files.database.empty()) return true;
  begun.unit = std::move(file->unit);
  for (TestResult& result : file->results) put(std::move(result));
  return true;
}

bool ResultBook::begin(const RunStart& start, std::string& error) {
  RunStart wanted = storable(start);
  if (database) {
    std::vector<TestResult> resumed;
    if (!database->startRun(wanted, files.resume, resumed, error)) return false;
    kept.clear();
    for (TestResult& result : resumed) put(std::move(result));
  } else if (!kept.empty() && !begun.unit.empty() && begun.unit != wanted.unit) {
    if (!wanted.unit.empty()) {
      error = (files.json.empty() ? "the program" : files.json.native()) +
              ": holds the results of unit " + begun.unit + ", not of " + wanted.unit;
      return false;
    }
    wanted.unit = begun.unit;
  }
  begun = std::move(wanted);
  isBegun = true;
  return saveFiles(error);
}

bool ResultBook::startUnit(const RunStart& start, std::string& error) {
  return saveAgain(error) && begin(start, error);
}

bool ResultBook::saveFiles(std::string& error) {
  if (files.isOnlyShown) return true;
  const bool isKept =
      files.json.empty() || replaceFile(files.json, resultsJson(begun, kept), error);
  const JunitSuite suite = {.run = begun, .results = kept};
  const bool isReported =
      files.junit.empty() || replaceFile(files.junit, junitXml({&suite, 1}), error);
  if (isKept && isReported) unsavedTests.clear();
  return isKept && isReported;
}

bool ResultBook::saveDatabase(std::string& error) {
  if (!database) return true;
  if (!unsavedVerdicts.empty()) {
    if (!database->keep(unsavedVerdicts, error)) return false;
    if (line) line->wake(unsavedVerdicts.size());
    unsavedVerdicts.clear();
  }
  if (!isFinishing) return true;
  isFinishing = !database->finishRun(error);
  if (line) line->wake(0);
  return !isFinishing;
}

bool ResultBook::record(TestResult result, std::string& error) {
  result = clamped(std::move(result));
  if (const TestResult* const earlier = find(result.test)) {
    result.attempt =
        std::max(result.attempt, earlier->attempt + (earlier->attempt < INT_MAX ? 1 : 0));
  }
  if (result.operatorName.empty()) result.operatorName = begun.operatorName;
  if (database) unsavedVerdicts.push_back(result);
  unsavedTests.push_back(result.test);
  put(std::move(result));
  return saveAgain(error);
}

bool ResultBook::isSaved(std::string_view test) const {
  return find(test) != nullptr && std::ranges::find(unsavedTests, test) == unsavedTests.end() &&
         std::ranges::find(unsavedVerdicts, test, &TestResult::test) == unsavedVerdicts.end();
}

bool ResultBook::saveAgain(std::string& error) {
  const bool isStored = saveDatabase(error);
  return (unsavedTests.empty() || saveFiles(error)) && isStored;
}

bool ResultBook::finish(std::string& error) {
  isFinishing = database != nullptr;
  return saveAgain(error);
}

void ResultBook::setPatience(std::chrono::milliseconds patience) {
  if (database) database->setPatience(patience);
}

bool ResultBook::close(std::string& error) {
  setPatience(Sqlite::kPatience);
  const bool isKept = saveAgain(error);
  database.reset();
  if (line) line->end();
  return isKept;
}

std::optional<LineStatus> ResultBook::lineStatus() const {
  return line ? std::optional(line->status()) : std::nullopt;
}

void ResultBook::put(TestResult result) {
  const auto earlier = std::ranges::find(kept, result.test, &TestResult::test);
  if (earlier == kept.end()) {
    kept.push_back(std::move(result));
  } else {
    *earlier = std::move(result);
  }
}

const TestResult* ResultBook::find(std::string_view test) const {
  const auto found = std::ranges::find(kept, test, &TestResult::test);
  return found == kept.end() ? nullptr : &*found;
}

}  // namespace factory_test
