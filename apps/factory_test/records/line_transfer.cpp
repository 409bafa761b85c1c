#include "records/line_transfer.h"

#include <array>

#include "records/uuid.h"

namespace factory_test {

namespace {

constexpr int kLineVersion = 1;
constexpr std::int64_t kBatch = 500;  // changes in a transaction

// As a station's database has them, and its own name. Several stations may come at once.
constexpr auto kTables = R"sql(
begin;
select pg_advisory_xact_lock(1179927618);
create schema if not exists factory_test;
create table if not exists line (
  id uuid primary key,
  version integer not null
);
create table if not exists plans (
  hash text primary key,
  name text not null
);
create table if not exists plan_tests (
  plan text not null references plans,
  position integer not null,
  test text not null,
  primary key (plan, position)
);
create table if not exists units (
  serial text primary key,
  first_seen timestamptz not null
);
create table if not exists runs (
  id uuid primary key,
  unit text references units,
  plan text not null references plans,
  station text not null,
  operator text,
  software text not null,
  started timestamptz not null,
  ended timestamptz,
  state text not null check (state in ('running', 'finished', 'aborted')),
  revision bigint not null
);
create table if not exists verdicts (
  id uuid primary key,
  run uuid not null references runs,
  number integer not null,
  test text not null,
  attempt integer not null check (attempt >= 1),
  verdict text not null check (verdict in ('PASS', 'FAIL', 'none')),
  started timestamptz not null,
  duration_ms integer not null,
  width integer not null,
  height integer not null,
  operator text,
  reason text
);
create table if not exists measures (
  verdict uuid not null references verdicts,
  position integer not null,
  name text not null,
  unit text not null,
  value double precision not null,
  least double precision,
  most double precision,
  primary key (verdict, position)
);
create index if not exists runs_by_start on runs (started);
create index if not exists runs_by_unit on runs (unit);
create index if not exists verdicts_by_run on verdicts (run);
)sql";

// One table's part of a batch: a query for the changes behind ?1 up to ?2, as JSON, and where
// PostgreSQL puts them. All stations send rows in the same order, so that none waits for another
// that waits for it.
struct Transfer {
  const char* read;
  const char* write;
};
constexpr auto kTransfers = std::to_array<Transfer>({
    {R"sql(
select json_group_array(json_object('hash', hash, 'name', name)) from (
  select distinct p.hash, p.name from changes c join runs r on r.id = c.run
  join plans p on p.hash = r.plan where c.number > ?1 and c.number <= ?2 order by p.hash))sql",
     R"sql(
insert into plans select hash, name from jsonb_to_recordset($1::jsonb) as t(hash text, name text)
on conflict do nothing)sql"},
    {R"sql(
select json_group_array(json_object('plan', plan, 'position', position, 'test', test)) from (
  select distinct t.plan, t.position, t.test from changes c join runs r on r.id = c.run
  join plan_tests t on t.plan = r.plan where c.number > ?1 and c.number <= ?2
  order by t.plan, t.position))sql",
     R"sql(
insert into plan_tests select plan, position, test
from jsonb_to_recordset($1::jsonb) as t(plan text, position integer, test text)
on conflict do nothing)sql"},
    {R"sql(
select json_group_array(json_object('serial', serial, 'seen', first_seen)) from (
  select distinct u.serial, u.first_seen from changes c join runs r on r.id = c.run
  join units u on u.serial = r.unit where c.number > ?1 and c.number <= ?2 order by u.serial))sql",
     R"sql(
insert into units select serial, seen
from jsonb_to_recordset($1::jsonb) as t(serial text, seen timestamptz)
on conflict do nothing)sql"},
    {R"sql(
select json_group_array(json_object('id', id, 'unit', unit, 'plan', plan, 'station', station,
  'operator', operator, 'software', software, 'started', started, 'ended', ended, 'state', state,
  'revision', revision)) from (
  select distinct r.* from changes c join runs r on r.id = c.run
  where c.number > ?1 and c.number <= ?2 order by r.id))sql",
     R"sql(
insert into runs select id, unit, plan, station, operator, software, started, ended, state, revision
from jsonb_to_recordset($1::jsonb) as t(id uuid, unit text, plan text, station text, operator text,
  software text, started timestamptz, ended timestamptz, state text, revision bigint)
on conflict (id) do update set operator = excluded.operator, ended = excluded.ended,
  state = excluded.state, revision = excluded.revision
where excluded.revision > runs.revision)sql"},
    {R"sql(
select json_group_array(json_object('id', v.id, 'run', v.run, 'number', v.number, 'test', v.test,
  'attempt', v.attempt, 'verdict', v.verdict, 'started', v.started, 'duration_ms', v.duration_ms,
  'width', v.width, 'height', v.height, 'operator', v.operator, 'reason', v.reason))
from changes c join verdicts v on v.id = c.verdict
where c.number > ?1 and c.number <= ?2)sql",
     R"sql(
insert into verdicts (id, run, number, test, attempt, verdict, started, duration_ms, width, height,
  operator, reason)
select id, run, number, test, attempt, verdict, started, duration_ms, width, height, operator, reason
from jsonb_to_recordset($1::jsonb) as t(id uuid, run uuid, number integer, test text,
  attempt integer, verdict text, started timestamptz, duration_ms integer, width integer,
  height integer, operator text, reason text)
on conflict (id) do nothing)sql"},
    // As texts, which keep every digit.
    {R"sql(
select json_group_array(json_object('verdict', m.verdict, 'position', m.position, 'name', m.name,
  'unit', m.unit, 'value', printf('%!.17g', m.value),
  'least', case when m.least is not null then printf('%!.17g', m.least) end,
  'most', case when m.most is not null then printf('%!.17g', m.most) end))
from changes c join measures m on m.verdict = c.verdict
where c.number > ?1 and c.number <= ?2)sql",
     R"sql(
insert into measures select verdict, position, name, unit, value, least, most
from jsonb_to_recordset($1::jsonb) as t(verdict uuid, position integer, name text, unit text,
  value double precision, least double precision, most double precision)
on conflict do nothing)sql"},
});

// Older programs made the table without these, and go on without them.
constexpr auto kLateColumns = R"sql(
alter table verdicts add column if not exists operator text;
alter table verdicts add column if not exists reason text)sql";

bool hasLateColumns(Postgres& server) {
  return server.cell(
             "select count(*) from information_schema.columns where table_schema = 'factory_test' "
             "and table_name = 'verdicts' and column_name = 'reason'") == "1";
}

bool hasTables(Postgres& server) {
  return server.cell("select to_regclass('factory_test.line') is not null") == "t";
}

}  // namespace

void checkLine(Postgres& server) {
  if (!hasTables(server)) throw StoreError("the line's database: holds no factory test's records");
  const std::string version = server.cell("select max(version) from line");
  if (version == std::to_string(kLineVersion)) return;
  throw StoreError("the line's database: is of version " + version + ", this program's is " +
                   std::to_string(kLineVersion));
}

// A line that was told by an older program has no place yet.
std::int64_t waitingFor(Sqlite& station, const std::string& url) {
  return station.number(
      "select count(*) from changes where verdict is not null and number > coalesce("
      "(select sent from lines where place = ?), (select max(sent) from lines where place is "
      "null), "
      "0)",
      {postgresPlace(url)});
}

LineTransfer::LineTransfer(const std::filesystem::path& station, const std::string& url,
                           int stopDescriptor)
    : store(station, Sqlite::Mode::Write), server(url, stopDescriptor) {
  if (!hasTables(server)) {
    const std::string own = "insert into line select '" + newUuid() + "', " +
                            std::to_string(kLineVersion) +
                            " where not exists (select 1 from line); commit";
    server.runAll((kTables + own).c_str());
  }
  checkLine(server);
  if (!hasLateColumns(server)) server.runAll(kLateColumns);
  line = server.cell("select id from line");
  nameLine(postgresPlace(url));
}

// The database that was at that place before, if it was another, is gone.
void LineTransfer::nameLine(const std::string& place) {
  Transaction transaction(store);
  store.run("update lines set place = null where place = ? and id <> ?", {place, line});
  store.run(
      "insert into lines values (?, 0, ?) on conflict (id) do update set place = excluded.place",
      {line, place});
  transaction.commit();
}

std::int64_t LineTransfer::sent() {
  return store.number("select sent from lines where id = ?", {line});
}

bool LineTransfer::sendSome() {
  const std::int64_t from = sent();
  const std::int64_t to = store.number(
      "select max(number) from (select number from changes where number > ? order by number "
      "limit ?)",
      {from, kBatch});
  if (to <= from) return false;
  server.runAll("begin");
  for (const auto& [read, write] : kTransfers) {
    const std::vector<std::string> rows = {store.cell(read, {from, to}).value_or("[]")};
    server.run(write, rows);
  }
  server.runAll("commit");
  store.run("update lines set sent = max(sent, ?) where id = ?", {to, line});
  return true;
}

std::int64_t LineTransfer::waiting() {
  return store.number("select count(*) from changes where number > ? and verdict is not null",
                      {sent()});
}

}  // namespace factory_test
