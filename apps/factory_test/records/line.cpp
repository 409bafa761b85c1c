#include "records/line.h"

#include <poll.h>
#include <sys/eventfd.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <condition_variable>
#include <mutex>
#include <random>
#include <system_error>
#include <thread>
#include <utility>

#include "records/line_transfer.h"
#include "results/system_words.h"

namespace factory_test {

namespace {

using std::chrono::milliseconds;

constexpr milliseconds kForever{-1};

// A signal to a thread that waits in poll().
class Bell {
 public:
  Bell() : descriptor(::eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK)) {}
  ~Bell() { ::close(descriptor); }
  Bell(const Bell&) = delete;
  Bell& operator=(const Bell&) = delete;

  bool isThere() const { return descriptor >= 0; }
  void ring() const { ::eventfd_write(descriptor, 1); }
  void clear() const {
    eventfd_t count = 0;
    ::eventfd_read(descriptor, &count);
  }
  int id() const { return descriptor; }

 private:
  int descriptor;
};

}  // namespace

struct Line::Shared {
  Shared(std::filesystem::path database, std::string address, LinePace failurePace)
      : station(std::move(database)), url(std::move(address)), pace(failurePace) {}

  const std::filesystem::path station;
  const std::string url;
  const LinePace pace;
  Bell stop;
  Bell news;

  mutable std::mutex mutex;  // guards what follows
  std::condition_variable changed;
  LineStatus status;
  int asked = 1;   // how often there was news; what stands there at the start is some
  int served = 0;  // the news whose verdicts are sent
  bool isEnding = false;
  bool hasEnded = false;

  // Whether to go on: stop has not rung. Returns on news, too, where they are waited for.
  bool wait(milliseconds most, const Bell* alsoFor) const {
    std::array<pollfd, 2> bells = {{{stop.id(), POLLIN, 0}, {-1, POLLIN, 0}}};
    if (alsoFor != nullptr) bells[1].fd = alsoFor->id();
    ::poll(bells.data(), bells.size(), static_cast<int>(most.count()));
    return bells[0].revents == 0;
  }

  template <typename Change>
  void set(const Change& change) {
    const std::lock_guard guard(mutex);
    change();
    changed.notify_all();
  }

  // Sends until there is nothing more, or it is stopped.
  void sendAll(LineTransfer& transfer, milliseconds& pause) {
    while (wait(milliseconds(0), nullptr) && transfer.sendSome()) {
      const std::int64_t left = transfer.waiting();
      set([this, left] { status.waiting = left; });
      pause = pace.first;
    }
  }

  // Sends; then waits for news, and so on until it is stopped.
  void serve(milliseconds& pause) {
    count();
    set([this] { ++status.attempts; });
    LineTransfer transfer(station, url, stop.id());
    do {
      int serving = 0;
      set([&] { news.clear(), serving = asked; });
      sendAll(transfer, pause);
      if (!wait(milliseconds(0), nullptr)) return;
      set([&] { served = serving, status.waiting = 0, status.error.clear(); });
      pause = pace.first;
    } while (wait(kForever, &news));
  }

  // What is known without the server.
  void count() {
    std::int64_t left = 0;
    try {
      Sqlite store(station, Sqlite::Mode::Read);
      left = waitingFor(store, url);
    } catch (const StoreError&) {
      return;  // unknown: it stays at what was counted last
    }
    set([&] { status.waiting = left; });
  }

  void fail(const std::string& why) {
    count();
    set([&] {
      if (!isEnding) status.error = why;
    });
  }

  bool isServed() const { return served == asked; }
};

Line::Line(std::filesystem::path station, std::string url, LinePace pace)
    : shared(std::make_shared<Shared>(std::move(station), std::move(url), pace)) {
  const int failure = start();
  if (failure == 0) return;
  shared->fail("the line's database: no background work: " + systemWords(failure));
  shared->hasEnded = true;
}

int Line::start() const {
  if (!shared->stop.isThere() || !shared->news.isThere()) return errno;
  try {
    std::thread(work, shared).detach();
  } catch (const std::system_error& failure) {
    return failure.code().value();
  }
  return 0;
}

void Line::work(const std::shared_ptr<Shared>& shared) {
  std::minstd_rand random{std::random_device{}()};
  milliseconds pause = shared->pace.first;
  milliseconds delay{0};
  while (shared->wait(delay, nullptr)) {
    try {
      shared->serve(pause);
    } catch (const StoreError& failure) {
      shared->fail(failure.what());
    }
    // Half of it by chance: stations that lost the server together do not come back together.
    std::uniform_int_distribution<milliseconds::rep> share(pause.count() / 2, pause.count());
    delay = milliseconds(share(random));
    pause = std::min(pause * 2, shared->pace.most);
  }
  shared->set([&] { shared->hasEnded = true; });
}

Line::~Line() { end(); }

void Line::end() {
  wake(0);
  Shared& now = *shared;
  std::unique_lock lock(now.mutex);
  if (now.isEnding) return;
  now.changed.wait_for(lock, kGrace,
                       [&now] { return now.isServed() || !now.status.error.empty(); });
  now.isEnding = true;
  if (!now.isServed() && now.status.error.empty()) {
    now.status.error = "the line's database: has not answered in time";
  }
  now.stop.ring();
  now.changed.wait_for(lock, kGrace, [&now] { return now.hasEnded; });
  if (now.isServed()) return;
  lock.unlock();
  now.count();  // all of them, also those that the thread has not come to
}

void Line::wake(std::size_t newVerdicts) {
  shared->set([&] {
    ++shared->asked;
    shared->status.waiting += static_cast<std::int64_t>(newVerdicts);
  });
  shared->news.ring();
}

LineStatus Line::status() const {
  const std::lock_guard guard(shared->mutex);
  LineStatus status = shared->status;
  status.isUpToDate = shared->isServed();
  return status;
}

}  // namespace factory_test
