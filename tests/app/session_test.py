"""A station's session on its screen, played without one: session_test.py FACTORY_TEST"""

import json
import os
import pathlib
import shutil
import signal
import sqlite3
import subprocess
import sys
import tempfile
import time
import unittest

FACTORY_TEST = sys.argv[1]
PLAN = {"version": 1, "name": "Short", "steps": [{"test": "stuck_touch", "parameters": {"seconds": 1}}]}
NEXT = "wait 1300\nexpect text \"*1 of 1 done: *\" within 4000\nwait 800\ntap \"{}\"\nexpect text \"Which unit?\"\n"
# Holds a verdict up until the test lets go of the database.
SHELL = """cd {}
if mkdir first; then until [ -e locked ]; do sleep 0.05; done
else mkdir second; until [ -e released ]; do sleep 0.05; done; fi"""
PASS = """wait until text "*exit code 0*" within 86400000
tap "OK"
wait 800
tap "PASS"
"""


class SessionTest(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(self.enterContext(tempfile.TemporaryDirectory()))
        self.database = self.folder / "station.db"

    def start(self, trace, *options, program=FACTORY_TEST, before=None):
        file = self.folder / "played.trace"
        file.write_text("brimol-trace 1\n" + trace)
        return subprocess.Popen([program, "--headless", "--database", self.database, *options],
                                stderr=subprocess.PIPE, text=True, cwd=self.folder, preexec_fn=before,
                                env=os.environ | {"BRIMOL_TRACE": str(file), "BRIMOL_SCREEN": "480x800",
                                                  "BRIMOL_REPORT_DIR": str(self.folder),
                                                  "BRIMOL_REPORT_PICTURES": "none"})

    def ask(self, sql):
        store = sqlite3.connect(self.database)
        try:
            return store.execute(sql).fetchall()
        finally:
            store.close()

    def await_folder(self, name, program):
        while not (self.folder / name).exists():
            if program.poll() is not None:
                self.fail(program.communicate()[1])
            time.sleep(0.02)

    def test_the_operator_is_told(self):
        """That no number was typed, or a wrong one, which stays; the time left; the second attempt."""
        plan = self.folder / "plan.json"
        plan.write_text(json.dumps({"version": 1, "name": "Trails", "steps": [
            {"test": "touch_trails", "timeout_s": 2, "retries": 1}]}))
        trace = """tap "enter"
expect text "No number was typed."
type "a b"
tap "enter"
expect text "*serial number*"
expect text "a b"
tap "back"
tap "back"
tap "enter"
expect text "Time left: 1 s"
expect text "Attempt 2 of 2 · Time left: 2 s" within 5000
expect text "*1 of 1 done: *" within 6000
"""
        self.assertNotIn("played.trace", self.start(trace, "--plan", plan, "--run").communicate()[1])
        self.assertEqual([("a",)], self.ask("select serial from units"))

    def test_the_menu_has_the_plans_order_and_the_lines_state(self):
        plan = self.folder / "plan.json"
        plan.write_text(json.dumps(PLAN | {"steps": [*PLAN["steps"], {"test": "pinch"}, {"test": "colours"}]}))
        trace = """wait until text "Line out of reach: 0 verdicts wait" within 86400000
tap "Stuck touch"
wait until text "Line out of reach: 1 verdict waits" within 86400000
"""
        played = self.start(trace, "--plan", plan, "--serial", "a1", "--line", "postgresql://nobody@127.0.0.1:1/none")
        self.assertNotIn("played.trace", played.communicate()[1])
        records = map(json.loads, (self.folder / "session.jsonl").read_text().splitlines())
        *_, last = (record for record in records if record["kind"] == "frame")
        rows = [each["text"].strip() for each in sorted(last["texts"], key=lambda each: each["y"])]
        first = rows.index("Plan: Short")
        self.assertEqual(["Stuck touch: PASS", "Pinch", "Display colours", "Display, not in the plan"],
                         rows[first + 1:first + 5])

    def test_a_language_without_its_catalogue_is_english(self):
        """The catalogues are found beside the program."""
        lonely = shutil.copy(FACTORY_TEST, self.folder / "lonely")
        played = self.start("expect text \"Which unit?\"\n", "--language", "de", program=lonely)
        says = played.communicate()[1]
        self.assertIn("no catalogue of the language 'de': texts are English", says)
        self.assertNotIn("played.trace", says)

    def test_a_report_without_room_for_its_pictures_says_so_once(self):
        trace = self.folder / "played.trace"
        trace.write_text("brimol-trace 1\ntap \"Shell\"\nwait 300\nclose\n")
        full = ["sh", "-c", "ulimit -f 16; exec \"$0\" --headless", FACTORY_TEST]  # no file grows beyond 8 KiB
        says = subprocess.run(full, stderr=subprocess.PIPE, text=True, env=os.environ | {
            "BRIMOL_TRACE": str(trace), "BRIMOL_SCREEN": "480x800", "BRIMOL_REPORT_DIR": str(self.folder)}).stderr
        self.assertEqual(1, says.count("frame-"), says)
        self.assertIn(f"cannot write {self.folder}/frame-000001.png: File too large", says)
        self.assertEqual([], [*self.folder.glob("*.png*")])

    def test_one_unit_after_another(self):
        """The second one fails; the exit code tells of it, though the third one passes."""
        plan = self.folder / "plan.json"
        plan.write_text(json.dumps(PLAN))
        trace = "expect text \"Which unit?\"\n"
        for unit, touched, end in (("a1", "", "NEXT UNIT"), ("b2", "tap 50% 50%\n", "END"), ("c3", "", "END")):
            trace += f"type \"{unit}\"\ntap \"enter\"\n{touched}{NEXT.format(end)}"
        played = self.start(trace, "--plan", plan, "--run", "--stay")
        says = played.communicate()[1]
        self.assertEqual((3, ""), (played.returncode, says))
        self.assertEqual([("a1", "finished", "PASS"), ("b2", "finished", "FAIL"), ("c3", "finished", "PASS")],
                         self.ask("select unit, state, verdict from runs r join verdicts on run = r.id order by r.number"))

    def test_the_shell_runs_its_option_alone(self):
        played = self.start(PASS + "expect text \"Shell: PASS\"\n", "--serial", "$(>unit)", "--operator", "`>operator`",
                            "--test", "shell", "--shell", "echo ran >> ran")
        self.assertEqual((0, ""), (played.wait(), played.communicate()[1]))
        self.assertEqual("ran\n", (self.folder / "ran").read_text())
        self.assertEqual([], [name for name in ("unit", "operator") if (self.folder / name).exists()])

    def test_it_bears_what_it_is_started_with(self):
        """Ignored signals, and no stderr: what the program says of the line at its end goes into no file."""
        def before():
            signal.signal(signal.SIGCHLD, signal.SIG_IGN)
            signal.signal(signal.SIGHUP, signal.SIG_IGN)
            os.close(2)
        played = self.start(PASS + "expect text \"Shell: PASS\"\n", "--serial", "a1", "--results", "kept",
                            "--line", "postgresql://nobody@127.0.0.1:1/none", "--test", "shell", "--shell",
                            "kill -HUP $PPID", before=before)
        self.assertEqual((0, ""), (played.wait(), played.communicate()[1]))
        self.assertFalse((self.folder / "kept.lock").exists())

    def test_a_locked_database_holds_up_no_screen(self):
        played = self.start(PASS + """expect text "Shell: PASS, saving..."
expect text "Not saved" within 5000
wait 800
tap "LATER"
tap "Shell: PASS, not saved"
""" + PASS + "expect text \"Shell: PASS\"\n", "--serial", "a1", "--test", "shell", "--shell", SHELL.format(self.folder))
        self.await_folder("first", played)
        store = sqlite3.connect(self.database)
        store.execute("begin immediate")
        (self.folder / "locked").touch()
        self.await_folder("second", played)
        store.close()
        (self.folder / "released").touch()
        says = played.communicate()[1]
        self.assertEqual((0, 1), (played.returncode, says.count("\n")), says)
        self.assertEqual([("PASS", 1), ("PASS", 2)], self.ask("select verdict, attempt from verdicts order by number"))

    def test_a_retry_is_kept_and_a_refused_start_is_not(self):
        refused = self.start("wait 10\n", "--serial", "a1", "--log", self.folder / "none")
        self.assertIn("none: it or its folder is missing", refused.communicate()[1])
        self.assertFalse(self.database.exists())
        played = self.start("wait 800\ntap \"RETRY\"\nwait 800\ntap \"FAIL\"\nexpect text \"Slide switches: FAIL\"\n",
                            "--serial", "a1", "--test", "switches")
        self.assertEqual((3, ""), (played.wait(), played.communicate()[1]))
        self.assertEqual([("none", "retry", 1), ("FAIL", "operator", 2)],
                         self.ask("select verdict, reason, attempt from verdicts order by number"))


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
