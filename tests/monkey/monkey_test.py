"""What a monkey finds, and how short it becomes: monkey_test.py PLANTED FACTORY_TEST SHRINK [PLANTED_DIALOG]"""

import os
import pathlib
import signal
import subprocess
import sys
import tempfile
import unittest

PLANTED, FACTORY_TEST, SHRINK = sys.argv[1:4]
PLANTED_DIALOG = sys.argv[4] if len(sys.argv) > 4 else None


class MonkeyTest(unittest.TestCase):
    def setUp(self):
        folder = self.enterContext(tempfile.TemporaryDirectory())
        self.folder = pathlib.Path(folder)

    def run_program(self, *command, **environment):
        settings = {**os.environ, "BRIMOL_DISPLAY": "headless", "BRIMOL_DEVICE": "", "BRIMOL_SCREEN": "480x800",
                    **environment}
        return subprocess.run(command, env=settings, cwd=self.folder, capture_output=True, text=True, timeout=250,
                              check=False)

    def find_and_shrink(self, wish, *program):
        trace, short = self.folder / "long.trace", self.folder / "short.trace"
        found = self.run_program(*program, BRIMOL_MONKEY=wish, BRIMOL_RECORD=str(trace))
        self.assertEqual(found.returncode, -signal.SIGABRT, found.stderr)
        self.assertEqual(self.run_program(*program, BRIMOL_TRACE=str(trace)).returncode, -signal.SIGABRT)
        shrunk = self.run_program(SHRINK, str(trace), str(short), "--", *program)
        self.assertEqual(shrunk.returncode, 0, shrunk.stdout + shrunk.stderr)
        self.assertEqual(self.run_program(*program, BRIMOL_TRACE=str(short)).returncode, -signal.SIGABRT)
        steps = [line for line in short.read_text().splitlines() if line.startswith("+")]
        self.assertLessEqual(len(steps), 20, steps)

    def test_a_crash_on_the_third_screen_is_found_and_made_short(self):
        self.find_and_shrink("1:5000", PLANTED)

    @unittest.skipUnless(PLANTED_DIALOG, "a sanitizer wants to be loaded first")
    def test_a_crash_in_a_dialog_of_the_factory_test_is_found_and_made_short(self):
        settings = f"LD_PRELOAD={PLANTED_DIALOG}", "PLANTED=Not all was tested"
        self.find_and_shrink("1:20000", "env", *settings, FACTORY_TEST, "--stay")

    def test_what_does_not_fail_is_not_made_short(self):
        trace = self.folder / "quiet.trace"
        trace.write_text("brimol-trace 1\n100 down 0 1 1\n200 up 0 1 1\n")
        self.assertIn("does not fail", self.run_program(SHRINK, str(trace), "short", "--", PLANTED).stderr)

    def test_a_hang_is_made_short_where_it_is_asked_for(self):
        trace, short = self.folder / "hang.trace", self.folder / "short.trace"
        trace.write_text("brimol-trace 1\n100 down 0 1 1\n200 up 0 1 1\n300 down 0 7 7\n400 up 0 7 7\n")
        program = "sh", "-c", 'grep -q "down 0 7 7" "$BRIMOL_TRACE" || exit 0; exec sleep 100'
        for wish, says in ("--exit=7", "does not fail"), ("--hangs", "1 steps after"):
            told = self.run_program(SHRINK, wish, "--seconds", "2", str(trace), str(short), "--", *program)
            self.assertIn(says, told.stdout + told.stderr)
        self.assertIn(" down 0 7 7\n", short.read_text())

    def test_the_factory_test_holds_and_does_the_same_again(self):
        traces = []
        for name in "one", "other":
            ended = self.run_program(FACTORY_TEST, "--monkey", "7", "--events", "3000", "--monkey-trace", name)
            self.assertEqual(ended.returncode, 0, ended.stderr)
            traces.append((self.folder / name).read_text())
        self.assertGreater(traces[0].count("\n"), 3000)
        self.assertEqual(traces[0], traces[1])

    def test_a_full_disk_ends_the_trace_and_not_the_session(self):
        ended = self.run_program(FACTORY_TEST, "--monkey", "7", "--events", "200", "--monkey-trace", "/dev/full")
        self.assertEqual(ended.returncode, 0, ended.stderr)
        self.assertEqual(ended.stderr.count("/dev/full: No space left on device"), 1, ended.stderr)

    def test_a_program_that_ignores_everything_is_told_of_though_it_blinks(self):
        for what in [], ["blink"]:
            ended = self.run_program(PLANTED, *what, BRIMOL_MONKEY="8:25000", BRIMOL_SCREEN="30x30")
            self.assertEqual(ended.returncode, 1, ended.stderr)
            self.assertIn("nothing new was shown for 20000 events", ended.stderr)

    def test_wrong_wishes_are_refused(self):
        for wish in "x", "1:", "1:2:3:4", "-1":
            ended = self.run_program(PLANTED, BRIMOL_MONKEY=wish)
            self.assertEqual(ended.returncode, 1, wish)
            self.assertIn(f"BRIMOL_MONKEY={wish}: wanted SEED, SEED:EVENTS or SEED:EVENTS:REST", ended.stderr)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1], verbosity=2)
