#include "command.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/ioctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <utility>

#include "process/child.h"

namespace factory_test {

namespace {

constexpr std::size_t kReadBytes = 4096;

constexpr const char* kNowhere = "/dev/null";

/// Where a process reads and writes, and its group.
class SpawnPlan {
 public:
  /// `group`: 0 is one of its own, which it leads.
  explicit SpawnPlan(pid_t group) {
    posix_spawn_file_actions_init(&actions);
    for (const int stream : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
      posix_spawn_file_actions_addopen(&actions, stream, kNowhere, O_RDWR, 0);
    }
    posix_spawnattr_init(&attributes);
    posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETPGROUP);
    posix_spawnattr_setpgroup(&attributes, group);
  }
  ~SpawnPlan() {
    posix_spawnattr_destroy(&attributes);
    posix_spawn_file_actions_destroy(&actions);
  }
  SpawnPlan(const SpawnPlan&) = delete;
  SpawnPlan& operator=(const SpawnPlan&) = delete;

  void connect(int stream, int end) { posix_spawn_file_actions_adddup2(&actions, end, stream); }

  /// Starts a line of the shell. An error's number, or 0.
  int start(std::string line, pid_t& process) const {
    std::string name = "sh";
    std::string option = "-c";
    const std::array<char*, 4> arguments = {name.data(), option.data(), line.data(), nullptr};
    return posix_spawn(&process, "/bin/sh", &actions, &attributes, arguments.data(), environ);
  }

 private:
  posix_spawn_file_actions_t actions = {};
  posix_spawnattr_t attributes = {};
};

std::string wordsOf(std::optional<int> status) {
  if (!status) return "exit code unknown";
  if (WIFSIGNALED(*status)) return "signal " + std::to_string(WTERMSIG(*status));
  return "exit code " + std::to_string(WEXITSTATUS(*status));
}

}  // namespace

Command::Command(const std::string& line) {
  int failed = watch();
  if (failed == 0) failed = start(line);
  if (failed == 0) return;
  end();
  ended = std::strerror(failed);
}

// A process of its own waits for the end of a pipe into which nobody writes. It comes when the
// application ends, which a signal or a lost display may do without a word. The watcher is there
// before the command is, and leads its group, whose number is nobody else's until it is waited for.
int Command::watch() {
  std::array<int, 2> ends = {};
  if (pipe2(ends.data(), O_CLOEXEC) != 0) return errno;
  lifeline = ends[1];
  SpawnPlan plan(0);
  plan.connect(STDIN_FILENO, ends[0]);
  const int failed = plan.start("trap '' HUP INT TERM; read line; kill -KILL 0", watcher);
  if (failed != 0) watcher = 0;
  close(ends[0]);
  return failed;
}

int Command::start(const std::string& line) {
  std::array<int, 2> ends = {};
  if (pipe2(ends.data(), O_CLOEXEC) != 0) return errno;
  output = ends[0];
  fcntl(output, F_SETFL, O_NONBLOCK);
  SpawnPlan plan(watcher);
  plan.connect(STDOUT_FILENO, ends[1]);
  plan.connect(STDERR_FILENO, ends[1]);
  const int failed = plan.start(line, process);
  if (failed != 0) process = 0;
  close(ends[1]);
  return failed;
}

void Command::end() {
  if (watcher > 0) kill(-watcher, SIGKILL);
  if (process > 0) ended = wordsOf(brimol::process::finish(std::exchange(process, 0)));
  if (watcher > 0) waitpid(std::exchange(watcher, 0), nullptr, 0);
  if (lifeline >= 0) close(std::exchange(lifeline, -1));
}

Command::~Command() {
  end();
  if (output >= 0) close(output);
}

std::string Command::read() {
  std::string bytes(kReadBytes, '\0');
  const ssize_t count = output < 0 ? 0 : ::read(output, bytes.data(), bytes.size());
  bytes.resize(count < 0 ? 0 : static_cast<std::size_t>(count));
  if (!ended.empty()) unread -= static_cast<int>(bytes.size());
  // Nobody is left who could write, or only what has left the group: that may never end.
  const bool isRead = count == 0 || (!ended.empty() && unread <= 0);
  if (isRead && output >= 0) close(std::exchange(output, -1));
  return bytes;
}

std::optional<std::string> Command::outcome() {
  if (process > 0 && brimol::process::hasEnded(process)) {
    end();
    ioctl(output, FIONREAD, &unread);
  }
  if (ended.empty() || output >= 0) return {};
  return ended;
}

}  // namespace factory_test
