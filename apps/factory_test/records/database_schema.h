/// The tables of a station's database, and how older ones become them.
#pragma once

#include <filesystem>

#include "records/sqlite.h"

namespace factory_test {

/// "user_version" of the databases that this program writes.
extern const int kDatabaseVersion;

/// Makes the tables of a new database, or brings one of an older version up to date after a copy
/// of it went to PATH.v<version>.bak, which never replaces another file. Throws StoreError for a
/// database of a newer version, of another program, or a damaged one: it stays as it is.
void prepareDatabase(Sqlite& store, const std::filesystem::path& path);

/// The same checks for a database that is only read. Nothing is changed.
void checkDatabase(Sqlite& store, const std::filesystem::path& path);

}  // namespace factory_test
