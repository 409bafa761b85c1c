"""Checks the model of how walks and removals meet: check.py SPIN COMPILER protocol|mistakes

Every interleaving of each scenario is looked at: as the protocol stands nothing may go wrong in any, and each
mistake that can be built in must be found in the scenario beside it.
"""

import pathlib
import re
import subprocess
import sys
import tempfile

SPIN, COMPILER, PART = sys.argv[1:4]
MODEL = pathlib.Path(__file__).with_name("layers.pml").resolve()

SCENARIOS = {
    "two walks, one removes": ["WALKERS=2", "WALKS=1"],
    "walk after walk, one removes": ["WALKERS=1", "WALKS=2"],
    "walks while the layer is made wider": ["WALKERS=1", "WALKS=2", "RENEW"],
    "two handlers delete each other's widgets": ["WALKERS=2", "WALKS=2", "CIRCLE"],
    "three handlers delete in a circle": ["WALKERS=3", "WALKS=1", "CIRCLE"],
    "a widget comes where one was that deleted itself": ["WALKERS=2", "WALKS=1", "REUSE"],
}

MISTAKES = {
    "NO_WAIT": "two walks, one removes",
    "WAIT_BEFORE_CLEARING": "two walks, one removes",
    "CALLED_WITHOUT_COMPARING": "two walks, one removes",
    "COMPARED_BEFORE_PUBLISHING": "two walks, one removes",
    "WAITING_READ_FIRST": "walk after walk, one removes",
    "TURN_NOT_COUNTED": "walk after walk, one removes",
    "NOT_LOOKED_AGAIN": "walk after walk, one removes",
    "OLDER_BLOCKS_FORGOTTEN": "walks while the layer is made wider",
    "PINNED_BLOCKS_FREED": "walks while the layer is made wider",
    "PIN_WITHOUT_COMPARING": "walks while the layer is made wider",
    "CIRCLES_WAIT": "three handlers delete in a circle",
    "NOT_FORGOTTEN": "a widget comes where one was that deleted itself",
    "FORGOTTEN_LATE": "a widget comes where one was that deleted itself",
}


def errors(defines):
    """How many errors there are (the search ends at the first), and what the checker printed."""
    with tempfile.TemporaryDirectory() as folder:
        subprocess.run([SPIN, "-a", *(f"-D{each}" for each in defines), MODEL], cwd=folder, check=True,
                       stdout=subprocess.DEVNULL)
        subprocess.run([COMPILER, "-O1", "-w", "-DSAFETY", "-DCOLLAPSE", "-DMEMLIM=2000", "-o", "pan", "pan.c"],
                       cwd=folder, check=True)
        printed = subprocess.run(["./pan", "-m100000"], cwd=folder, check=True, capture_output=True, text=True).stdout
    complete = "Search not completed" not in printed and "max search depth too small" not in printed
    found = int(re.search(r"errors: (\d+)", printed).group(1))
    return (found if found or complete else None), printed


def main():
    failed = False
    rows = ([(name, defines, 0) for name, defines in SCENARIOS.items()] if PART == "protocol" else
            [(name, [*SCENARIOS[scenario], f"MISTAKE_{name}"], 1) for name, scenario in MISTAKES.items()])
    for name, defines, wanted in rows:
        found, printed = errors(defines)
        states = re.search(r"(\d+) states, stored", printed).group(1)
        print(f"{name}: {found} errors in {states} states", flush=True)
        if found != wanted:
            failed = True
            print(printed)
    return failed


sys.exit(main())
