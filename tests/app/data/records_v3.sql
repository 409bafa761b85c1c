PRAGMA foreign_keys=OFF;
BEGIN TRANSACTION;
CREATE TABLE plans (
  hash text primary key,
  name text not null
) strict;
INSERT INTO plans VALUES('h1','Line A');
CREATE TABLE plan_tests (
  plan text not null references plans,
  position integer not null,
  test text not null,
  primary key (plan, position)
) strict, without rowid;
INSERT INTO plan_tests VALUES('h1',1,'keys');
INSERT INTO plan_tests VALUES('h1',2,'touch');
CREATE TABLE units (
  serial text primary key,
  first_seen text not null
) strict;
INSERT INTO units VALUES('OLD 1','2026-11-20T07:00:00Z');
CREATE TABLE runs (
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
, revision integer not null default 1) strict;
INSERT INTO runs VALUES(1,'0b1ddc6e-5fb0-4d6e-8d1c-000000000001','OLD 1','h1','bench7','Eve','0.1.0','2026-11-20T07:00:00Z','2026-11-20T07:01:00Z','finished',1);
CREATE TABLE verdicts (
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
INSERT INTO verdicts VALUES('0b1ddc6e-5fb0-4d6e-8d1c-000000000002','0b1ddc6e-5fb0-4d6e-8d1c-000000000001',1,'keys',1,'PASS','2026-11-20T07:00:00Z',2000,480,800);
INSERT INTO verdicts VALUES('0b1ddc6e-5fb0-4d6e-8d1c-000000000003','0b1ddc6e-5fb0-4d6e-8d1c-000000000001',2,'touch',1,'FAIL','2026-11-20T07:00:30Z',30000,480,800);
CREATE TABLE measures (
  verdict text not null references verdicts,
  position integer not null,
  name text not null,
  unit text not null,
  value real not null,
  least real,
  most real,
  primary key (verdict, position)
) strict, without rowid;
INSERT INTO measures VALUES('0b1ddc6e-5fb0-4d6e-8d1c-000000000003',1,'gap','mm',0.25,NULL,1.5);
CREATE TABLE changes (
  number integer primary key autoincrement,
  run text not null references runs (id),
  verdict text references verdicts
) strict;
INSERT INTO changes VALUES(1,'0b1ddc6e-5fb0-4d6e-8d1c-000000000001',NULL);
INSERT INTO changes VALUES(2,'0b1ddc6e-5fb0-4d6e-8d1c-000000000001','0b1ddc6e-5fb0-4d6e-8d1c-000000000002');
INSERT INTO changes VALUES(3,'0b1ddc6e-5fb0-4d6e-8d1c-000000000001','0b1ddc6e-5fb0-4d6e-8d1c-000000000003');
CREATE TABLE lines (
  id text primary key,
  sent integer not null
, place text) strict, without rowid;
DELETE FROM sqlite_sequence;
INSERT INTO sqlite_sequence VALUES('runs',1);
INSERT INTO sqlite_sequence VALUES('changes',3);
CREATE INDEX runs_by_unit on runs (unit, number);
CREATE INDEX runs_by_state on runs (state) where state = 'running';
CREATE TRIGGER run_begins after insert on runs begin
  insert into changes (run) values (new.id);
end;
CREATE TRIGGER run_changes after update of operator, ended, state on runs begin
  update runs set revision = revision + 1 where number = new.number;
  insert into changes (run) values (new.id);
end;
CREATE TRIGGER verdict_is_given after insert on verdicts begin
  insert into changes (run, verdict) values (new.run, new.id);
end;
COMMIT;
PRAGMA application_id = 1179927618;
PRAGMA user_version = 3;
