#!/usr/bin/python3
# Debian's Python, since python3-clang is installed for that one.
"""Measures how many small faults the unit tests find: each mutant is the library with one operator, constant,
condition, result or call of src/ or include/MW/detail/ changed; lines of the log are left alone. A seed chooses them.
A mutant is killed if a unit test fails, crashes or does not end; the report says how many do not. One that does not
compile, or that compiles to the same as the original or as a mutant before, does not count: the next one takes its
place.

All is built in build/mutants. The results stand in build/mutants/seed_N.jsonl; a run that was interrupted goes on
from there, until the sources change.
"""

import argparse
import hashlib
import itertools
import json
import pathlib
import random
import signal
import sys
import threading
from concurrent.futures import ThreadPoolExecutor

import mutation_points
from mutant_build import NO_END, Build, Failure
from mutation_points import Point, find_points

COUNTED = ('killed', 'survived')
CHANGED = ('src', 'include/MW/detail')


class Results:
    """What became of each mutant, by its number; in a file as well."""

    def __init__(self, path, digest):
        self.path, self.digest, self.of = path, digest, {}
        self.lock = threading.Lock()
        if not self.read():
            self.path.write_text(json.dumps({'sources': digest}) + '\n')

    def read(self):
        try:
            lines = [json.loads(line) for line in self.path.read_text().splitlines()]
        except (FileNotFoundError, json.JSONDecodeError):
            return False
        if not lines or lines[0].get('sources') != self.digest:
            return False
        self.of = {line['number']: line for line in lines[1:]}
        return True

    def add(self, number, place, status, due_to, objects):
        line = {'number': number, 'place': place, 'status': status, 'by': due_to, 'objects': objects}
        with self.lock:
            self.of[number] = line
            with self.path.open('a') as file:
                file.write(json.dumps(line) + '\n')

    def counted(self, order, count):
        """The first `count` numbers in this order that count; fewer as long as there are no more."""
        return list(itertools.islice((n for n in order if n in self.of and self.of[n]['status'] in COUNTED), count))

    def first_missing(self, order, count, taken):
        """The first number that is neither tried nor taken, or None where enough before it count."""
        for number in order:
            if number in self.of:
                count -= self.of[number]['status'] in COUNTED
            elif number not in taken:
                return number
            if count == 0:
                break
        return None


class Session:
    """Mutants of one project, tried on several builds at once."""

    def __init__(self, project, jobs, without):
        self.project = project
        self.folder = project / 'build' / 'mutants'
        self.builds = [Build(project, self.folder / f'job_{job + 1}', without) for job in range(jobs)]
        self.builds[0].configure()
        self.digest = digest_of(project)
        self.points = self.find()
        self.sources = {point.file: (project / point.file).read_bytes() for point in self.points}
        self.objects = {}  # what mutants were compiled to, and the number of the first
        self.lock = threading.Lock()
        self.stopping = False

    def find(self):
        """Reading all sources takes a while: the points are kept until the sources change."""
        path = self.folder / 'points.json'
        if path.exists():
            kept = json.loads(path.read_text())
            if kept['sources'] == self.digest:
                return [Point(*values[:4], values[4].encode()) for values in kept['points']]
        first = self.builds[0]
        points = find_points(first.folder, first.commands, [first.folder / name for name in CHANGED])
        if not points:
            raise Failure(f'{first.sources}: there is nothing to change')
        values = [(p.file, p.begin, p.end, p.kind, p.text.decode()) for p in points]
        path.write_text(json.dumps({'sources': self.digest, 'points': values}))
        return points

    def describe(self, number):
        point = self.points[number]
        return f'#{number} {point.describe(self.sources[point.file])}'

    def run(self, order, count, results):
        """Tries the mutants in this order until so many count."""
        taken = set()
        for number, line in results.of.items():
            if line['status'] in COUNTED:
                self.objects.setdefault(line['objects'], number)

        def work(build):
            build.make()
            while not self.stopping:
                with self.lock:
                    number = results.first_missing(order, count, taken)
                    taken.add(number)
                if number is None:
                    return
                self.try_one(build, number, results)

        with ThreadPoolExecutor(len(self.builds)) as workers:
            try:
                list(workers.map(work, self.builds))
            finally:
                self.stopping = True

    def try_one(self, build, number, results):
        point = self.points[number]
        objects = None

        def seen(changed):
            nonlocal objects
            objects = hashlib.sha256(repr(changed).encode()).hexdigest()
            with self.lock:
                return self.objects.setdefault(objects, number) != number

        status, due_to = build.try_mutant(point, seen)
        if self.stopping:  # what interrupts this may have killed a test, too
            return
        place = f'{point.file}:{point.line(self.sources[point.file])}'
        results.add(number, place, status, due_to, objects)
        print(f'#{number} {place} {point.kind}: {status}{f" by {due_to}" if due_to else ""}', flush=True)


def digest_of(project):
    """Of the sources and of what looks for points in them."""
    whole = hashlib.sha256(pathlib.Path(mutation_points.__file__).read_bytes())
    for path in sorted(path for name in CHANGED for path in (project / name).rglob('*')):
        if path.is_file():
            whole.update(str(path.relative_to(project)).encode() + b'\0' + path.read_bytes())
    return whole.hexdigest()


def report(session, results, numbers):
    killed = [number for number in numbers if results.of[number]['status'] == 'killed']
    endless = [number for number in killed if results.of[number]['by'].endswith(NO_END)]
    print(f'\nKilled {len(killed)} of {len(numbers)} mutants: {100 * len(killed) / max(1, len(numbers)):.1f} %, '
          f'{len(endless)} of them by the time limit')
    for number in sorted(set(numbers) - set(killed)):
        print(f'survived: {session.describe(number)}')


def number_from(least):
    def read(text):
        if not (text.isascii() and text.isdigit() and least <= int(text) <= 10**9):
            raise argparse.ArgumentTypeError(f"'{text}' is no number from {least} on")
        return int(text)
    return read


class Parser(argparse.ArgumentParser):
    def error(self, message):
        sys.exit(f'mutate.py: {message}')


def parse():
    parser = Parser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter, allow_abbrev=False)
    parser.add_argument('--seed', type=number_from(0), default=1, help='what chooses the mutants; 1')
    parser.add_argument('--count', type=number_from(1), default=300, help='how many have to count; 300')
    parser.add_argument('--jobs', type=number_from(1), default=1, help='how many are tried at once; 1')
    parser.add_argument('--project', type=pathlib.Path, default=pathlib.Path(__file__).parents[1],
                        help="the project's folder, with presets 'mutants' to configure and to build its tests")
    parser.add_argument('--without', action='append', default=[], metavar='PROGRAM',
                        help='a test program to leave out, for a quick look; --again asks it')
    what = parser.add_mutually_exclusive_group()
    what.add_argument('--list', action='store_true', help='lists all possible mutants with their numbers')
    what.add_argument('--only', type=number_from(0), nargs='+', metavar='K',
                      help='tries the mutants of these numbers again')
    what.add_argument('--again', action='store_true', help='tries those again that survived')
    return parser.parse_args()


def choose(session, wanted, results):
    """The order of the mutants, and how many of them have to count."""
    order = list(range(len(session.points)))
    random.Random(wanted.seed).shuffle(order)
    if wanted.only is None:
        return order, wanted.count
    if max(wanted.only) >= len(order):
        raise Failure(f'--only: the last mutant is {len(order) - 1}')
    for number in wanted.only:
        results.of.pop(number, None)
    return wanted.only, len(wanted.only)


def run(wanted):
    project = wanted.project.resolve()
    if not (project / 'src').is_dir():
        raise Failure(f"{wanted.project}: there is no folder 'src'")
    (project / 'build' / 'mutants').mkdir(parents=True, exist_ok=True)
    session = Session(project, wanted.jobs, wanted.without)
    if wanted.list:
        for number in range(len(session.points)):
            print(session.describe(number))
        return
    results = Results(session.folder / f'seed_{wanted.seed}.jsonl', session.digest)
    order, count = choose(session, wanted, results)
    if wanted.again:
        for number in [n for n in results.counted(order, count) if results.of[n]['status'] == 'survived']:
            del results.of[number]
    session.run(order, count, results)
    report(session, results, results.counted(order, count))


if __name__ == '__main__':
    signal.signal(signal.SIGTERM, signal.default_int_handler)
    try:
        run(parse())
    except (Failure, OSError, UnicodeDecodeError) as failure:
        sys.exit(f'mutate.py: {failure}')
    except KeyboardInterrupt:
        sys.exit('mutate.py: interrupted; the same command goes on from here')
