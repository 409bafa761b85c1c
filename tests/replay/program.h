/// The example application as a process of its own.
#pragma once

#include <sys/types.h>

#include <filesystem>
#include <map>
#include <string>
#include <vector>

namespace brimol::test {

using Variables = std::map<std::string, std::string>;

/// Runs from construction, in `folder`, with what it writes to stderr in the file "stderr" there.
class Program {
 public:
  Program(const std::filesystem::path& folder, const Variables& variables,
          std::vector<std::string> arguments);
  ~Program();
  Program(const Program&) = delete;
  Program& operator=(const Program&) = delete;

  /// Its exit code, or -1 for another end.
  int waitForEnd();
  bool isRunning() const;
  void kill() const;

 private:
  pid_t process = 0;
};

std::string readAll(const std::filesystem::path& file);

/// Keeps a processor busy while it lives.
class BusyCore {
 public:
  BusyCore();
  ~BusyCore();
  BusyCore(const BusyCore&) = delete;
  BusyCore& operator=(const BusyCore&) = delete;

 private:
  pid_t process;
};

}  // namespace brimol::test
