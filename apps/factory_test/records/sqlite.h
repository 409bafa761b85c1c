/// SQLite for the records: connections, statements and transactions that end by themselves.
#pragma once

#include <sqlite3.h>

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <functional>
#include <initializer_list>
#include <memory>
#include <optional>
#include <span>
#include <stdexcept>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace factory_test {

/// What went wrong with a database, in one line. The records' own parts throw it; none of their
/// public operations lets it out.
class StoreError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

/// Another program's lock was in the way: it may go soon.
class StoreBusy : public StoreError {
 public:
  using StoreError::StoreError;
};

/// A row as texts; nothing for null. Numbers read as the same number again.
using Cells = std::vector<std::optional<std::string>>;
using RowReader = std::function<void(const Cells& row)>;

/// One thread at a time uses a connection.
class Sqlite {
 public:
  enum class Mode { Read, Write };

  /// A parameter's value; texts are only read during the call.
  using Value = std::variant<std::nullptr_t, std::int64_t, double, std::string_view>;
  using Values = std::span<const Value>;
  using List = std::initializer_list<Value>;

  /// How long it waits for others that write, unless it is told otherwise.
  static constexpr std::chrono::milliseconds kPatience{3000};

  /// Opens the database; Mode::Write makes one that is missing, Mode::Read leaves nothing beside it
  /// and needs no right to write.
  Sqlite(const std::filesystem::path& path, Mode mode);
  void setPatience(std::chrono::milliseconds patience) const;

  /// One statement; its rows go to `reader`.
  void run(const char* sql, Values values, const RowReader& reader = {});
  void run(const char* sql, List values = {}, const RowReader& reader = {}) {
    run(sql, Values(values.begin(), values.size()), reader);
  }
  /// Statements without parameters.
  void runAll(const char* sql);
  /// The first cell of the first row; nothing for none.
  std::optional<std::string> cell(const char* sql, List values = {});
  std::int64_t number(const char* sql, List values = {});
  /// How many rows the last statement changed.
  int changes() const { return sqlite3_changes(handle.get()); }

 private:
  struct Closer {
    void operator()(sqlite3* open) const { sqlite3_close_v2(open); }
  };
  struct Finalizer {
    void operator()(sqlite3_stmt* prepared) const { sqlite3_finalize(prepared); }
  };
  using Statement = std::unique_ptr<sqlite3_stmt, Finalizer>;

  Statement prepare(const char* sql) const;
  void bind(sqlite3_stmt* statement, Values values) const;
  void check(int code) const;

  std::filesystem::path file;
  std::unique_ptr<sqlite3, Closer> handle;
};

/// Writes all or nothing. It waits for other writers when it begins, so that it never fails for
/// them later.
class Transaction {
 public:
  explicit Transaction(Sqlite& database);
  ~Transaction();
  Transaction(const Transaction&) = delete;
  Transaction& operator=(const Transaction&) = delete;

  /// Without it, the destructor takes everything back.
  void commit();

 private:
  Sqlite& store;
  bool isOpen = true;
};

/// Performs `task`, which reads the database at `path` from its opening on and throws StoreError.
/// What nobody else has open is read without locks: it is read anew where somebody opens it
/// meanwhile.
void readUndisturbed(const std::filesystem::path& path, const std::function<void()>& task);

/// Whether writing to `file` would write over the database or one of the files that stand beside it
/// while it is open.
bool isOfDatabase(const std::filesystem::path& file, const std::filesystem::path& database);

/// A limit or another figure that may be missing.
inline Sqlite::Value orNull(const std::optional<double>& figure) {
  return figure ? Sqlite::Value(*figure) : Sqlite::Value(nullptr);
}

/// An empty text stands for a missing one.
inline Sqlite::Value orNull(const std::string& text) {
  return text.empty() ? Sqlite::Value(nullptr) : Sqlite::Value(text);
}

}  // namespace factory_test
