"""The desktop goes away while the application runs in a window: display_gone_test.py FACTORY_TEST TRACE

The trace gives a verdict from the menu on."""

import json
import os
import pathlib
import subprocess
import sys
import tempfile
import time
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
        trace = self.folder / "verdict.trace"
        trace.write_text(f"brimol-trace 1\nwait until text \"Factory test\"\ninclude {TRACE}\nwait 86400000\n")
        settings = {"DISPLAY": self.display, "BRIMOL_DISPLAY": "window", "BRIMOL_SCREEN": "480x800", "BRIMOL_CLOCK": "paced",
                    "BRIMOL_TRACE": trace, "BRIMOL_TRACE_ROOT": pathlib.Path(TRACE).parent}
        results = self.folder / "results.json"
        program = self.start(FACTORY_TEST, "--results", results, env=os.environ | settings, stderr=subprocess.PIPE,
                             text=True)
        while not results.exists() or b"PASS" not in results.read_bytes():
            self.assertIsNone(program.poll(), "it has ended")
            time.sleep(0.05)
        self.desktop.kill()
        said = program.communicate(timeout=BOUND)[1]
        self.assertEqual(program.returncode, 1, said)
        self.assertIn(self.display, said)
        self.assertEqual([each["verdict"] for each in json.loads(results.read_text())["results"]], ["PASS"])


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1], verbosity=2)
