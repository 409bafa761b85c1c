// A session that a monkey plays.
#include <unistd.h>

#include <fstream>
#include <iostream>

#include "host/session.h"

namespace brimol::pc {

namespace {

constexpr uint64_t kMostWithoutChange = 5'000;  // records
constexpr uint64_t kCloseMs = 10'000;
constexpr uint64_t kToldEach = 1'000'000;  // records

// In KiB; 0 where the system does not tell.
long residentMemory() {
  constexpr long kKibi = 1024;
  std::ifstream file("/proc/self/statm");
  long all = 0;
  long resident = 0;
  file >> all >> resident;
  return resident * (sysconf(_SC_PAGESIZE) / kKibi);
}

}  // namespace

void Session::startMonkey() {
  monkey.emplace(settings.monkey->seed, settings.monkey->events, screenSize,
                 [this](const Event& record) {
                   if (recorder) recorder->input(now(), record);
                   deliver(record);
                   if (monkey->posted() % kToldEach == 0) tellOfMonkey();
                 });
}

void Session::tellOfMonkey() const {
  std::cerr << "brimol: monkey " << settings.monkey->seed << ": " << monkey->posted()
            << " events in " << now() << " ms, " << frames << " frames, " << residentMemory()
            << " KiB resident\n";
}

void Session::followMonkey(uint64_t moment) {
  if (closedBy) endMonkey("the application still runs 10 seconds after it was asked to close");
  monkey->act(moment, lastFrame);
  if (monkey->sinceChange() > kMostWithoutChange) {
    endMonkey("nothing has changed on the screen for " + std::to_string(kMostWithoutChange) +
              " events");
  }
  if (!monkey->isOver()) return;
  tellOfMonkey();
  if (recorder) recorder->close(moment);
  askToClose();
  closedBy = moment + kCloseMs;
}

}  // namespace brimol::pc
