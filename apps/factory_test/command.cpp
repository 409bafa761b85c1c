#include "command.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <utility>

namespace factory_test {

namespace {

constexpr std::size_t kReadBytes = 4096;

/// Where the command reads and writes, and the group that it leads.
class SpawnPlan {
 public:
  explicit SpawnPlan(int sink) {
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_adddup2(&actions, sink, STDOUT_FILENO);
    posix_spawn_file_actions_adddup2(&actions, sink, STDERR_FILENO);
    posix_spawnattr_init(&attributes);
    posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETPGROUP);
    posix_spawnattr_setpgroup(&attributes, 0);
  }
  ~SpawnPlan() {
    posix_spawnattr_destroy(&attributes);
    posix_spawn_file_actions_destroy(&actions);
  }
  SpawnPlan(const SpawnPlan&) = delete;
  SpawnPlan& operator=(const SpawnPlan&) = delete;

  posix_spawn_file_actions_t actions = {};
  posix_spawnattr_t attributes = {};
};

std::string wordsOf(int status) {
  if (WIFSIGNALED(status)) return "signal " + std::to_string(WTERMSIG(status));
  return "exit code " + std::to_string(WEXITSTATUS(status));
}

}  // namespace

Command::Command(const std::string& line) {
  std::array<int, 2> ends = {};
  if (pipe2(ends.data(), O_CLOEXEC) != 0) {
    ended = std::strerror(errno);
    return;
  }
  output = ends[0];
  fcntl(output, F_SETFL, O_NONBLOCK);
  const SpawnPlan plan(ends[1]);
  std::string name = "sh";
  std::string option = "-c";
  std::string words = line;
  const std::array<char*, 4> arguments = {name.data(), option.data(), words.data(), nullptr};
  const int failed =
      posix_spawn(&process, "/bin/sh", &plan.actions, &plan.attributes, arguments.data(), environ);
  close(ends[1]);
  if (failed == 0) return;
  process = 0;
  ended = std::strerror(failed);
}

Command::~Command() {
  if (process > 0) {
    kill(-process, SIGKILL);
    waitpid(process, nullptr, 0);
  }
  if (output >= 0) close(output);
}

std::string Command::read() {
  std::string bytes(kReadBytes, '\0');
  const ssize_t count = output < 0 ? 0 : ::read(output, bytes.data(), bytes.size());
  // No end of the pipe is left in which the command, or what it started, could write.
  if (count == 0 && output >= 0) close(std::exchange(output, -1));
  bytes.resize(count < 0 ? 0 : static_cast<std::size_t>(count));
  return bytes;
}

std::optional<std::string> Command::outcome() {
  int status = 0;
  if (process > 0 && waitpid(process, &status, WNOHANG) == process) {
    kill(-process, SIGKILL);
    process = 0;
    ended = wordsOf(status);
  }
  if (ended.empty() || output >= 0) return {};
  return ended;
}

}  // namespace factory_test
