"""The whole application, killed at random moments of a run under load: kill_test.py FACTORY_TEST TRACE [KILLS] [SEED]"""

import json
import os
import pathlib
import random
import sqlite3
import subprocess
import sys
import tempfile
import time
import unittest

FACTORY_TEST, TRACE = sys.argv[1:3]
KILLS = int(sys.argv[3]) if len(sys.argv) > 3 else 8
SEED = int(sys.argv[4]) if len(sys.argv) > 4 else random.getrandbits(30)
LONGEST = 2.5  # seconds: a run under load takes longer


class KillTest(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(self.enterContext(tempfile.TemporaryDirectory()))
        self.store = self.folder / "station.db"
        self.results = self.folder / "results.json"
        for _ in range(2):
            load = subprocess.Popen([sys.executable, "-c", "while True: pass"])
            self.addCleanup(load.wait)
            self.addCleanup(load.kill)

    def program(self, *options, trace=TRACE):
        return subprocess.Popen([FACTORY_TEST, "--headless", "--database", self.store, "--results", self.results,
                                 "--serial", "A1", *options], stderr=subprocess.PIPE, text=True,
                                env=os.environ | {"BRIMOL_TRACE": str(trace)})

    def ask(self, sql):
        store = sqlite3.connect(f"file:{self.store}?mode=ro", uri=True)
        try:
            return store.execute(sql).fetchall()
        finally:
            store.close()

    def verdicts(self):
        """Those that were given so far."""
        try:
            return set(self.ask("select * from verdicts")) if self.store.exists() else set()
        except sqlite3.OperationalError:
            return set()  # it has no tables yet

    def test_loses_at_most_the_running_test(self):
        chance = random.Random(SEED)
        for kill in range(KILLS):
            with self.subTest(kill=kill, seed=SEED):
                before = self.verdicts() if kill else set()
                app = self.program("--new-run")
                if kill % 4 == 1:  # among its verdicts
                    while app.poll() is None and not self.verdicts() - before:
                        time.sleep(0.01)
                    time.sleep(chance.uniform(0, 0.5))
                    self.assertLess(before, self.verdicts())
                else:
                    time.sleep(chance.uniform(0.05, LONGEST))
                before |= self.verdicts()
                app.kill()
                app.communicate()
                if not self.store.exists():
                    continue
                self.assertEqual([("ok",)], self.ask("pragma integrity_check"))
                self.assertEqual([], self.ask("pragma foreign_key_check"))
                self.assertEqual(set(), before - self.verdicts())
                if self.results.exists():
                    json.loads(self.results.read_text())
        self.check_next_start()

    def check_next_start(self):
        """It goes on with the run that the last kill left."""
        short = self.folder / "short.trace"
        short.write_text("brimol-trace 1\nwait 10\n")
        menu = self.program(trace=short)
        _, says = menu.communicate()
        self.assertIn((menu.returncode, says), [(3, ""), (4, "")])
        self.assertEqual([], self.ask("select id from runs where state = 'running'"))
        newest = self.ask("select test from verdicts v join runs r on r.id = v.run where r.number = "
                          "(select max(number) from runs) group by test order by min(v.number)")
        results = json.loads(self.results.read_text())
        self.assertEqual("A1", results["unit"])
        self.assertEqual([test for test, in newest], [result["test"] for result in results["results"]])


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
