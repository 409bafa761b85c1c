#include "clock/created_threads.h"

#include <pthread.h>
#include <utils/AndroidThreads.h>

#include <memory>
#include <string>

#include "clock/turn_clock.h"

namespace brimol::pc {

namespace {

constinit TurnClock* clockOfThreads = nullptr;  // set before there are such threads

struct Start {
  android_thread_func_t entry;
  void* data;  // the phone's type
  TurnClock::Participant& place;
  std::string name;
};

int runThread(void* data) {
  const std::unique_ptr<Start> start(static_cast<Start*>(data));
  constexpr std::size_t kMostLetters = 15;
  pthread_setname_np(pthread_self(), start->name.substr(0, kMostLetters).c_str());
  clockOfThreads->begin(start->place);
  return start->entry(start->data);
}

// NOLINTNEXTLINE(readability-function-size): the parameters are the hook's
int createThread(android_thread_func_t entry, void* data, const char* name, int32_t priority,
                 size_t stack, android_thread_id_t* thread) {
  const char* const shown = name == nullptr ? "" : name;
  auto start = std::make_unique<Start>(Start{entry, data, clockOfThreads->announce(shown), shown});
  TurnClock::Participant& place = start->place;
  if (androidCreateRawThreadEtc(runThread, start.get(), name, priority, stack, thread) == 0) {
    clockOfThreads->withdraw(place);
    return 0;
  }
  (void)start.release();  // the thread's own now
  return 1;
}

}  // namespace

void letCreatedThreadsTakePart(TurnClock& clock) {
  clockOfThreads = &clock;
  androidSetCreateThreadFunc(createThread);
}

}  // namespace brimol::pc
