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

std::string unitWords(const std::string& unit) {
  return unit.empty() ? "an unknown unit" : "unit " + unit;
}

std::string planWords(const RunStart& run) {
  constexpr std::size_t kShortHash = 8;
  if (run.planHash.empty()) return "an unknown plan";
  return "plan '" + run.planName + "' (" + run.planHash.substr(0, kShortHash) + ")";
}

// Whose results, held by a file, a run must not take for its own; empty: it may.
std::string strangerIn(const RunStart& held, const RunStart& wanted) {
  if (!wanted.unit.empty() && held.unit != wanted.unit)
    return unitWords(held.unit) + ", not of " + wanted.unit;
  if (held.planHash != wanted.planHash) return planWords(held) + ", not of " + planWords(wanted);
  return "";
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
  begun = std::move(file->run);
  state = file->state;
  for (TestResult& result : file->results) put(std::move(result));
  return true;
}

bool ResultBook::begin(const RunStart& start, std::string& error) {
  RunStart wanted = storable(start);
  if (database) {
    std::vector<TestResult> resumed;
    if (!database->startRun(wanted, files.resume, resumed, error)) return false;
    isBegun = false;  // until the files say so, too
    beginAnew();
    for (TestResult& result : resumed) put(std::move(result));
  } else if (!goOn(wanted, error)) {
    return false;
  }
  begun = std::move(wanted);
  isBegun = true;
  return saveFiles(error);
}

// With the results that are there, or without them.
bool ResultBook::goOn(RunStart& wanted, std::string& error) {
  const bool isStale = files.resume == Resume::No;
  const std::string stranger = kept.empty() || isStale ? "" : strangerIn(begun, wanted);
  if (!stranger.empty()) {
    error = (files.json.empty() ? "the program" : files.json.native()) + ": holds the results of " +
            stranger + "; --new-run begins anew";
    return false;
  }
  const bool isRehearsal = wanted.planName.ends_with(kRehearsal);
  const bool isThrough = state == RunState::Finished || isComplete(wanted.tests);
  if (isStale || isRehearsal || (isThrough && files.resume == Resume::Unfinished)) {
    beginAnew();
  } else if (!kept.empty() && wanted.unit.empty()) {
    wanted.unit = begun.unit;
  }
  return true;
}

void ResultBook::beginAnew() {
  kept.clear();
  state = RunState::Running;
}

bool ResultBook::isComplete(const std::vector<std::string>& tests) const {
  return !tests.empty() && std::ranges::all_of(tests, [this](const std::string& test) {
    const TestResult* const result = find(test);
    return result != nullptr && result->verdict != Verdict::None;
  });
}

bool ResultBook::startUnit(const RunStart& start, std::string& error) {
  return saveAgain(error) && saveFiles(error) && begin(start, error);
}

bool ResultBook::saveFiles(std::string& error) {
  if (files.isOnlyShown) return true;
  const bool isKept =
      files.json.empty() || replaceFile(files.json, resultsJson(begun, state, kept), error);
  const JunitSuite suite = {.run = begun, .results = kept};
  const bool isReported =
      files.junit.empty() || replaceFile(files.junit, junitXml({&suite, 1}), error);
  if (!isKept || !isReported) return false;
  unsavedTests.clear();
  isEndUnsaved = false;
  return true;
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
  if (isComplete(begun.tests)) state = RunState::Finished;
  return saveAgain(error);
}

bool ResultBook::isSaved(std::string_view test) const {
  return find(test) != nullptr && std::ranges::find(unsavedTests, test) == unsavedTests.end() &&
         std::ranges::find(unsavedVerdicts, test, &TestResult::test) == unsavedVerdicts.end();
}

bool ResultBook::saveAgain(std::string& error) {
  const bool isStored = saveDatabase(error);
  return (areFilesSaved() || saveFiles(error)) && isStored;
}

bool ResultBook::finish(std::string& error) {
  isFinishing = database != nullptr;
  isEndUnsaved = isEndUnsaved || state != RunState::Finished;
  state = RunState::Finished;
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
