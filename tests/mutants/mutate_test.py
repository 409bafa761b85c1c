#!/usr/bin/env python3
"""The mutants of a library of two functions: mutate_test.py MUTATE WORK_FOLDER"""

import pathlib
import re
import shutil
import subprocess
import sys
import unittest

MUTATE, WORK = sys.argv[1], pathlib.Path(sys.argv[2])
TINY = pathlib.Path(__file__).parent / 'tiny'


def mutate(*options):
    return subprocess.run([MUTATE, '--project', WORK, *options], text=True, capture_output=True, check=False)


class MutateTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        shutil.rmtree(WORK, ignore_errors=True)
        shutil.copytree(TINY, WORK)
        cls.listed = mutate('--list').stdout

    def number_of(self, line):
        """The number of the mutant that changes a line to this one; to an empty one: of the call that is deleted."""
        return re.search(r'#(\d+) [^#]*\n  \+ ' + re.escape(line) + r'$', self.listed, re.MULTILINE)[1]

    def test_finds_what_can_be_changed_and_nothing_else(self):
        for line in ('void clearLowest(unsigned& bits) { bits |= bits - 1; }',
                     'void clearLowest(unsigned& bits) { bits &= bits + 1; }',
                     'bool isNegative(int number) { return !(number < 0); }',
                     'int count = 1;  // 0 + 0', 'while (bits == 0) {', ';', '--count;'):
            self.number_of(line)
        self.assertNotIn('static_assert', self.listed)
        self.assertEqual(self.listed.count('// 0 + 0'), 2)

    def test_tells_what_became_of_a_mutant(self):
        # The header's first: no test may keep it.
        for line, outcome in (('inline bool isLarge(int number) { return number >= 100; }', 'killed by tiny_tests'),
                              ('--count;', 'killed by tiny_tests: exit code 1'),
                              (';', 'killed by tiny_tests: no end'),
                              ('bool isNegative(int number) { return number <= 0; }', 'survived')):
            with self.subTest(line):
                run = mutate('--only', self.number_of(line))
                self.assertIn(outcome, run.stdout.splitlines()[0])
                self.assertEqual(run.stderr, '')
        self.assertIn('  + bool isNegative(int number) { return number <= 0; }', run.stdout)
        for path in TINY.rglob('*.*'):
            if path.is_file():
                self.assertEqual(path.read_bytes(), (WORK / path.relative_to(TINY)).read_bytes())

    def test_goes_on_where_it_was_interrupted(self):
        first = mutate('--seed', '3', '--count', '2').stdout
        more = mutate('--seed', '3', '--count', '3').stdout
        tried, _, report = more.partition('\n\n')
        self.assertNotIn(tried.splitlines()[0], first)
        self.assertRegex(report, r'Killed \d of 3 mutants')
        self.assertEqual(mutate('--seed', '3', '--count', '3').stdout.strip(), report.strip())

    def test_refuses_wrong_options_in_one_line(self):
        for options in (['--seed', 'x'], ['--count', '0'], ['--jobs', '-1'], ['--only', '1000'], ['--only'], ['more'],
                        ['--list', '--again'], ['--project', WORK / 'none']):
            with self.subTest(options):
                run = mutate(*options)
                self.assertEqual((run.stdout, len(run.stderr.splitlines())), ('', 1))
                self.assertEqual(run.returncode, 1)


if __name__ == '__main__':
    unittest.main(argv=sys.argv[:1])
