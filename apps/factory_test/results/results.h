/// The results file of a factory test.
#pragma once

#include <filesystem>
#include <functional>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "results/test_result.h"

namespace factory_test {

/// The results of all tests that were done, a test's newest only, and the file that keeps them.
/// The file's layout stands in results_json.h. One thread at a time uses a book, one book at a time
/// a file; nothing here throws.
class ResultBook {
 public:
  /// Resumes the file at `path`, or writes one without results if there is none. An empty `path`:
  /// the results stay in memory. Nothing is returned for a file that cannot be read, is damaged or
  /// cannot be written anew; `error` then says so in one line that begins with the file's name, and
  /// what is there stays as it is.
  static std::optional<ResultBook> open(const std::filesystem::path& path, std::string& error);

  /// Puts `result`, clamped(), in the place of the test's earlier one or at the end, and writes the
  /// whole file. False: the result stays in memory and goes out with the next record(), the file
  /// holds what it held before, and `error` says why in one line. Waits for the disk, often some
  /// milliseconds.
  bool record(TestResult result, std::string& error);

  /// Whether the test has a result, and all that it is kept in holds it.
  bool isSaved(std::string_view test) const;

  /// Tries again to write what record() could not. True: nothing is left unsaved, or was.
  bool saveAgain(std::string& error);

  /// The test's result, or null. Valid until the next record().
  const TestResult* find(std::string_view test) const;

  /// In the order in which the tests were recorded first. Valid until the next record().
  const std::vector<TestResult>& results() const { return kept; }

 private:
  ResultBook() = default;

  bool resume(std::string& error);
  bool save(std::string& error);
  void put(TestResult result);

  std::filesystem::path file = {};  // empty: in memory only
  std::vector<TestResult> kept = {};
  std::set<std::string, std::less<>> unsaved = {};  // tests whose result the file does not hold
};

}  // namespace factory_test
