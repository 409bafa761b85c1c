#include "records/sqlite.h"

#include <unistd.h>

#include <algorithm>
#include <array>
#include <cctype>
#include <cerrno>
#include <charconv>
#include <system_error>
#include <utility>

#include "language/language.h"
#include "results/measure_text.h"
#include "results/system_words.h"
#include "results/whole_file.h"

namespace factory_test {

namespace {

namespace fs = std::filesystem;

std::string systemText(sqlite3* handle) {
  const int number = handle == nullptr ? 0 : sqlite3_system_errno(handle);
  return number == 0 ? "" : ": " + systemWords(number);
}

constexpr int kPrimary = 0xff;  // of a code, the part without details

bool isBusy(int code) {
  return (code & kPrimary) == SQLITE_BUSY || (code & kPrimary) == SQLITE_LOCKED;
}

// What the last call on `handle` failed with, in the words of who uses the program.
std::string explain(sqlite3* handle, int code) {
  if (isBusy(code)) return msg("is locked by another program");
  switch (code & kPrimary) {
    case SQLITE_FULL: return "cannot be written: " + systemWords(ENOSPC);
    case SQLITE_READONLY: return msg("it or its folder is read-only");
    case SQLITE_CANTOPEN: return msg("cannot be opened") + systemText(handle);
    case SQLITE_IOERR: return msg("cannot be read or written") + systemText(handle);
    case SQLITE_NOTADB: return msg("is not a database");
    case SQLITE_CORRUPT: return msg("is damaged; put it aside, then begin a new one");
    default: return handle == nullptr ? "no memory" : sqlite3_errmsg(handle);
  }
}

struct Binder {
  sqlite3_stmt* statement;
  int place;

  int operator()(std::nullptr_t) const { return sqlite3_bind_null(statement, place); }
  int operator()(std::int64_t number) const { return sqlite3_bind_int64(statement, place, number); }
  int operator()(double number) const { return sqlite3_bind_double(statement, place, number); }
  int operator()(std::string_view text) const {
    return sqlite3_bind_text64(statement, place, text.data(), text.size(), SQLITE_STATIC,
                               SQLITE_UTF8);
  }
};

std::optional<std::string> cellOf(sqlite3_stmt* statement, int column) {
  switch (sqlite3_column_type(statement, column)) {
    case SQLITE_NULL: return {};
    case SQLITE_FLOAT: return numberText(sqlite3_column_double(statement, column));
    case SQLITE_INTEGER: return std::to_string(sqlite3_column_int64(statement, column));
    default: break;
  }
  const auto bytes = static_cast<std::size_t>(sqlite3_column_bytes(statement, column));
  const unsigned char* const text = sqlite3_column_text(statement, column);
  return text == nullptr ? std::string() : std::string(text, text + bytes);
}

std::filesystem::path folderOf(const std::filesystem::path& file) {
  return file.has_parent_path() ? file.parent_path() : ".";
}

Cells rowOf(sqlite3_stmt* statement) {
  Cells row;
  for (int column = 0; column < sqlite3_column_count(statement); ++column) {
    row.push_back(cellOf(statement, column));
  }
  return row;
}

fs::path beside(const fs::path& database, const char* ending) {
  return placeOfFile(database).concat(ending);
}

// What stands there and when it was written last; nothing for no file, or an empty one.
struct FileState {
  std::uintmax_t size = 0;
  fs::file_time_type written = {};

  bool operator==(const FileState&) const = default;
};

FileState stateOf(const fs::path& file) {
  std::error_code failure;
  FileState state = {fs::file_size(file, failure), fs::last_write_time(file, failure)};
  return failure ? FileState() : state;
}

// How a database is read without leaving a file beside it, which would be the reader's and in the
// writers' way: SQLite itself makes those that are missing.
struct ReadWay {
  const char* settings;
  bool hasLocks = false;
  bool hasLog = true;  // what was written last stands in it
};
constexpr ReadWay kOpenElsewhere = {"mode=ro&readonly_shm=1", true};
constexpr ReadWay kLeftWithItsLog = {"mode=ro&vfs=unix-none"};
constexpr ReadWay kClosed = {"immutable=1", false, false};

ReadWay wayToRead(const fs::path& path) {
  std::error_code failure;
  if (stateOf(beside(path, "-wal")) == FileState()) {
    return fs::exists(beside(path, "-wal"), failure) && fs::exists(beside(path, "-shm"), failure)
               ? kOpenElsewhere
               : kClosed;
  }
  return fs::exists(beside(path, "-shm"), failure) ? kOpenElsewhere : kLeftWithItsLog;
}

std::string uriOf(const fs::path& path, const char* settings) {
  constexpr std::string_view kDigits = "0123456789ABCDEF";
  constexpr unsigned int kHalf = 16;
  const fs::path place = placeOfFile(path);
  std::string uri = "file:";
  for (const char letter : place.native()) {
    const auto byte = static_cast<unsigned char>(letter);
    if (std::isalnum(byte) != 0 || letter == '/') {
      uri += letter;
    } else {
      (uri += '%') += kDigits[byte / kHalf];
      uri += kDigits[byte % kHalf];
    }
  }
  return uri.append("?").append(settings);
}

}  // namespace

Sqlite::Sqlite(const std::filesystem::path& path, Mode mode) : file(path) {
  constexpr int kNew = SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE;
  const bool writes = mode == Mode::Write;
  const ReadWay way = writes ? ReadWay() : wayToRead(path);
  const int flags = (writes ? kNew : SQLITE_OPEN_READONLY | SQLITE_OPEN_URI) | SQLITE_OPEN_NOMUTEX;
  sqlite3* opened = nullptr;
  // SQLite has names for databases that are no files, such as ":memory:"; a path is none of them.
  const fs::path plain = path.is_absolute() ? path : "." / path;
  const std::string name = writes ? plain.native() : uriOf(path, way.settings);
  const int code = sqlite3_open_v2(name.c_str(), &opened, flags, nullptr);
  handle.reset(opened);  // also of one that failed
  // SQLite then says that there is no such file.
  if (code == SQLITE_CANTOPEN && writes && ::access(folderOf(path).c_str(), W_OK) != 0 &&
      errno != ENOENT) {
    throw StoreError(path.native() + ": cannot be made in its folder: " + systemWords(errno));
  }
  check(code);
  sqlite3_extended_result_codes(opened, 1);
  setPatience(kPatience);
  if (writes || way.hasLocks || !way.hasLog) return;
  // The log's index stands in memory then, and the log is left where it is.
  runAll("pragma locking_mode = exclusive");
  check(sqlite3_db_config(opened, SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, 1, nullptr));
}

void readUndisturbed(const fs::path& path, const std::function<void()>& task) {
  constexpr int kMostTries = 5;
  const auto filesNow = [&path] {
    return std::pair(stateOf(placeOfFile(path)), stateOf(beside(path, "-wal")));
  };
  for (int tries = 0; tries < kMostTries; ++tries) {
    const auto before = filesNow();
    const bool isSafe = wayToRead(path).hasLocks;
    try {
      task();
      if (isSafe || filesNow() == before) return;
    } catch (const StoreError&) {
      if (isSafe || filesNow() == before) throw;
    }
  }
  throw StoreBusy(path.native() + ": is opened and closed all the time by other programs");
}

bool isOfDatabase(const fs::path& file, const fs::path& database) {
  const auto isIt = [&](const char* ending) { return isSameFile(file, beside(database, ending)); };
  return std::ranges::any_of(std::array{"", "-wal", "-shm", "-journal", ".lock"}, isIt);
}

void Sqlite::setPatience(std::chrono::milliseconds patience) const {
  check(sqlite3_busy_timeout(handle.get(), static_cast<int>(patience.count())));
}

void Sqlite::check(int code) const {
  if (code == SQLITE_OK || code == SQLITE_DONE || code == SQLITE_ROW) return;
  const std::string why = file.native() + ": " + explain(handle.get(), code);
  if (isBusy(code)) throw StoreBusy(why);
  throw StoreError(why);
}

Sqlite::Statement Sqlite::prepare(const char* sql) const {
  sqlite3_stmt* prepared = nullptr;
  const int code = sqlite3_prepare_v2(handle.get(), sql, -1, &prepared, nullptr);
  Statement statement(prepared);
  check(code);
  return statement;
}

void Sqlite::bind(sqlite3_stmt* statement, Values values) const {
  int place = 0;
  for (const Value& value : values) check(std::visit(Binder{statement, ++place}, value));
}

void Sqlite::run(const char* sql, Values values, const RowReader& reader) {
  const Statement statement = prepare(sql);
  bind(statement.get(), values);
  int code = sqlite3_step(statement.get());
  for (; code == SQLITE_ROW; code = sqlite3_step(statement.get())) {
    if (reader) reader(rowOf(statement.get()));
  }
  check(code);
}

void Sqlite::runAll(const char* sql) {
  check(sqlite3_exec(handle.get(), sql, nullptr, nullptr, nullptr));
}

std::optional<std::string> Sqlite::cell(const char* sql, List values) {
  std::optional<std::string> first;
  bool isRead = false;
  run(sql, values, [&](const Cells& row) {
    if (!std::exchange(isRead, true)) first = row.front();
  });
  return first;
}

std::int64_t Sqlite::number(const char* sql, List values) {
  const std::string text = cell(sql, values).value_or("");
  std::int64_t number = 0;
  std::from_chars(text.data(), text.data() + text.size(), number);
  return number;
}

Transaction::Transaction(Sqlite& database) : store(database) { store.runAll("begin immediate"); }

void Transaction::commit() {
  store.runAll("commit");
  isOpen = false;
}

Transaction::~Transaction() {
  if (!isOpen) return;
  try {
    store.runAll("rollback");
  } catch (const StoreError&) {
    // SQLite has already rolled back where the disk failed; there is nothing else to take back.
    isOpen = false;
  }
}

}  // namespace factory_test
