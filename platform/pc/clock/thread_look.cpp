#include "clock/thread_look.h"

#include <sys/syscall.h>

#include <charconv>
#include <filesystem>
#include <fstream>
#include <string>
#include <system_error>

namespace brimol::pc {

namespace {

namespace fs = std::filesystem;

constexpr const char* kThreads = "/proc/self/task";

fs::path folderOf(pid_t thread) { return fs::path(kThreads) / std::to_string(thread); }

// For kernels that do not show system calls: the letter behind the name, which may hold anything.
ThreadState stateByLetter(pid_t thread) {
  std::ifstream file(folderOf(thread) / "stat");
  std::string text;
  if (!std::getline(file, text)) return ThreadState::Gone;
  const std::size_t end = text.rfind(") ");
  const bool sleeps = end != std::string::npos && text.compare(end + 2, 1, "S") == 0;
  return sleeps ? ThreadState::OnThread : ThreadState::Running;
}

}  // namespace

ThreadState stateOf(std::string_view syscallText) {
  long number = -1;
  const char* const end = syscallText.data() + syscallText.size();
  const auto [rest, failure] = std::from_chars(syscallText.data(), end, number);
  if (failure != std::errc() || number < 0) return ThreadState::Running;
  return number == SYS_futex ? ThreadState::OnThread : ThreadState::Outside;
}

ThreadState lookAt(pid_t thread) {
  std::ifstream file(folderOf(thread) / "syscall");
  std::string text;
  if (std::getline(file, text)) return stateOf(text);
  std::error_code failure;
  return fs::exists(folderOf(thread), failure) ? stateByLetter(thread) : ThreadState::Gone;
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
