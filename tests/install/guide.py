"""The guide as a script that does what it says, in the folder it runs in: guide.py GUIDE.

A fenced block of commands runs, in one shell; one of output has to be found in what the last commands
wrote. Any other is a file, named by the first code in the line above it; it is appended to a file that
is already there. What is used by hand is played, since nobody is there.
"""
import re
import shlex
import sys

BLOCK = re.compile(r"^(.*)\n\n?```(\w+)(.*)\n((?:.*\n)*?)```$", re.MULTILINE)
HEAD = """set -euo pipefail
failed() { cat "$HOME/output" >&2; echo "The guide does not do what it says: $1" >&2; exit 1; }
trap 'failed "line $LINENO"' ERR
"""


def main():
    with open(sys.argv[1], encoding="utf-8") as file:
        guide = file.read()
    print(HEAD)
    for above, language, use, body in BLOCK.findall(guide):
        if language == "sh":
            play = "export BRIMOL_TRACE=$HOME/by_hand.trace\n"
            print("{\n" + (play if use else "") + body + "unset BRIMOL_TRACE\n}", '>"$HOME/output" 2>&1')
        elif language == "output":
            for line in body.splitlines():
                print(f"grep -qF -- {shlex.quote(line)} \"$HOME/output\" || failed {shlex.quote(line)}")
        else:
            name = re.search(r"`([^`]+)`", above)[1]
            print(f"cat >>{name} <<'END_OF_FILE'\n{body}END_OF_FILE")


main()
