"""Translates a catalogue into the made-up language: pseudo.py TEMPLATE CATALOGUE

Every letter gets an accent, and a text grows by a third, which is what translations do. What printf reads, and
line ends, stay as they are.
"""

import re
import sys

import polib

ACCENTS = str.maketrans("AaEeIiOoUuCcNnSsYyZz", "ÅåÉéÍíÖöÛûÇçÑñŠšÝýŽž")
FORMAT = re.compile(r"(%[-+ 0#]*[0-9*]*(?:\.[0-9*]+)?[hlzjt]*[a-zA-Z%])")


def pseudo(text):
    lines = []
    for line in text.split("\n"):
        parts = FORMAT.split(line)
        accented = "".join(part if number % 2 else part.translate(ACCENTS) for number, part in enumerate(parts))
        lines.append(accented + "·" * (sum(map(len, parts[::2])) // 3))
    return "\n".join(lines)


catalogue = polib.pofile(sys.argv[1])
catalogue.metadata = {"Language": "xx", "Content-Type": "text/plain; charset=UTF-8",
                      "Content-Transfer-Encoding": "8bit", "Plural-Forms": "nplurals=2; plural=(n != 1);"}
for entry in catalogue:
    if entry.msgid_plural:
        entry.msgstr_plural = {0: pseudo(entry.msgid), 1: pseudo(entry.msgid_plural)}
    else:
        entry.msgstr = pseudo(entry.msgid)
catalogue.save(sys.argv[2])
