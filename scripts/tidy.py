#!/usr/bin/env python3
"""Runs clang-tidy over files of the build in one folder: tidy.py BUILD_FOLDER FILE...

clang-tidy spends most of its time on the headers of a file. Files are therefore looked at together, in a source
that includes them; the static analyser knows such sources. Such files may be of several targets: the source sees
the folders and the macros of all of them. Two files that declare the same name at the outermost level do not meet
in one, nor do two targets that give a macro two values or a header's name two files. A finding names the file's own
line.
"""

import glob
import json
import os
import pathlib
import re
import shlex
import subprocess
import sys
from concurrent.futures import ThreadPoolExecutor
from functools import cache

from batches import make_batches

# What they would find is the batch itself: that it includes sources, and that a function's name hides another
# file's. The compiler looks for hidden names in each file by itself.
LEFT_OUT = ('--checks=-bugprone-suspicious-include', '--extra-arg=-Wno-shadow')

# Projects of their own, which tests build.
STAND_ALONE = ('tests/install/outer/', 'tests/install/c_program/', 'tests/mutants/tiny/')


def read_units(folder, files):
    """The options of each of the files, without its own name and what it is compiled to."""
    units = {}
    for entry in json.loads((folder / 'compile_commands.json').read_text()):
        path = os.path.realpath(os.path.join(entry['directory'], entry['file']))
        if path in files:
            command = re.sub(r' -(o|MT|MF) \S+', '', entry['command'])
            units[path] = tuple(word for word in shlex.split(command) if word not in ('-c', '-MD', entry['file']))
    return units


def check_all_known(units, files):
    """What no target of the build compiles would be passed over in silence."""
    unknown = [name for name in files if os.path.realpath(name) not in units and not name.startswith(STAND_ALONE)]
    if unknown:
        sys.exit(f'tidy.py: not of this build: {", ".join(unknown)}')


class Group:
    """Targets whose files, of one language, can be looked at together."""

    def __init__(self, language, options):
        self.language = language  # the files' suffix
        self.others, self.folders, self.macros = self.split(options)
        self.headers = headers_of(self.folders)
        self.paths = []

    @staticmethod
    def split(options):
        """What is neither a folder nor a macro; folders in their order; macros with their values."""
        others, folders, macros = [], {}, {}
        words = iter(options)
        for word in words:
            if word == '-isystem':
                folders['-isystem' + next(words)] = None
            elif word.startswith('-I'):
                folders[word] = None
            elif word.startswith('-D'):
                macros[word.split('=')[0]] = word
            else:
                others.append(word)
        return others, folders, macros

    def takes(self, language, options):
        """Whether these options fit, which the group has then."""
        if language != self.language:
            return False
        _, folders, macros = self.split(options)
        headers = headers_of(folders)
        if any(self.macros.get(name, word) != word for name, word in macros.items()):
            return False
        if any(self.headers.get(name, path) != path for name, path in headers.items()):
            return False
        self.folders |= folders
        self.macros |= macros
        self.headers |= headers
        return True

    def options(self):
        return [*self.others, *self.folders, *self.macros.values()]


def headers_of(folders):
    """What '#include "NAME"' finds in them, by name."""
    headers = {}
    for folder in reversed(list(folders)):
        if folder.startswith('-I'):
            headers |= headers_in(folder.removeprefix('-I'))
    return headers


@cache
def headers_in(folder):
    return {os.path.relpath(path, folder): path for path in glob.iglob(folder + '/**/*.h', recursive=True)}


def batches_of(units):
    """Lists of files, each with options that serve all of its files."""
    paths_by_options = {}
    for path, options in sorted(units.items()):
        paths_by_options.setdefault(options, []).append(path)
    groups = []
    for options, paths in sorted(paths_by_options.items(), key=lambda item: -len(item[1])):
        language = pathlib.Path(paths[0]).suffix
        group = next((each for each in groups if each.takes(language, options)), None)
        if group is None:
            group = Group(language, options)
            groups.append(group)
        group.paths += paths
    return [{'options': group.options(), 'files': files} for group in groups for files in make_batches(group.paths)]


def write_batches(folder, batches):
    """The batches' sources with the list of their options, as clang-tidy reads it."""
    folder.mkdir(exist_ok=True)
    commands = []
    for number, batch in enumerate(batches):
        source = folder / f'batch_{number}{pathlib.Path(batch["files"][0]).suffix}'
        source.write_text(''.join(f'#include "{path}"\n' for path in batch['files']))
        words = [*batch['options'], '-c', str(source)]
        commands.append({'directory': str(folder.parent), 'file': str(source), 'arguments': words})
        batch['source'] = source
    (folder / 'compile_commands.json').write_text(json.dumps(commands))


def look_at(folder, batch):
    """Whether the batch is clean; what is not is printed."""
    command = ['clang-tidy', '-p', folder, '--quiet', '--warnings-as-errors=*', *LEFT_OUT, batch['source']]
    run = subprocess.run(command, stdout=subprocess.PIPE, stderr=subprocess.DEVNULL, text=True, check=False)
    print(run.stdout, end='', flush=True)
    return run.returncode == 0


def main():
    build = pathlib.Path(sys.argv[1]).resolve()
    units = read_units(build, {os.path.realpath(name) for name in sys.argv[2:]})
    check_all_known(units, sys.argv[2:])
    batches = batches_of(units)
    folder = build / 'tidy'
    write_batches(folder, batches)
    print(f'{len(units)} files in {len(batches)} batches', flush=True)
    with ThreadPoolExecutor(os.cpu_count()) as workers:
        return 0 if all(list(workers.map(lambda batch: look_at(folder, batch), batches))) else 1


if __name__ == '__main__':
    sys.exit(main())
