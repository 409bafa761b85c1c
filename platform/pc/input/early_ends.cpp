#include "input/early_ends.h"

#include <atomic>

namespace brimol::pc {

namespace {

uint64_t nextId() {
  static std::atomic<uint64_t> last = 0;
  return ++last;
}

}  // namespace

struct EarlyEnds::Seen {
  uint64_t id = 0;  // of the EarlyEnds that the rest is about
  uint64_t passedOn = 0;
  uint64_t handled = 0;
  bool isHandling = false;  // its pause ended because of a record
};

EarlyEnds::EarlyEnds() : id(nextId()) {}

EarlyEnds::Seen& EarlyEnds::seenHere(const EarlyEnds& ends) {
  thread_local Seen seen;
  if (seen.id != ends.id) seen = {ends.id, ends.passedOn, ends.handled};
  return seen;
}

void EarlyEnds::hearOfPoll(bool isGiven) {
  if (isPassing) {
    ++passedOn;
    passedOnWakes.notify_all();
  }
  isPassing = isGiven;
}

void EarlyEnds::wakeAll() {
  passedOnWakes.notify_all();
  handledWakes.notify_all();
}

EarlyEnds::Pause::Pause(EarlyEnds& ends, uint32_t ms)
    : all(ends),
      kind(ms <= 1          ? Kind::Worker
           : ms <= kLongest ? Kind::Loop
                            : Kind::Long) {
  Seen& seen = seenHere(all);
  if (!seen.isHandling) return;
  seen.isHandling = false;
  ++all.handled;
  if (seen.handled + 1 == all.handled) seen.handled = all.handled;  // its own doing
  all.handledWakes.notify_all();
}

bool EarlyEnds::Pause::isOver() const {
  const Seen& seen = seenHere(all);
  switch (kind) {
    case Kind::Worker: return seen.passedOn != all.passedOn;
    case Kind::Loop: return seen.handled != all.handled;
    default: return false;
  }
}

std::condition_variable& EarlyEnds::Pause::wake() const {
  return kind == Kind::Worker ? all.passedOnWakes : all.handledWakes;
}

void EarlyEnds::Pause::endEarly() {
  Seen& seen = seenHere(all);
  if (kind == Kind::Worker) {
    ++seen.passedOn;
    seen.isHandling = true;
  } else {
    seen.handled = all.handled;
  }
}

}  // namespace brimol::pc
