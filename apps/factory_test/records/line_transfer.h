/// From a station's database to the line's.
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

#include "records/postgres.h"
#include "records/sqlite.h"

namespace factory_test {

/// Both databases while they are connected. The line's gets its tables where it has none. All
/// operations throw StoreError, and may be done again after that: what is there already is passed
/// over by its UUID.
class LineTransfer {
 public:
  LineTransfer(const std::filesystem::path& station, const std::string& url, int stopDescriptor);

  /// Sends some changes in one transaction. False: there are none that were not sent.
  bool sendSome();
  /// How many verdicts were not sent.
  std::int64_t waiting();

 private:
  void nameLine(const std::string& place);
  std::int64_t sent();

  Sqlite store;
  Postgres server;
  std::string line = {};  // the line's own name: a database that is made anew gets everything
};

/// How many verdicts a station has not sent to the line at that address, as far as the station
/// knows without asking there. Throws StoreError.
std::int64_t waitingFor(Sqlite& station, const std::string& url);

/// Refuses a line's database that is none, or of a newer version.
void checkLine(Postgres& server);

}  // namespace factory_test
