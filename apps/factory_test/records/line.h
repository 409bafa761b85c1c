/// The background work that keeps a line's database up to date.
#pragma once

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>

namespace factory_test {

struct LineStatus {
  std::int64_t waiting = 0;  // verdicts that the line's database does not hold yet
  std::string error = {};    // why not; empty: it sends, or has nothing to send
  int attempts = 0;          // connections that were tried
  bool isUpToDate = false;   // all is sent that was there at the last wake()
};

/// How long it waits after a failure: each time twice as long.
struct LinePace {
  std::chrono::milliseconds first{1000};
  std::chrono::milliseconds most{60'000};
};

/// Sends what a station's database holds to one PostgreSQL database, from construction to
/// destruction, on a thread of its own: every verdict once, whatever was sent before, by whom, and
/// however often the server or the network goes away. Nothing here waits for the network.
class Line {
 public:
  /// `station` is a database that Database has opened before; `url` is as libpq reads it.
  Line(std::filesystem::path station, std::string url, LinePace pace = {});
  ~Line();
  Line(const Line&) = delete;
  Line& operator=(const Line&) = delete;

  /// There are so many new verdicts, or other changes. Any thread.
  void wake(std::size_t newVerdicts);
  /// Any thread; also after end().
  LineStatus status() const;
  /// Sends no more, once a server that answers had kGrace for the rest: the status says what is
  /// left, which goes out at the next start. The destructor does this, too.
  void end();

 private:
  struct Shared;
  // An error's number, or 0.
  int start() const;
  static void work(const std::shared_ptr<Shared>& shared);

  static constexpr std::chrono::milliseconds kGrace{1000};

  // The thread's, too: it may stay behind in the look-up of a host's name, which cannot be ended.
  std::shared_ptr<Shared> shared;
};

}  // namespace factory_test
