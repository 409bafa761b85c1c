/// A command of the system's shell that runs while the application goes on.
#pragma once

#include <sys/types.h>

#include <optional>
#include <string>

namespace factory_test {

/// Runs from construction; destruction ends the command and all that it started, and so does the
/// end of the application, however that comes. A program that leaves their process group (setsid,
/// timeout) stays, and what it writes after the shell's end is lost. One thread.
class Command {
 public:
  /// `line` is for /bin/sh. Its input is empty; read() gives its output and its errors.
  explicit Command(const std::string& line);
  ~Command();
  Command(const Command&) = delete;
  Command& operator=(const Command&) = delete;

  /// What it has written since the last call, at most a few thousand bytes at once. Never waits.
  std::string read();
  /// "exit code 0", "signal 9", "exit code unknown" where the system does not tell, or why it could
  /// not be started; none before it has ended and all that it wrote is read.
  std::optional<std::string> outcome();

 private:
  // An error's number, or 0.
  int watch();
  int start(const std::string& line);
  void end();

  pid_t watcher = 0;  // leads their group, and kills it when the application ends; 0: none
  pid_t process = 0;  // the shell; 0: none runs
  int lifeline = -1;  // the end of a pipe that the watcher reads from
  int output = -1;    // the end of a pipe that is read from; -1: closed
  int unread = 0;     // once it has ended: how many bytes of its output are still to be read
  std::string ended;  // empty: it has not
};

}  // namespace factory_test
