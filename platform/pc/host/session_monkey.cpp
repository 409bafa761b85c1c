// A session that a monkey plays.
#include <filesystem>
#include <iostream>

#include "host/session.h"

namespace brimol::pc {

namespace {

// Records. By chance a monkey may go on for thousands where only one held button leads on.
constexpr uint64_t kMostWithoutNews = 20'000;
constexpr uint64_t kCloseMs = 10'000;
constexpr uint64_t kToldEach = 250'000;  // records
constexpr uint64_t kToldEachMs = 86'400'000;
constexpr uint64_t kLookEach = 10'000;  // records

// How many entries a folder has; 0 where the system has no such folder.
std::ptrdiff_t entriesOf(const char* folder) {
  std::error_code none;
  const std::filesystem::directory_iterator all(folder, none);
  return std::distance(begin(all), end(all));
}

}  // namespace

void Session::startMonkey() {
  nextTold = kToldEach;
  nextToldMs = kToldEachMs;
  monkey.emplace(*settings.monkey, screenSize, [this](const Event& record) {
    if (recorder) recorder->input(now(), record);
    deliver(record);
  });
}

void Session::tellOfMonkey() {
  nextTold = (monkey->posted() / kToldEach + 1) * kToldEach;
  nextToldMs = (now() / kToldEachMs + 1) * kToldEachMs;
  std::cerr << "brimol: monkey " << settings.monkey->seed << ": " << monkey->posted()
            << " events in " << now() << " ms, " << frames << " frames, " << memory.least()
            << " KiB resident, " << entriesOf("/proc/self/task") << " threads, "
            << entriesOf("/proc/self/fd") - 1 << " open files\n";  // without the look itself
}

void Session::followMonkey(uint64_t moment) {
  if (closedBy) endMonkey("the application still runs 10 seconds after it was asked to close");
  monkey->act(moment, lastFrame);
  if (monkey->posted() >= nextLook) {
    memory.look();
    nextLook = monkey->posted() + kLookEach;
  }
  if (monkey->posted() >= nextTold || moment >= nextToldMs) tellOfMonkey();
  if (monkey->sinceNews() > kMostWithoutNews) {
    endMonkey("nothing new was shown for " + std::to_string(kMostWithoutNews) + " events");
  }
  if (!monkey->isOver()) return;
  tellOfMonkey();
  if (recorder) recorder->userCloses(moment);
  askToClose();
  closedBy = moment + kCloseMs;
}

}  // namespace brimol::pc
