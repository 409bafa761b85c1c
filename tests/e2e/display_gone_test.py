"""The desktop goes away while the application runs in a window: display_gone_test.py FACTORY_TEST TRACE

The trace gives verdicts, without a window."""

import os
import pathlib
import subprocess
import sys
import tempfile
import unittest

FACTORY_TEST, TRACE = sys.argv[1:]
BOUND = 60  # seconds


class DisplayGoneTest(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(self.enterContext(tempfile.TemporaryDirectory()))
        said, told = os.pipe()
        self.desktop = self.start("Xvfb", "-displayfd", str(told), "-screen", "0", "800x900x24", pass_fds=[told])
        os.close(told)
        with open(said) as number:
            self.display = ":" + number.readline().strip()

    def start(self, *command, **options):
        process = subprocess.Popen(command, cwd=self.folder, **options)
        self.addCleanup(process.wait, BOUND)
        self.addCleanup(process.kill)
        return process

    def test_the_program_says_so_and_its_results_stay(self):
        results = self.folder / "results.json"
        subprocess.run([FACTORY_TEST, "--headless", "--results", results], env={**os.environ, "BRIMOL_TRACE": TRACE},
                       check=False, timeout=BOUND)
        before = results.read_bytes()
        self.assertIn(b"PASS", before)
        settings = {**os.environ, "DISPLAY": self.display, "BRIMOL_DISPLAY": "window", "BRIMOL_SCREEN": "480x800"}
        program = self.start(FACTORY_TEST, "--results", results, env=settings, stderr=subprocess.PIPE, text=True)
        subprocess.run(["xdotool", "search", "--sync", "--onlyvisible", "--pid", str(program.pid)],
                       env=settings, check=True, timeout=BOUND, stdout=subprocess.DEVNULL)
        self.desktop.kill()
        said = program.communicate(timeout=BOUND)[1]
        self.assertEqual(program.returncode, 1, said)
        self.assertIn(self.display, said)
        self.assertEqual(results.read_bytes(), before)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1], verbosity=2)
