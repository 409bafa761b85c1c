"""Sources that can be compiled as one: files of a batch are included in one source.

As a program it reads lines `TARGET;FILE;FILE...` and writes the CMake commands that make batches of each
target's files: batches.py < TARGETS > COMMANDS
"""

import pathlib
import re
import sys

MOST_FILES = 12
# Of a line that starts at the margin, as every declaration outside functions and classes does here: what
# stands before the first sign that ends a declared name.
DECLARED = re.compile(r'^(?:extern "C" )?(?!namespace\b)[A-Za-z_][\w:<>,&* ]*?(?<!:)\b(\w+)(?:\[[^\]]*\])? ?(?:[=({;]|$)', re.MULTILINE)


def make_batches(paths):
    """Lists of the files: two that declare the same name at the outermost level do not meet in one."""
    batches = []
    for path in paths:
        text = pathlib.Path(path).read_text().replace('BENCHMARK_MAIN();', 'int main(')
        names = set(DECLARED.findall(text))
        for files, taken in batches:
            if len(files) < MOST_FILES and not names & taken:
                break
        else:
            files, taken = [], set()
            batches.append((files, taken))
        files.append(path)
        taken |= names
    return [files for files, _ in batches]


def main():
    for line in sys.stdin:
        target, *paths = line.rstrip('\n').split(';')
        for number, files in enumerate(make_batches(paths)):
            if len(files) < 2:
                continue
            names = ' '.join(f'"{path}"' for path in files)
            print(f'set_source_files_properties({names} TARGET_DIRECTORY {target}')
            print(f'                            PROPERTIES UNITY_GROUP {target}_{number})')


if __name__ == '__main__':
    main()
