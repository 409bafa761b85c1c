"""Five stations and one line: line_test.py STATION FACTORY_TEST [VERDICTS]"""

import json
import pathlib
import random
import sqlite3
import subprocess
import sys
import tempfile
import unittest

from postgres_server import Postgres

STATION, FACTORY_TEST = sys.argv[1:3]
VERDICTS = int(sys.argv[3]) if len(sys.argv) > 3 else 10000
STATIONS = 5
TESTS = 20
UNITS = VERDICTS // STATIONS // TESTS
# Where waiting for the disk, which is done for each verdict, takes no time.
MEMORY = "/dev/shm" if pathlib.Path("/dev/shm").is_dir() else None


def history(*source):
    out = subprocess.run([FACTORY_TEST, "export", "--json", *source], check=True, capture_output=True)
    return {run["id"]: run for run in json.loads(out.stdout)["runs"]}


class LineTest(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(self.enterContext(tempfile.TemporaryDirectory(dir=MEMORY)))
        self.server = self.enterContext(Postgres())

    def station(self, number, units=UNITS, url=None):
        return subprocess.Popen([STATION, self.folder / f"{number}.db", f"s{number}", str(units), str(TESTS),
                                 url or self.server.url], stdout=subprocess.PIPE, text=True)

    def test_every_verdict_comes_once_though_the_server_dies(self):
        stations = [self.station(number) for number in range(STATIONS)]
        for line in stations[0].stdout:
            if int(line) == UNITS // 3:
                self.server.kill()
            if int(line) == UNITS // 2:
                # A station dies, too, and its next start sends what it left.
                stations[1].kill()
            if int(line) == UNITS * 2 // 3:
                self.server.start()
        stations[1].wait()
        stations[1].stdout.close()
        stations[1] = self.station(1)
        for each in stations:
            each.stdout.read()
            self.assertEqual(0, each.wait())
            each.stdout.close()
        kept = set()
        for number in range(STATIONS):
            with sqlite3.connect(self.folder / f"{number}.db") as store:
                self.assertEqual([("ok",)], store.execute("pragma integrity_check").fetchall())
                kept |= set(store.execute("select id, run, test, verdict, attempt from verdicts"))
        self.assertGreaterEqual(len(kept), UNITS * TESTS * STATIONS)
        sent = self.server.ask("select id, run, test, verdict, attempt from factory_test.verdicts")
        self.assertEqual(len(kept), len(sent))
        self.assertEqual({tuple(map(str, row)) for row in kept}, {tuple(row) for row in sent})
        # What both say of all runs, values and limits included.
        line = history("--line", self.server.url)
        own = {}
        for number in range(STATIONS):
            own |= history("--database", self.folder / f"{number}.db")
        self.assertEqual(own, line)
        # A line that an older program made.
        self.server.ask("alter table factory_test.verdicts drop column operator, drop column reason")
        self.assertEqual(own.keys(), history("--line", self.server.url).keys())
        with self.station(9, units=1) as late:
            late.communicate()
        late = history("--database", self.folder / "9.db")
        self.assertEqual(late, {run: each for run, each in history("--line", self.server.url).items() if run in late})

    def test_a_line_that_is_away_holds_up_nothing(self):
        for url in (f"postgresql:///none?host={self.folder}", "postgresql://127.0.0.1:1/none", "postgresql://%zz"):
            with self.subTest(url):
                # It never sends, and so never ends by itself; its verdicts are all kept.
                away = self.station(random.getrandbits(30), units=3, url=url)
                self.assertEqual(["0\n", "1\n", "2\n"], [away.stdout.readline() for _ in range(3)])
                away.kill()
                away.wait()
                away.stdout.close()

    def test_another_database_is_refused_in_one_line(self):
        for prepare, says in (("select 1", "holds no factory test's records"),
                              ("create schema factory_test; create table factory_test.line (id uuid, version integer);"
                               "insert into factory_test.line values (gen_random_uuid(), 9)", "is of version 9")):
            self.server.ask(prepare)
            out = subprocess.run([FACTORY_TEST, "report", "--line", self.server.url], check=False, capture_output=True,
                                 text=True)
            self.assertEqual((1, "", 1), (out.returncode, out.stdout, out.stderr.count("\n")))
            self.assertIn(says, out.stderr)
        self.server.kill()
        out = subprocess.run([FACTORY_TEST, "report", f"--line={self.server.url}"], check=False, capture_output=True,
                             text=True)
        self.assertEqual((1, 1), (out.returncode, out.stderr.count("\n")), out.stderr)
        self.server.start()


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
