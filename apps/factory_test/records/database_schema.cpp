#include "records/database_schema.h"

#include <fcntl.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <chrono>
#include <string>
#include <thread>

#include "results/system_words.h"
#include "results/whole_file.h"

namespace factory_test {

namespace {

namespace fs = std::filesystem;

constexpr std::int64_t kApplication = 0x46544442;  // "FTDB", which tells our files from others'
constexpr std::int64_t kMostCheckedBytes = std::int64_t{64} << 20;  // some tenths of a second

// What makes the version of its place, from 1, of the one before. A step that was released never
// changes.
constexpr auto kSteps = std::to_array<const char*>({
    R"sql(
create table plans (
  hash text primary key,
  name text not null
) strict;
create table plan_tests (
  plan text not null references plans,
  position integer not null,
  test text not null,
  primary key (plan, position)
) strict, without rowid;
create table units (
  serial text primary key,
  first_seen text not null
) strict;
create table runs (
  number integer primary key autoincrement,
  id text not null unique,
  unit text references units,
  plan text not null references plans,
  station text not null,
  operator text,
  software text not null,
  started text not null,
  ended text,
  state text not null check (state in ('running', 'finished', 'aborted'))
) strict;
create index runs_by_unit on runs (unit, number);
create index runs_by_state on runs (state) where state = 'running';
create table verdicts (
  id text primary key,
  run text not null references runs (id),
  number integer not null,
  test text not null,
  attempt integer not null check (attempt >= 1),
  verdict text not null check (verdict in ('PASS', 'FAIL', 'none')),
  started text not null,
  duration_ms integer not null,
  width integer not null,
  height integer not null,
  unique (run, number)
) strict;
create table measures (
  verdict text not null references verdicts,
  position integer not null,
  name text not null,
  unit text not null,
  value real not null,
  least real,
  most real,
  primary key (verdict, position)
) strict, without rowid;
)sql",
    // What a line has to be told of, in order, and how far each line was.
    R"sql(
alter table runs add column revision integer not null default 1;
create table changes (
  number integer primary key autoincrement,
  run text not null references runs (id),
  verdict text references verdicts
) strict;
create table lines (
  id text primary key,
  sent integer not null
) strict, without rowid;
insert into changes (run) select id from runs order by number;
insert into changes (run, verdict)
  select v.run, v.id from verdicts v join runs r on r.id = v.run order by r.number, v.number;
create trigger run_begins after insert on runs begin
  insert into changes (run) values (new.id);
end;
create trigger run_changes after update of operator, ended, state on runs begin
  update runs set revision = revision + 1 where number = new.number;
  insert into changes (run) values (new.id);
end;
create trigger verdict_is_given after insert on verdicts begin
  insert into changes (run, verdict) values (new.run, new.id);
end;
)sql",
    // Where each line was met last, so that its verdicts can be counted while it is away.
    R"sql(
alter table lines add column place text;
)sql",
    // A run may be gone on with by another operator.
    R"sql(
alter table verdicts add column operator text;
alter table verdicts add column reason text;
update verdicts set operator = (select operator from runs where id = run);
)sql",
});

std::string named(const fs::path& path, const std::string& what) {
  return path.native() + ": " + what;
}

std::int64_t versionOf(Sqlite& store) { return store.number("pragma user_version"); }

// An empty file is a database without tables.
bool isNew(Sqlite& store) { return store.number("select count(*) from sqlite_schema") == 0; }

void refuseOthers(Sqlite& store, const fs::path& path) {
  if (isNew(store)) throw StoreError(named(path, "holds no factory test's records"));
  if (store.number("pragma application_id") != kApplication) {
    throw StoreError(named(path, "is another program's database"));
  }
  if (versionOf(store) < 1) {
    throw StoreError(named(path, "has lost its version: put it aside, then begin a new one"));
  }
  if (versionOf(store) <= kDatabaseVersion) return;
  throw StoreError(named(path, "is of version " + std::to_string(versionOf(store)) +
                                   ", newer than this program's " +
                                   std::to_string(kDatabaseVersion)));
}

// A large one is found damaged where it is read: looking at all of it would hold up every start.
void refuseDamaged(Sqlite& store, const fs::path& path) {
  const std::int64_t bytes = store.number("pragma page_count") * store.number("pragma page_size");
  if (bytes > kMostCheckedBytes || store.cell("pragma quick_check(1)") == "ok") return;
  throw StoreError(named(path, "is damaged; put it aside, then begin a new one"));
}

// An empty file of a name that no other file has, nor gets meanwhile.
fs::path reserve(const fs::path& wanted) {
  constexpr mode_t kMode = 0666;  // less what the user's mask takes
  fs::path copy = wanted;
  for (int number = 2;; ++number) {
    const int descriptor = ::open(copy.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kMode);
    if (descriptor >= 0) {
      ::close(descriptor);
      return copy;
    }
    if (errno != EEXIST) {
      throw StoreError(named(copy, "cannot be written: " + systemWords(errno)));
    }
    copy = fs::path(wanted).concat(".").concat(std::to_string(number));
  }
}

void backUp(Sqlite& store, const fs::path& path) {
  const std::string version = std::to_string(versionOf(store));
  const fs::path copy = reserve(placeOfFile(path).concat(".v").concat(version).concat(".bak"));
  try {
    store.run("vacuum into ?", {copy.native()});
    if (Sqlite(copy, Sqlite::Mode::Read).number("pragma user_version") != kDatabaseVersion) return;
  } catch (const StoreError&) {
    ::unlink(copy.c_str());
    throw;
  }
  ::unlink(copy.c_str());  // another program has brought the database up to date meanwhile
}

// Another program may have done it since: the version is read again behind its lock.
void bringUpToDate(Sqlite& store) {
  Transaction transaction(store);
  const auto from = static_cast<std::size_t>(versionOf(store));
  for (std::size_t step = from; step < kSteps.size(); ++step) store.runAll(kSteps.at(step));
  store.runAll(("pragma application_id = " + std::to_string(kApplication) +
                "; pragma user_version = " + std::to_string(kDatabaseVersion))
                   .c_str());
  transaction.commit();
}

// SQLite itself waits for nobody here: of programs that begin one new database at once it refuses
// all but the first.
void keepLogOf(Sqlite& store) {
  constexpr std::chrono::milliseconds kPause{5};
  const auto end = std::chrono::steady_clock::now() + Sqlite::kPatience;
  for (;;) {
    try {
      store.runAll("pragma journal_mode = wal");
      return;
    } catch (const StoreBusy&) {
      if (std::chrono::steady_clock::now() >= end) throw;
    }
    std::this_thread::sleep_for(kPause);
  }
}

}  // namespace

const int kDatabaseVersion = static_cast<int>(kSteps.size());

void prepareDatabase(Sqlite& store, const fs::path& path) {
  // Each commit is on the disk when it returns.
  store.runAll("pragma foreign_keys = on; pragma synchronous = full");
  if (!isNew(store)) checkDatabase(store, path);
  keepLogOf(store);
  if (!isNew(store) && versionOf(store) == kDatabaseVersion) return;
  if (!isNew(store)) backUp(store, path);
  bringUpToDate(store);
}

void checkDatabase(Sqlite& store, const fs::path& path) {
  refuseOthers(store, path);
  refuseDamaged(store, path);
}

}  // namespace factory_test
