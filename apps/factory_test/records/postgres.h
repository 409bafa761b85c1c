/// PostgreSQL for the records: a connection that can be called off.
#pragma once

#include <libpq-fe.h>

#include <chrono>
#include <memory>
#include <string>
#include <vector>

#include "records/history.h"
#include "records/sqlite.h"

namespace factory_test {

/// Why `text` is no address of a PostgreSQL database, postgresql://... or postgres://..., in a
/// line; empty: it is one.
std::string wrongPostgresUrl(const std::string& text);

/// What an address names, without users, passwords and settings: two of one database read the same.
std::string postgresPlace(const std::string& url);

/// One thread at a time uses a connection. Every operation throws StoreError when the server
/// refuses, is away, does not answer in kAnswerTime, or when `stopDescriptor` becomes readable.
class Postgres {
 public:
  static constexpr int kNeverStops = -1;

  /// Connects. Only looking up the host's name may take longer than said above.
  explicit Postgres(const std::string& url, int stopDescriptor = kNeverStops);

  /// One statement; `parameters` stand for $1, $2 and so on, and its rows go to `reader`.
  void run(const std::string& sql, const std::vector<std::string>& parameters = {},
           const RowReader& reader = {});
  /// Statements without parameters and rows.
  void runAll(const char* sql);
  /// The first cell of the first row; empty for none.
  std::string cell(const std::string& sql);

 private:
  struct Closer {
    void operator()(PGconn* open) const { PQfinish(open); }
  };
  struct Clearer {
    void operator()(PGresult* answer) const { PQclear(answer); }
  };
  using Result = std::unique_ptr<PGresult, Clearer>;

  static constexpr std::chrono::seconds kAnswerTime{20};

  void connect();
  void wait(short events);
  void flush();
  Result answer();
  void check(bool isDone) const;

  std::unique_ptr<PGconn, Closer> handle;
  int stop;
};

/// Asks a line's database.
Query queryOf(Postgres& server);

}  // namespace factory_test
