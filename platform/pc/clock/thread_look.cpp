#include "clock/thread_look.h"

#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <charconv>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>
#include <string>
#include <system_error>

namespace brimol::pc {

namespace {

namespace fs = std::filesystem;

constexpr const char* kThreads = "/proc/self/task";

fs::path folderOf(pid_t thread) { return fs::path(kThreads) / std::to_string(thread); }

// The words behind the thread's name, which may hold anything, from its state's letter on.
std::vector<std::string> statWords(pid_t thread) {
  std::ifstream file(folderOf(thread) / "stat");
  std::string text;
  if (!std::getline(file, text, '\0')) return {};  // a name may hold a line's end
  std::istringstream rest(text.substr(std::min(text.rfind(')') + 1, text.size())));
  return {std::istream_iterator<std::string>(rest), {}};
}

bool isGone(pid_t thread) { return ::tgkill(::getpid(), thread, 0) != 0 && errno == ESRCH; }

}  // namespace

ThreadState stateOf(std::string_view syscallText) {
  long number = -1;
  const char* const end = syscallText.data() + syscallText.size();
  const auto [rest, failure] = std::from_chars(syscallText.data(), end, number);
  if (failure != std::errc() || number < 0) return ThreadState::Running;
  return number == SYS_futex ? ThreadState::OnThread : ThreadState::Outside;
}

ThreadState lookAt(pid_t thread) {
  const std::vector<std::string> words = statWords(thread);
  if (words.empty()) return isGone(thread) ? ThreadState::Gone : ThreadState::Outside;
  if (words.front() == "Z" || words.front() == "X") return ThreadState::Gone;
  if (words.front() != "S") return ThreadState::Running;
  std::ifstream file(folderOf(thread) / "syscall");
  std::string text;
  // Some kernels do not show system calls.
  return std::getline(file, text) ? stateOf(text) : ThreadState::OnThread;
}

std::chrono::milliseconds cpuTimeOf(pid_t thread) {
  constexpr std::size_t kUserTicks = 11;  // the next word: what the kernel did for it
  constexpr int64_t kMsPerSecond = 1000;
  const std::vector<std::string> words = statWords(thread);
  if (words.size() < kUserTicks + 2) return {};
  const int64_t ticks = std::stoll(words[kUserTicks]) + std::stoll(words[kUserTicks + 1]);
  return std::chrono::milliseconds(ticks * kMsPerSecond / ::sysconf(_SC_CLK_TCK));
}

uint64_t sleepsOf(pid_t thread) {
  constexpr std::string_view kName = "voluntary_ctxt_switches:";
  std::ifstream file(folderOf(thread) / "status");
  for (std::string line; std::getline(file, line);) {
    if (line.starts_with(kName)) return std::stoull(line.substr(kName.size()));
  }
  return 0;
}

std::vector<pid_t> threadsOfProcess() {
  std::vector<pid_t> threads;
  std::error_code failure;
  fs::directory_iterator entry(kThreads, failure);
  for (; !failure && entry != fs::directory_iterator(); entry.increment(failure)) {
    threads.push_back(static_cast<pid_t>(std::stol(entry->path().filename())));
  }
  return threads;
}

}  // namespace brimol::pc
