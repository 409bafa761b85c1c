"""A copy of a project, in which mutants of its library are built and tested."""

import hashlib
import json
import os
import pathlib
import re
import shutil
import signal
import subprocess
import time

MEMORY = 4 << 30  # bytes that a test may take
FEWEST_SECONDS = 10
SLOWER = 10  # how many times longer than without a mutant a test may take
COMPILE_SECONDS = 600
NO_END = ': no end'  # of a test that was stopped


class Failure(Exception):
    """What the user is told in one line."""


class Build:
    def __init__(self, project, folder, without=()):
        self.project, self.folder, self.without = project, folder, without
        self.build = folder / 'build' / 'mutants'
        self.commands = self.build / 'compile_commands.json'
        self.sources = folder / 'src'
        self.runs = []
        self.clean = {}  # the library's objects: their bytes' hashes, and copies
        self.kept = self.build / 'clean_objects'
        self.mark = self.build / 'mutant_in_work'

    def copy(self):
        """What is the same stays as it is, and so does what was built from it."""
        wanted = {path.relative_to(self.project) for path in self.project.rglob('*')
                  if path.is_file() and path.relative_to(self.project).parts[0] not in ('build', 'out', '.git')}
        for name in wanted:
            source, target = self.project / name, self.folder / name
            if not target.exists() or target.read_bytes() != source.read_bytes():
                target.parent.mkdir(parents=True, exist_ok=True)
                shutil.copy(source, target)
        for path in list(self.folder.rglob('*')):
            name = path.relative_to(self.folder)
            if path.is_file() and name.parts[0] != 'build' and name not in wanted:
                path.unlink()

    def configure(self):
        self.copy()
        environment = {**os.environ, 'CCACHE_BASEDIR': str(self.folder), 'CCACHE_NOHASHDIR': '1'}
        if shutil.which('ccache'):
            environment |= {'CMAKE_C_COMPILER_LAUNCHER': 'ccache', 'CMAKE_CXX_COMPILER_LAUNCHER': 'ccache'}
        self.demand(['cmake', '--preset', 'mutants'], environment)
        return environment

    def make(self):
        """Builds all without a mutant, runs the tests and keeps the library's objects."""
        environment = self.configure()
        self.drop_linked()
        self.demand(['cmake', '--build', '--preset', 'mutants'], environment)
        self.find_runs()
        for run in self.runs:
            begin = time.monotonic()
            killed_by = self.test(run, 600)
            if killed_by:
                raise Failure(f'the tests fail without a mutant: {killed_by}')
            run['seconds'] = time.monotonic() - begin
        shutil.rmtree(self.kept, ignore_errors=True)
        for entry in json.loads(self.commands.read_text()):
            output = re.search(r' -o (\S+)', entry['command'])[1]
            path = self.build / output
            if pathlib.Path(entry['file']).is_relative_to(self.sources) and path.exists():
                copy = self.kept / output
                copy.parent.mkdir(parents=True, exist_ok=True)
                shutil.copy2(path, copy)
                self.clean[output] = hash_of(path)

    def drop_linked(self):
        """There may still be a mutant in it, whose object is gone; in the objects, if that run was killed."""
        if self.mark.exists():
            for path in self.kept.rglob('*.o'):
                (self.build / path.relative_to(self.kept)).unlink(missing_ok=True)
            self.drop_others()
            self.mark.unlink()
        for path in list(self.build.rglob('*')):
            if path.is_file() and 'CMakeFiles' not in path.parts and (path.suffix == '.a' or os.access(path, os.X_OK)):
                path.unlink()

    def drop_others(self):
        """The tests' objects that were made since a header was changed: it gets its time back, and they would stay."""
        begin = self.mark.stat().st_mtime_ns
        for path in list(self.build.rglob('*.o')):
            if path.stat().st_mtime_ns >= begin:
                path.unlink()

    def demand(self, command, environment):
        run = subprocess.run(command, cwd=self.folder, env=environment, stdout=subprocess.PIPE,
                             stderr=subprocess.STDOUT, text=True, check=False)
        if run.returncode != 0:
            lines = [line for line in run.stdout.splitlines() if re.search('error|FAILED', line, re.IGNORECASE)]
            raise Failure((lines or run.stdout.splitlines() or ['it ended without a word'])[0])

    def find_runs(self):
        """The test programs with the environments in which CTest runs them."""
        listed = subprocess.run(['ctest', '--show-only=json-v1'], cwd=self.build, stdout=subprocess.PIPE, check=True)
        found = {}
        for test in json.loads(listed.stdout)['tests']:
            program = pathlib.Path(test.get('command', ['not built'])[0])
            if not program.is_relative_to(self.build) or program.name in self.without:
                continue
            words = next((p['value'] for p in test['properties'] if p['name'] == 'ENVIRONMENT'), [])
            found[program, tuple(words)] = {'program': program, 'words': words}
        if not found:
            raise Failure('there are no tests')
        self.runs = list(found.values())

    def test(self, run, seconds):
        """What fails first, or nothing."""
        name = run['program'].name
        environment = {**os.environ, 'GTEST_FAIL_FAST': '1', 'GTEST_BRIEF': '1',
                       **dict(word.split('=', 1) for word in run['words'])}
        command = ['prlimit', f'--as={MEMORY}', '--core=0', run['program']]
        with subprocess.Popen(command, cwd=run['program'].parent, env=environment, stdin=subprocess.DEVNULL, stdout=subprocess.PIPE,
                              stderr=subprocess.STDOUT, start_new_session=True) as program:
            try:
                output = program.communicate(timeout=seconds)[0].decode(errors='replace')
            except subprocess.TimeoutExpired:
                os.killpg(program.pid, signal.SIGKILL)
                return name + NO_END
        if program.returncode == 0:
            return None
        failed = re.search(r'\[  FAILED  \] ([^\s,]+)', output)
        if failed:
            return f'{name}: {failed[1]}'
        if program.returncode < 0:
            return f'{name}: {signal.Signals(-program.returncode).name}'
        return f'{name}: exit code {program.returncode}'

    def try_mutant(self, point, seen):
        """The mutant's status and what it is due to. `seen`: asks whether an object is another mutant's, too."""
        path = self.folder / point.file
        source, times = path.read_bytes(), path.stat()
        self.mark.touch()
        path.write_bytes(point.apply(source))
        try:
            if not self.ninja(self.clean):
                return 'does not compile', None
            changed = {name: digest for name in self.clean if (digest := hash_of(self.build / name)) != self.clean[name]}
            if not changed:
                return 'same object', None
            if seen(sorted(changed.items())):
                return 'same as another', None
            return self.run_tests(point)
        finally:
            path.write_bytes(source)
            os.utime(path, ns=(times.st_atime_ns, times.st_mtime_ns))
            for name in self.clean:
                shutil.copy2(self.kept / name, self.build / name)
            self.drop_others()
            self.mark.unlink()

    def ninja(self, targets):
        environment = {**os.environ, 'CCACHE_DISABLE': '1'}
        try:
            return subprocess.run(['ninja', '-j1', *targets], cwd=self.build, env=environment, timeout=COMPILE_SECONDS,
                                  stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL, check=False).returncode == 0
        except subprocess.TimeoutExpired:
            return False

    def run_tests(self, point):
        """First the tests of the mutant's own folder, then the quick ones."""
        folder = pathlib.Path(point.file).parent.name

        def away(run):
            return folder not in run['program'].parts

        for run in sorted(self.runs, key=lambda run: (away(run), run['seconds'])):
            if not self.ninja([run['program'].relative_to(self.build)]):
                return 'does not compile', None
            killed_by = self.test(run, SLOWER * run['seconds'] + FEWEST_SECONDS)
            if killed_by:
                return 'killed', killed_by
        return 'survived', None


def hash_of(path):
    return hashlib.sha256(path.read_bytes()).hexdigest()
