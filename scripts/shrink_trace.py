#!/usr/bin/env python3
"""Makes a trace under which a program fails as short as it goes: shrink_trace.py TRACE SHORT -- PROGRAM [ARGUMENT...]

The program is run under ever shorter traces (BRIMOL_TRACE, without a window). A run counts as the same failure
if it ends by the same signal, or, before the names, with --exit CODE, with that exit code, or, with --hangs, if it has
not ended after --seconds. What is left goes to SHORT: without any line of it the failure does not come. What a monkey
judges of a session that it plays itself, such as that nothing new is shown, a trace does not bring back.
"""

import argparse
import os
import pathlib
import re
import subprocess
import sys
import tempfile

STEP = re.compile(r"(\d+) (.+)")
SHORT_PAUSE = 1000  # ms; what most applications do by themselves takes less
FEW = 8  # steps of one gesture


class Shrinker:
    def __init__(self, program, wanted):
        self.program, self.code, self.hangs, self.seconds = program, wanted.exit, wanted.hangs, wanted.seconds
        self.folder = tempfile.TemporaryDirectory()
        self.trace = pathlib.Path(self.folder.name, "try.trace")
        self.runs = 0

    def fails(self, head, steps):
        """Whether the program fails as wanted under these steps."""
        self.runs += 1
        self.trace.write_text("".join(head) + "".join(f"+{pause} {words}\n" for pause, words in steps))
        environment = {**os.environ, "BRIMOL_TRACE": str(self.trace), "BRIMOL_DISPLAY": "headless"}
        try:
            ended = subprocess.run(self.program, env=environment, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
                                   stdin=subprocess.DEVNULL, timeout=self.seconds, check=False).returncode
        except subprocess.TimeoutExpired:
            return self.hangs
        if self.hangs:
            return False
        if self.code is None and ended < 0:
            self.code = ended  # from here on the same signal
        return ended == self.code

    def shrink(self, head, steps):
        """Leaves out parts, large ones first, until no single step and no few in a row can go."""
        size = max(len(steps) // 2, 1)
        while size > 0:
            before = len(steps)
            steps = self.leave_out(head, steps, size)
            # What is gone may have been what a larger part was needed for.
            size = min(FEW, before // 2) if size == 1 and len(steps) < before else size // 2
        shorter = [(min(pause, SHORT_PAUSE), words) for pause, words in steps]
        return shorter if self.fails(head, shorter) else steps

    def shorten_end(self, head, steps):
        """The head, with less time after the last step if that is well: all runs that do not fail last until then."""
        short = [re.sub(r"^linger \d+", "linger 500", line) for line in head]
        return short if short != head and self.fails(short, steps) else head

    def leave_out(self, head, steps, size):
        """Goes over the steps once, and leaves out every part of this size without which the failure comes."""
        start = 0
        while start < len(steps):
            rest = self.without(head, steps, start, start + size)
            if rest is None:
                start += size
                continue
            steps = rest
            print(f"{len(steps)} steps", flush=True)
        return steps

    def without(self, head, steps, start, end):
        """The steps without a part, if the failure comes: the others at their times, or else earlier."""
        before, gone, after = steps[:start], steps[start:end], steps[end:]
        if after:
            pause = sum(each for each, _ in gone) + after[0][0]
            later = before + [(pause, after[0][1])] + after[1:]
            if self.fails(head, later):
                return later
        return before + after if self.fails(head, before + after) else None


def read(path):
    """The lines at the head, and the steps, each with the pause before it."""
    head, steps, last = [], [], 0
    for line in path.read_text().splitlines(keepends=True):
        found = STEP.fullmatch(line.strip())
        if not found:
            head.append(line)
            continue
        time = int(found[1])
        steps.append((time - last, found[2]))
        last = time
    return head, steps


def main():
    parser = argparse.ArgumentParser(description=__doc__.split(":")[0], usage=__doc__.splitlines()[0].split(": ")[1])
    failure = parser.add_mutually_exclusive_group()
    failure.add_argument("--exit", type=int, help="the exit code of the failure, instead of a signal")
    failure.add_argument("--hangs", action="store_true", help="the failure is that a run takes longer than --seconds")
    parser.add_argument("--seconds", type=float, default=60, help="how long a run may take; 60")
    parser.add_argument("trace", type=pathlib.Path)
    parser.add_argument("short", type=pathlib.Path)
    parser.add_argument("program", nargs="+")
    wanted = parser.parse_args()
    try:
        head, steps = read(wanted.trace)
    except (OSError, UnicodeDecodeError) as error:
        sys.exit(f"shrink_trace.py: {wanted.trace}: {getattr(error, 'strerror', None) or error}")
    shrinker = Shrinker(wanted.program, wanted)
    if not shrinker.fails(head, steps):
        sys.exit(f"shrink_trace.py: {wanted.trace}: the program does not fail under it")
    head = shrinker.shorten_end(head, steps)
    steps = shrinker.shrink(head, steps)
    wanted.short.write_text("".join(head) + "".join(f"+{pause} {words}\n" for pause, words in steps))
    print(f"{len(steps)} steps after {shrinker.runs} runs: {wanted.short}")


main()
