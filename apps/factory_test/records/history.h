/// What the databases hold of the past.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "records/run.h"
#include "records/sqlite.h"

namespace factory_test {

/// Asks a database; `parameters` stand for $1, $2 and so on.
using Query = std::function<void(const std::string& sql, const std::vector<std::string>& parameters,
                                 const RowReader& reader)>;

/// What is read; an empty text: everything.
struct HistoryFilter {
  std::string run = {};    // its UUID
  std::string unit = {};   // serial number
  std::string since = {};  // "2026-11-21": runs that began then or later, UTC
};

/// The runs, oldest first. A station's database and a line's have the same tables. Throws
/// StoreError.
std::vector<RunRecord> readHistory(const Query& ask, const HistoryFilter& filter);

/// Asks a station's database.
Query queryOf(Sqlite& store);

}  // namespace factory_test
