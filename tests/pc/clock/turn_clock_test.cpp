#include "clock/turn_clock.h"

#include <gtest/gtest.h>
#include <pthread.h>
#include <sys/resource.h>
#include <unistd.h>
#include <utils/Thread.h>

#include <array>
#include <future>
#include <mutex>
#include <string>

#include "clock/created_threads.h"
#include "clock/thread_look.h"

namespace brimol::pc {
namespace {

using namespace std::chrono_literals;

TEST(ThreadLook, ReadsTheKernelsText) {
  EXPECT_EQ(stateOf("running"), ThreadState::Running);
  EXPECT_EQ(stateOf("-1 0x7ffe 0x401000"), ThreadState::Running);
  EXPECT_EQ(stateOf("202 0x7ffe 0x80 0x0"), ThreadState::OnThread);
  EXPECT_EQ(stateOf("0 0x3 0x7ffe 0x10"), ThreadState::Outside);
}

/// While it lives, the process can open nothing.
class NoDescriptors {
 public:
  NoDescriptors() {
    EXPECT_EQ(::getrlimit(RLIMIT_NOFILE, &before), 0);
    const rlimit none = {0, before.rlim_max};
    EXPECT_EQ(::setrlimit(RLIMIT_NOFILE, &none), 0);
  }
  ~NoDescriptors() { EXPECT_EQ(::setrlimit(RLIMIT_NOFILE, &before), 0); }

 private:
  rlimit before = {};
};

TEST(ThreadLook, TellsAThreadThatLivesWhateverItsNameAndWithoutDescriptors) {
  std::promise<pid_t> begun;
  std::promise<void> end;
  std::thread thread([&] {
    pthread_setname_np(pthread_self(), "a\nb) Z");
    begun.set_value(::gettid());
    end.get_future().wait();
  });
  const pid_t number = begun.get_future().get();
  while (lookAt(number) != ThreadState::OnThread) std::this_thread::yield();
  const auto lookWithoutDescriptors = [number] {
    const NoDescriptors none;
    return lookAt(number);
  };
  EXPECT_EQ(lookWithoutDescriptors(), ThreadState::Outside);
  end.set_value();
  thread.join();
  while (lookWithoutDescriptors() != ThreadState::Gone) std::this_thread::yield();
}

/// What threads do and when, in the order in which they did it.
class Journal {
 public:
  explicit Journal(TurnClock& turns) : clock(turns) {}
  void add(const std::string& who) {
    const std::lock_guard lock(mutex);
    text += std::to_string(clock.now()) + who + " ";
  }
  std::string text;  // guarded by the mutex until the threads have ended

 private:
  TurnClock& clock;
  std::mutex mutex;
};

/// Takes part as a thread of the phone's class does.
std::thread taking(TurnClock& clock, std::function<void()> work) {
  TurnClock::Participant& place = clock.announce("worker");
  return std::thread([&clock, &place, work = std::move(work)] {
    clock.begin(place);
    work();
  });
}

void tick(TurnClock& clock, Journal& journal, const char* who, uint32_t ms, int times) {
  for (int i = 0; i < times; ++i) {
    journal.add(who);
    clock.delay(ms);
  }
}

/// A pipe: who waits for it blocks outside of the process.
class Gate {
 public:
  Gate() { EXPECT_EQ(::pipe(ends.data()), 0); }
  ~Gate() {
    for (const int each : ends) ::close(each);
  }
  void wait() {
    char byte = 0;
    EXPECT_EQ(::read(ends[0], &byte, 1), 1);
  }
  void open() { EXPECT_EQ(::write(ends[1], "x", 1), 1); }

 private:
  std::array<int, 2> ends = {};
};

TEST(TurnClock, GivesTurnsByTimeAndThenByTheOrderOfComing) {
  for (int round = 0; round < 50; ++round) {
    TurnClock clock(0xFFFFFFFF, Speed::Free);
    Journal journal(clock);
    EXPECT_EQ(clock.ticks(), 0xFFFFFFFF);
    std::thread two = taking(clock, [&] { tick(clock, journal, "b", 2, 3); });
    std::thread one = taking(clock, [&] { tick(clock, journal, "c", 1, 3); });
    tick(clock, journal, "a", 3, 3);
    two.join();
    one.join();
    EXPECT_EQ(journal.text, "0a 0b 0c 1c 2b 2c 3a 4b 6a ");
    EXPECT_EQ(clock.ticks(), clock.now() - 1) << "it wraps";
  }
}

TEST(TurnClock, EndsPausesAtWholeSteps) {
  TurnClock clock(3, Speed::Free);
  clock.setStep(10);
  for (const auto& [pause, end] : {std::pair(1U, 10U), {10U, 20U}, {11U, 40U}}) {
    clock.delay(pause);
    EXPECT_EQ(clock.now(), end) << pause;
  }
}

TEST(TurnClock, HasAnAgentActBeforeTheTurnsOfItsTime) {
  TurnClock clock(0, Speed::Free);
  Journal journal(clock);
  uint64_t next = 2;
  clock.setAgent({[&](uint64_t) { return std::optional(next); },
                  [&](uint64_t) {
                    journal.add("agent");
                    next += 5;
                    clock.wakePoller();
                  }});
  clock.takePartAsPoller();
  journal.add("a");
  clock.delay(1000);
  journal.add("a");
  clock.delay(0);
  journal.add("a");
  EXPECT_EQ(journal.text, "0a 2agent 2a 3a ");
}

TEST(TurnClock, LetsThreadsEndAndBeWaitedFor) {
  for (int round = 0; round < 20; ++round) {
    TurnClock clock(0, Speed::Free);
    Journal journal(clock);
    std::mutex held;
    clock.takePart();
    std::thread ticker = taking(clock, [&] { tick(clock, journal, "t", 10, 4); });
    std::thread holder = taking(clock, [&] {
      const std::lock_guard guard(held);
      clock.delay(15);
      journal.add("h");
    });
    clock.delay(1);
    {
      const std::lock_guard guard(held);  // which takes the holder's whole pause
      clock.takePart();
      journal.add("a");
    }
    ticker.join();
    clock.takePart();
    journal.add("a");
    holder.join();
    EXPECT_EQ(journal.text, "0t 10t 15h 15a 20t 30t 40a ");
  }
}

TEST(TurnClock, GoesOnWithoutAThreadThatLooksAgainAndAgain) {
  for (int round = 0; round < 5; ++round) {
    TurnClock clock(0, Speed::Free);
    Journal journal(clock);
    std::atomic<bool> isDone = false;
    clock.takePart();
    std::thread ticker = taking(clock, [&] { tick(clock, journal, "t", 10, 4); });
    std::thread handler = taking(clock, [&] {
      clock.delay(15);
      isDone = true;
    });
    clock.delay(1);
    while (!isDone) std::this_thread::sleep_for(50us);
    clock.takePart();
    journal.add("a");
    ticker.join();
    handler.join();
    EXPECT_EQ(journal.text, "0t 10t 15a 20t 30t ");
  }
}

TEST(TurnClock, GoesOnWithoutAThreadThatBlocksOutsideAndNamesIt) {
  TurnClock clock(0, Speed::Free);
  std::string named;
  clock.setBlockedWatcher([&](const std::string& name, pid_t) { named = name; });
  Gate gate;
  clock.takePart();
  std::atomic<bool> isBack = false;
  std::thread blocked = taking(clock, [&] {
    gate.wait();
    clock.takePart();
    isBack = true;
  });
  clock.delay(50);
  EXPECT_EQ(named, "worker");
  gate.open();
  const auto before = clock.now();
  while (!isBack) clock.delay(1);
  EXPECT_LE(clock.now() - before, 100) << "it is soon back among the others";
  blocked.join();
}

TEST(TurnClock, IsFreeAgainOnceAThreadThatBlockedOutsideHasEnded) {
  TurnClock clock(0, Speed::Free);
  Gate gate;
  clock.takePart();
  std::thread blocked = taking(clock, [&] { gate.wait(); });
  clock.delay(50);
  gate.open();
  blocked.join();
  const auto start = std::chrono::steady_clock::now();
  clock.delay(60'000);
  EXPECT_LT(std::chrono::steady_clock::now() - start, 30s);
}

TEST(TurnClock, LeavesTheTurnToAThreadThatComesBackWhileItIsNamed) {
  TurnClock clock(0, Speed::Free);
  Gate gate;
  std::promise<void> back;
  clock.setBlockedWatcher([&](const std::string&, pid_t) {
    gate.open();
    back.get_future().wait();
  });
  clock.takePart();
  std::thread blocked = taking(clock, [&] {
    gate.wait();
    clock.delay(1);
    back.set_value();
    std::this_thread::sleep_for(100ms);  // blocks outside anew, for less than what sends it away
    EXPECT_EQ(clock.now(), 1);
  });
  clock.delay(50);
  blocked.join();
}

struct LateAsker {
  ~LateAsker() {
    if (clock != nullptr) *answer = clock->ticks();
  }
  TurnClock* clock = nullptr;
  uint32_t* answer = nullptr;
};
thread_local LateAsker lateAsker;

TEST(TurnClock, AnswersAThreadThatHasLeftAndIsNotGoneYet) {
  TurnClock clock(0, Speed::Free);
  uint32_t end = 0;
  uint32_t answer = 1;
  clock.takePart();
  std::thread worker([&] {
    lateAsker.answer = &answer;
    lateAsker.clock = &clock;
    clock.delay(2);
    end = clock.ticks();
  });
  clock.delay(50);
  worker.join();
  EXPECT_EQ(answer, end);
}

TEST(TurnClock, GoesOnWithoutAnAnnouncedThreadThatHasTheTurn) {
  TurnClock clock(0, Speed::Free);
  std::atomic<bool> blocks = false;
  std::promise<void> looked;
  std::promise<void> passed;
  clock.setAgent({[&](uint64_t) {
                    if (blocks.exchange(false)) looked.set_value();
                    return std::optional<uint64_t>();
                  },
                  [](uint64_t) {}});
  TurnClock::Participant& place = clock.announce("never starts");
  std::thread other([&] {
    looked.get_future().wait();
    clock.lookAtAgent();  // waits for the lock, and so for the turn to be passed on
    passed.set_value();
  });
  blocks = true;
  passed.get_future().wait();
  clock.withdraw(place);
  clock.delay(1);
  EXPECT_EQ(clock.now(), 1);
  other.join();
}

TEST(TurnClock, KeepsToRealTimeWhereItIsToAndHearsOfInput) {
  const auto start = std::chrono::steady_clock::now();
  TurnClock clock(0, Speed::Real);
  std::atomic<bool> arrived = false;
  clock.setAgent({[&](uint64_t soonest) { return arrived ? std::optional(soonest) : std::nullopt; },
                  [&](uint64_t) {
                    arrived = false;
                    clock.wakePoller();
                  }});
  clock.delay(31);
  EXPECT_GE(std::chrono::steady_clock::now() - start, 30ms);
  clock.takePartAsPoller();
  std::thread user([&] {
    arrived = true;
    clock.lookAtAgent();
  });
  clock.delay(60'000);
  EXPECT_FALSE(arrived);
  EXPECT_LT(clock.now(), 30'000);
  user.join();
}

TEST(TurnClock, HearsOfInputBeforeTheNextTurnWhereItLags) {
  const auto start = std::chrono::steady_clock::now();
  TurnClock clock(0, Speed::Real);
  bool waits = true;
  clock.setAgent({[&](uint64_t soonest) { return waits ? std::optional(soonest) : std::nullopt; },
                  [&](uint64_t) { waits = false; }});
  clock.takePart();
  while (std::chrono::steady_clock::now() - start < 20ms) {
  }
  clock.delay(1);
  EXPECT_FALSE(waits);
  EXPECT_EQ(clock.now(), 1);
}

TEST(TurnClock, TakesALoopWithoutPausesForAWait) {
  TurnClock clock(0, Speed::Free);
  while (clock.ticks() < 3) {
  }
  EXPECT_EQ(clock.now(), 3);
}

class Ticker : public android::Thread {
 public:
  Ticker(TurnClock& turns, Journal& book, const char* word)
      : Thread(true), clock(turns), journal(book), name(word) {}
  bool threadLoop() override {
    journal.add(name);
    clock.delay(1);
    return true;
  }

 private:
  TurnClock& clock;
  Journal& journal;
  const char* name;
};

TEST(TurnClock, TakesInThePhonesThreadsInTheOrderOfTheirCreation) {
  TurnClock& clock = *new TurnClock(0, Speed::Free);  // outlives whatever thread is created later
  letCreatedThreadsTakePart(clock);
  clock.takePart();
  for (int round = 0; round < 20; ++round) {
    Journal journal(clock);
    const auto start = clock.now();
    const android::sp<Ticker> one = new Ticker(clock, journal, "x");
    const android::sp<Ticker> two = new Ticker(clock, journal, "y");
    one->run("ticker");
    two->run("ticker");
    clock.delay(2);
    one->requestExitAndWait();
    two->requestExitAndWait();
    const auto at = [&](uint64_t ms, const char* who) { return std::to_string(start + ms) + who; };
    EXPECT_EQ(journal.text, at(0, "x ") + at(0, "y ") + at(1, "x ") + at(1, "y "));
  }
}

}  // namespace
}  // namespace brimol::pc
