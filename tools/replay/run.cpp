#include "run.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <fstream>
#include <optional>
#include <system_error>
#include <utility>

#include "process/child.h"
#include "process/inherited.h"

namespace brimol::replay {

namespace {

using std::chrono::milliseconds;
using std::chrono::steady_clock;

constexpr milliseconds kLookEvery{100};

sigset_t watchedSignals() {
  sigset_t set;
  ::sigemptyset(&set);
  ::sigaddset(&set, SIGCHLD);
  for (const int signal : {SIGINT, SIGQUIT, SIGTERM, SIGHUP}) {
    if (!process::isIgnored(signal)) ::sigaddset(&set, signal);  // else it would come all the same
  }
  return set;
}

/// Keeps the watched signals for Watch, from before the process starts until after it ended.
class HeldSignals {
 public:
  HeldSignals() { ::sigprocmask(SIG_BLOCK, &watched, &former); }
  ~HeldSignals() { ::sigprocmask(SIG_SETMASK, &former, nullptr); }
  HeldSignals(const HeldSignals&) = delete;
  HeldSignals& operator=(const HeldSignals&) = delete;

  /// The next one, or 0 when none came within kLookEvery.
  int wait() const {
    const timespec bound = {0, std::chrono::nanoseconds(kLookEvery).count()};
    const int signal = ::sigtimedwait(&watched, nullptr, &bound);
    return signal > 0 ? signal : 0;
  }

  const sigset_t watched = watchedSignals();
  sigset_t former{};
};

std::vector<char*> pointersTo(std::vector<std::string>& texts) {
  std::vector<char*> pointers;
  pointers.reserve(texts.size() + 1);
  for (std::string& text : texts) pointers.push_back(text.data());
  pointers.push_back(nullptr);
  return pointers;
}

/// How a process is to start: in a group (0: one that it leads), without input, its output in a
/// file.
class SpawnPlan {
 public:
  SpawnPlan(const std::string& output, const sigset_t& mask, pid_t group) {
    ::posix_spawnattr_init(&attributes);
    ::posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETPGROUP | POSIX_SPAWN_SETSIGMASK);
    ::posix_spawnattr_setpgroup(&attributes, group);
    ::posix_spawnattr_setsigmask(&attributes, &mask);
    ::posix_spawn_file_actions_init(&actions);
    ::posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
    constexpr int kFlags = O_WRONLY | O_CREAT | O_TRUNC | O_APPEND;
    constexpr mode_t kMode = 0666;
    ::posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, output.c_str(), kFlags, kMode);
    ::posix_spawn_file_actions_adddup2(&actions, STDOUT_FILENO, STDERR_FILENO);
  }
  ~SpawnPlan() {
    ::posix_spawnattr_destroy(&attributes);
    ::posix_spawn_file_actions_destroy(&actions);
  }
  SpawnPlan(const SpawnPlan&) = delete;
  SpawnPlan& operator=(const SpawnPlan&) = delete;

  void takeInput(int end) { ::posix_spawn_file_actions_adddup2(&actions, end, STDIN_FILENO); }
  /// 0, or the number of the error.
  int start(std::vector<std::string> command, std::vector<std::string> environment,
            pid_t& process) const {
    return ::posix_spawnp(&process, command.front().c_str(), &actions, &attributes,
                          pointersTo(command).data(), pointersTo(environment).data());
  }

 private:
  posix_spawnattr_t attributes{};
  posix_spawn_file_actions_t actions{};
};

// This program's, with the given ones in the place of those of the same name.
std::vector<std::string> environmentWith(
    const std::map<std::string, std::optional<std::string>>& given) {
  std::vector<std::string> all;
  for (char** entry = environ; *entry != nullptr; ++entry) {
    const std::string text = *entry;
    if (!given.contains(text.substr(0, text.find('=')))) all.push_back(text);
  }
  for (const auto& [name, value] : given) {
    if (value) all.push_back(name + "=" + *value);
  }
  return all;
}

/// A process group that ends with this program, however that comes: its leader waits for the end
/// of a pipe into which nobody writes, and then kills the group.
class Group {
 public:
  explicit Group(const sigset_t& mask) {
    std::array<int, 2> ends = {};
    if (::pipe2(ends.data(), O_CLOEXEC) != 0) {
      error = errno;
      return;
    }
    SpawnPlan plan("/dev/null", mask, 0);
    plan.takeInput(ends[0]);
    error = plan.start({"/bin/sh", "-c", "read line; kill -KILL 0"}, environmentWith({}), leader);
    ::close(ends[0]);
    lifeline = ends[1];
  }
  ~Group() {
    if (error == 0) {
      kill();
      while (::waitpid(leader, nullptr, 0) < 0 && errno == EINTR) continue;
    }
    if (lifeline >= 0) ::close(lifeline);
  }
  Group(const Group&) = delete;
  Group& operator=(const Group&) = delete;

  // The leader is not yet waited for, so that its number still stands for this group.
  void kill() const { ::kill(-leader, SIGKILL); }

  pid_t leader = 0;
  int error = 0;  // why there is no group

 private:
  int lifeline = -1;  // the pipe's end that closes with this program
};

// 0, or the number of the error.
int start(const Launch& launch, const HeldSignals& signals, const Group& group, pid_t& process) {
  const SpawnPlan plan(launch.output.native(), signals.former, group.leader);
  return plan.start(launch.command, environmentWith(launch.environment), process);
}

/// The session's file while it grows.
class Tail {
 public:
  explicit Tail(std::filesystem::path followed) : path(std::move(followed)) {}

  /// True: there were new bytes.
  bool read() {
    if (!file.is_open()) file.open(path, std::ios::binary);
    if (!file.is_open()) return false;
    file.clear();
    bool hasGrown = false;
    while (file.read(bytes.data(), std::ssize(bytes)) || file.gcount() > 0) {
      reader.add({bytes.data(), static_cast<std::size_t>(file.gcount())});
      hasGrown = true;
    }
    return hasGrown;
  }
  const Session& session() const { return reader.session(); }

 private:
  const std::filesystem::path path;
  std::ifstream file;
  std::array<char, 1 << 16> bytes{};
  SessionReader reader;
};

// Until it ended, hung or this program was asked to end; says which.
RunEnd::Kind watch(const Launch& launch, const HeldSignals& signals, pid_t application,
                   const std::function<void(const Session&)>& look) {
  Tail tail(launch.session);
  auto lastNews = steady_clock::now();
  for (;;) {
    const int signal = signals.wait();
    if (signal != 0 && signal != SIGCHLD) return RunEnd::Kind::Interrupted;
    if (tail.read()) lastNews = steady_clock::now();
    look(tail.session());
    if (process::hasEnded(application)) return RunEnd::Kind::Exited;
    if (launch.timeout.count() > 0 && steady_clock::now() - lastNews > launch.timeout) {
      return RunEnd::Kind::Hung;
    }
  }
}

}  // namespace

RunEnd run(const Launch& launch, const std::function<void(const Session&)>& look) {
  const HeldSignals signals;
  const auto began = steady_clock::now();
  RunEnd end;
  pid_t application = 0;
  const Group group(signals.former);
  const int error = group.error != 0 ? group.error : start(launch, signals, group, application);
  if (error != 0) {
    end.why = "cannot start " + launch.command.front() + ": " + std::strerror(error);
    return end;
  }
  end.kind = watch(launch, signals, application, look);
  group.kill();
  const std::optional<int> status = process::finish(application);  // it may have left the group
  end.realTime = std::chrono::duration_cast<milliseconds>(steady_clock::now() - began);
  if (end.kind != RunEnd::Kind::Exited) return end;
  if (!status) {
    throw std::system_error(std::make_error_code(std::errc::no_child_process), "how it ended");
  }
  end.code = WIFEXITED(*status) ? WEXITSTATUS(*status) : WTERMSIG(*status);
  if (WIFSIGNALED(*status)) end.kind = RunEnd::Kind::Signalled;
  return end;
}

}  // namespace brimol::replay
