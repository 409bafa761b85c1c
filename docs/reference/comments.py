"""Shows Doxygen a header as this project comments it: comments.py HEADER

A comment above declarations documents those below it up to a blank line or the next comment; one
that begins with `///` does not document overrides behind the first line, since their base does. A
`//` comment with a blank line below it documents all that follow it and have no comment, up to the
next one of its kind. A comment beside a declaration documents it, however it begins.
"""
import re
import sys

SCOPE = re.compile(r"\s*((inline )?namespace|(typedef )?(class|struct|union)|extern)\b")
LABEL = re.compile(r"\s*(public|protected|private):$")
NOT_DOCUMENTED = re.compile(
    r"\s*(#(?!define MW)|}|///<|namespace|extern|using [\w:]+;|friend|static_assert|BRIMOL_STATIC)")


class Header:
    def __init__(self, lines):
        self.lines = lines
        self.at = 0
        self.braces = []  # whether each open brace holds declarations
        self.statement = ""  # the part of a declaration that was read
        self.forget()

    def forget(self):
        self.own, self.group, self.is_first, self.is_plain = [], [], True, False

    def read_comment(self):
        """The words of the comment at hand."""
        words = []
        is_block = self.lines[self.at].lstrip().startswith("/*")
        mark = "/*" if is_block else re.match(r"\s*(///?)", self.lines[self.at]).group(1)
        while True:
            line = self.lines[self.at].strip()
            words.append(re.sub(r"^(/\*+|\*(?!/)|///?) ?|\s*\*/$", "", line))
            self.at += 1
            following = self.lines[self.at].strip()
            if "*/" in line if is_block else not re.match(mark + "(?!/)", following):
                return [word for word in words if not word.startswith("NOLINT")], mark != "///"

    def take_comment(self):
        begins_file = self.at == 0
        words, is_plain = self.read_comment()
        if not words:
            return
        if begins_file:
            self.document(["\\file"] + words)
        elif is_plain and not self.lines[self.at].strip():
            self.own, self.group = [], words
        else:
            self.own, self.is_plain, self.is_first = words, is_plain, True

    @staticmethod
    def document(words):
        print("\n".join(("/// " + word).rstrip() for word in words))

    def take_line(self):
        line = self.lines[self.at]
        self.at += 1
        if LABEL.match(line):
            self.forget()
        elif not line.strip():
            self.own = []
        elif all(self.braces) and not self.statement and not NOT_DOCUMENTED.match(line):
            inherits = "override" in line and not (self.own and (self.is_first or self.is_plain))
            if (self.own or self.group) and not inherits:
                self.document(self.own or self.group)
            self.is_first = False
        print(re.sub(r"([^\s}])\s+(//(?!/)|/\*)\s*(?!NOLINT)(.*?)( \*/)?$", r"\1  ///< \3", line))
        self.follow(re.sub(r"//.*|/\*.*?\*/", "", line).strip())

    def follow(self, code):
        """Keeps in mind which braces are open, and whether a declaration has ended."""
        if code.startswith("#") or LABEL.match(code):
            return
        self.statement += code
        for brace in re.findall("[{}]", code):
            if brace == "}":
                self.braces.pop()
            else:
                self.braces.append(bool(SCOPE.match(self.statement)) and "(" not in self.statement)
                if self.braces[-1]:
                    self.forget()
        if self.statement.endswith((";", "}")) or (code.endswith("{") and self.braces[-1]):
            self.statement = ""

    def show(self):
        while self.at < len(self.lines):
            stands_free = all(self.braces) and not self.statement
            if stands_free and re.match(r"\s*/[/*](?!/<)", self.lines[self.at]):
                self.take_comment()
            else:
                self.take_line()


with open(sys.argv[1], encoding="utf-8") as file:
    Header(file.read().splitlines()).show()
