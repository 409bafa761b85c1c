/// What the toolkit and the program have logged.
#pragma once

#include <deque>
#include <mutex>
#include <string>

namespace factory_test {

/// The newest lines of the log, from construction to destruction; there is one at a time. Any
/// thread.
class SessionLog {
 public:
  enum class Echo { None, ToStderr };

  explicit SessionLog(Echo echo);
  ~SessionLog();
  SessionLog(const SessionLog&) = delete;
  SessionLog& operator=(const SessionLog&) = delete;

  /// Adds a line of the program itself.
  void add(const std::string& words);
  /// All lines that are kept, each with a line end.
  std::string text() const;

 private:
  static constexpr std::size_t kMostLines = 20000;

  mutable std::mutex mutex;  // guards the lines
  std::deque<std::string> lines;
};

}  // namespace factory_test
