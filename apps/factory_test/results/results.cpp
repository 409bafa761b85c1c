#include "results/results.h"

#include <algorithm>
#include <system_error>
#include <utility>

#include "results/results_json.h"
#include "results/whole_file.h"

namespace factory_test {

std::optional<ResultBook> ResultBook::open(const std::filesystem::path& path, std::string& error) {
  ResultBook book;
  book.file = path;
  std::error_code failure;
  const bool exists = std::filesystem::exists(path, failure) || failure;
  // Written at once, a file tells before the first test that it cannot be written.
  if (exists ? book.resume(error) : book.save(error)) return book;
  return {};
}

bool ResultBook::resume(std::string& error) {
  const auto text = readFile(file, error);
  if (!text) return false;
  std::string reason;
  auto results = parseResults(*text, reason);
  if (!results) {
    error = file.native() + ": " + reason;
    return false;
  }
  for (TestResult& result : *results) put(std::move(result));
  return true;
}

bool ResultBook::save(std::string& error) {
  if (!file.empty() && !replaceFile(file, resultsJson(kept), error)) return false;
  unsaved.clear();
  return true;
}

bool ResultBook::record(TestResult result, std::string& error) {
  unsaved.insert(result.test);
  put(clamped(std::move(result)));
  return save(error);
}

bool ResultBook::isSaved(std::string_view test) const {
  return find(test) != nullptr && !unsaved.contains(test);
}

bool ResultBook::saveAgain(std::string& error) { return unsaved.empty() || save(error); }

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
