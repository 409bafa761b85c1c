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
pragma application_id = 1179927618;
pragma user_version = 1;
insert into plans values ('h1', 'Line A');
insert into plan_tests values ('h1', 1, 'keys'), ('h1', 2, 'touch');
insert into units values ('OLD 1', '2026-11-20T07:00:00Z');
insert into runs (id, unit, plan, station, operator, software, started, ended, state) values
  ('0b1ddc6e-5fb0-4d6e-8d1c-000000000001', 'OLD 1', 'h1', 'bench7', 'Eve', '0.1.0', '2026-11-20T07:00:00Z',
   '2026-11-20T07:01:00Z', 'finished');
insert into verdicts values
  ('0b1ddc6e-5fb0-4d6e-8d1c-000000000002', '0b1ddc6e-5fb0-4d6e-8d1c-000000000001', 1, 'keys', 1, 'PASS',
   '2026-11-20T07:00:00Z', 2000, 480, 800),
  ('0b1ddc6e-5fb0-4d6e-8d1c-000000000003', '0b1ddc6e-5fb0-4d6e-8d1c-000000000001', 2, 'touch', 1, 'FAIL',
   '2026-11-20T07:00:30Z', 30000, 480, 800);
insert into measures values ('0b1ddc6e-5fb0-4d6e-8d1c-000000000003', 1, 'gap', 'mm', 0.25, null, 1.5);
