#include "records/sqlite.h"

#include <unistd.h>

#include <cerrno>
#include <charconv>
#include <system_error>
#include <utility>

#include "results/measure_text.h"

namespace factory_test {

namespace {

std::string systemText(sqlite3* handle) {
  const int number = handle == nullptr ? 0 : sqlite3_system_errno(handle);
  return number == 0 ? "" : ": " + std::generic_category().message(number);
}

constexpr int kPrimary = 0xff;  // of a code, the part without details

bool isBusy(int code) {
  return (code & kPrimary) == SQLITE_BUSY || (code & kPrimary) == SQLITE_LOCKED;
}

// What the last call on `handle` failed with, in the words of who uses the program.
std::string explain(sqlite3* handle, int code) {
  if (isBusy(code)) return "is locked by another program";
  switch (code & kPrimary) {
    case SQLITE_FULL: return "cannot be written: the disk is full";
    case SQLITE_READONLY: return "cannot be used: it or its folder is read-only";
    case SQLITE_CANTOPEN: return "cannot be opened" + systemText(handle);
    case SQLITE_IOERR: return "cannot be read or written" + systemText(handle);
    case SQLITE_NOTADB: return "is not a database";
    case SQLITE_CORRUPT: return "is damaged: put it aside, then begin a new one";
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

}  // namespace

Sqlite::Sqlite(const std::filesystem::path& path, Mode mode) : file(path) {
  constexpr int kNew = SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE;
  const int flags = (mode == Mode::Write ? kNew : SQLITE_OPEN_READONLY) | SQLITE_OPEN_NOMUTEX;
  sqlite3* opened = nullptr;
  const int code = sqlite3_open_v2(path.c_str(), &opened, flags, nullptr);
  handle.reset(opened);  // also of one that failed
  // SQLite then says that there is no such file.
  if (code == SQLITE_CANTOPEN && mode == Mode::Write &&
      ::access(folderOf(path).c_str(), W_OK) != 0 && errno != ENOENT) {
    throw StoreError(path.native() +
                     ": cannot be made in its folder: " + std::generic_category().message(errno));
  }
  check(code);
  sqlite3_extended_result_codes(opened, 1);
  setPatience(kPatience);
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
