#include "results/results.h"

#include <algorithm>
#include <utility>

#include "results/results_json.h"
#include "results/utf8.h"

namespace factory_test {

std::optional<ResultBook> ResultBook::open(const std::filesystem::path& path, std::string& error) {
  ResultBook book;
  if (path.empty()) return book;
  book.file = AtomicFile::own(path, kLongestJson, error);
  if (!book.file) return {};
  FileText stored = book.file->read();
  if (stored.text) {
    auto results = parseResults(*stored.text, stored.reason);
    if (results) book.kept = *std::move(results);
  }
  if (stored.reason.empty()) return book;
  error = fileError(path, stored.reason);
  return {};
}

bool ResultBook::record(TestResult result, std::string& error) {
  result = storable(std::move(result));
  const auto earlier = std::ranges::find(kept, result.test, &TestResult::test);
  if (earlier == kept.end()) {
    kept.push_back(std::move(result));
  } else {
    *earlier = std::move(result);
  }
  if (!file) return true;
  return file->replace(resultsJson(kept), error);
}

const TestResult* ResultBook::find(std::string_view test) const {
  const auto found = std::ranges::find(kept, validUtf8(test), &TestResult::test);
  return found == kept.end() ? nullptr : &*found;
}

}  // namespace factory_test
