"""The places of C++ sources at which one small change makes another program, as libclang sees them."""

import json
import pathlib
import shlex
from dataclasses import dataclass

import clang.cindex
from clang.cindex import CursorKind, TypeKind

OPERATORS = {
    '==': '!=', '!=': '==', '<': '<=', '<=': '<', '>': '>=', '>=': '>', '&&': '||', '||': '&&',
    '+': '-', '-': '+', '*': '/', '/': '*', '%': '*', '<<': '>>', '>>': '<<', '&': '|', '|': '&', '^': '&',
    '+=': '-=', '-=': '+=', '*=': '/=', '/=': '*=', '%=': '*=', '&=': '|=', '|=': '&=', '^=': '&=',
}
PREFIXES = {'++': '--', '--': '++', '!': '', '-': '', '~': ''}
BRANCHES = {CursorKind.IF_STMT, CursorKind.WHILE_STMT, CursorKind.DO_STMT, CursorKind.FOR_STMT}
BODIES = BRANCHES | {CursorKind.CXX_FOR_RANGE_STMT, CursorKind.CASE_STMT, CursorKind.DEFAULT_STMT}
LOGS = {'print', '__android_log_print'}  # calls that write a line of the log, and no more
BINARY = {CursorKind.BINARY_OPERATOR, CursorKind.COMPOUND_ASSIGNMENT_OPERATOR}


@dataclass(frozen=True, order=True)
class Point:
    """Bytes of a file, and what stands there in the mutant."""
    file: str  # below the project's folder
    begin: int
    end: int
    kind: str
    text: bytes

    def apply(self, source):
        return source[:self.begin] + self.text + source[self.end:]

    def line(self, source):
        return source.count(b'\n', 0, self.begin) + 1

    def describe(self, source):
        """The place, the kind, and the lines before and after."""
        first = source.rfind(b'\n', 0, self.begin) + 1
        last = source.find(b'\n', self.end)
        old = source[first:last]
        new = source[first:self.begin] + self.text + source[self.end:last]
        marked = [f'  {mark} {line.strip()}' for mark, lines in (('-', old), ('+', new))
                  for line in lines.decode().splitlines() if line.strip()]
        return '\n'.join([f'{self.file}:{self.line(source)}: {self.kind}', *marked])


class FilePoints:
    """Collects the points of one file. What a macro makes is left out: it stands elsewhere than it seems to."""

    def __init__(self, name, source):
        self.name, self.source, self.points = name, source, set()

    def add(self, begin, end, kind, text):
        self.points.add(Point(self.name, begin, end, kind, text))

    def visit(self, cursor, parent):
        if cursor.kind == CursorKind.STATIC_ASSERT or (cursor.kind == CursorKind.CALL_EXPR and cursor.spelling in LOGS):
            return
        begin, end = extent(cursor)
        if begin < end:
            self.look_at(cursor, parent, begin, end)
        for child in cursor.get_children():
            self.visit(child, cursor)

    def look_at(self, cursor, parent, begin, end):
        if cursor.kind in BINARY or (cursor.kind == CursorKind.CALL_EXPR and cursor.spelling.startswith('operator')):
            self.flip_operator(cursor)
        elif cursor.kind == CursorKind.UNARY_OPERATOR:
            self.flip_unary(cursor, begin, end)
        elif cursor.kind in (CursorKind.INTEGER_LITERAL, CursorKind.FLOATING_LITERAL):
            self.count_up(begin, end)
        elif cursor.kind == CursorKind.CXX_BOOL_LITERAL_EXPR and parent.kind != CursorKind.RETURN_STMT:
            self.flip_literal(begin, end)
        elif cursor.kind == CursorKind.RETURN_STMT:
            self.flip_result(cursor)
        elif cursor.kind == CursorKind.CONDITIONAL_OPERATOR:
            self.negate(next(cursor.get_children()), 'condition')
        if cursor.kind in BRANCHES:
            self.negate_condition(cursor)
        if cursor.kind in BODIES or cursor.kind == CursorKind.COMPOUND_STMT:
            self.delete_calls(cursor)

    def flip_operator(self, cursor):
        parts = sorted(extent(child) for child in cursor.get_children())
        if len(parts) not in (2, 3):
            return
        begin, end = parts[0][1], parts[-1][0]
        word = self.source[begin:end].strip()
        if word.decode(errors='replace') in OPERATORS:
            begin = self.source.index(word, begin)
            self.add(begin, begin + len(word), 'operator', OPERATORS[word.decode()].encode())

    def flip_unary(self, cursor, begin, end):
        inner = extent(next(cursor.get_children()))
        for first, last in ((begin, inner[0]), (inner[1], end)):
            word = self.source[first:last].strip().decode(errors='replace')
            if word in PREFIXES:
                self.add(first, first + len(word), 'operator', PREFIXES[word].encode())

    def count_up(self, begin, end):
        text = self.source[begin:end]
        if not text[:1].isdigit():
            return
        plain = text.isdigit() and (text == b'0' or text[:1] != b'0')
        self.add(begin, end, 'constant', str(int(text) + 1).encode() if plain else b'(' + text + b' + 1)')

    def flip_literal(self, begin, end):
        other = {b'true': b'false', b'false': b'true'}.get(self.source[begin:end])
        if other:
            self.add(begin, end, 'constant', other)

    def flip_result(self, cursor):
        for value in cursor.get_children():
            if value.type.get_canonical().kind == TypeKind.BOOL:
                self.negate(value, 'result')

    def negate_condition(self, cursor):
        for child in cursor.get_children():
            begin, end = extent(child)
            around = self.before(begin)[-1:] + self.after(end)
            wanted = (b';;',) if cursor.kind == CursorKind.FOR_STMT else (b'()', b';)')
            if child.kind.is_expression() and around in wanted:
                self.negate(child, 'condition')

    def negate(self, value, kind):
        """Where the value is a comparison or a negation, to flip its operator is the same."""
        value = unwrap(value)
        begin, end = extent(value)
        text = self.source[begin:end]
        compared = value.kind in BINARY | {CursorKind.CALL_EXPR} and len(parts := list(value.get_children())) > 1 and \
            self.source[extent(parts[0])[1]:extent(parts[-1])[0]].strip() in (b'==', b'!=')
        if begin < end and not compared and not text.startswith(b'!') and self.is_whole(text):
            self.add(begin, end, kind, b'!(' + text + b')')

    @staticmethod
    def is_whole(text):
        return text.count(b'(') == text.count(b')')

    def delete_calls(self, parent):
        for child in parent.get_children():
            begin, end = extent(child)
            call = unwrap(child)
            before = self.before(begin)
            stands_alone = parent.kind == CursorKind.COMPOUND_STMT or before.endswith((b')', b':', b'else', b'do'))
            if call.kind == CursorKind.CALL_EXPR and is_wanted(call) and \
                    stands_alone and self.after(end) == b';' and self.source[begin:end].endswith(b')'):
                self.add(begin, end, 'call', b'\n' * self.source[begin:end].count(b'\n'))

    def before(self, begin):
        return self.source[max(0, begin - 200):begin].rstrip()

    def after(self, end):
        return self.source[end:end + 200].lstrip()[:1]


def is_wanted(call):
    """No line of the log; not an assignment or the like, which is a call to the compiler alone."""
    return call.spelling not in LOGS and (call.spelling == 'operator()' or not call.spelling.startswith('operator'))


def extent(cursor):
    return cursor.extent.start.offset, cursor.extent.end.offset


def unwrap(cursor):
    """The expression below what the compiler adds, and below a cast to void."""
    while cursor.kind in (CursorKind.UNEXPOSED_EXPR, CursorKind.CSTYLE_CAST_EXPR):
        inner = [child for child in cursor.get_children() if child.kind.is_expression()]
        if len(inner) != 1:
            break
        cursor = inner[0]
    return cursor


def find_points(project, commands, folders):
    """All points of what stands below `folders` and is compiled there, in order. `commands`: how that is done."""
    index = clang.cindex.Index.create()
    files = {}
    for entry in sorted(json.loads(commands.read_text()), key=lambda entry: entry['file']):
        if not is_below(pathlib.Path(entry['file']), folders):
            continue
        unit = index.parse(entry['file'], ['-DNDEBUG', *options_of(entry['command'])])
        errors = [str(found) for found in unit.diagnostics if found.severity >= clang.cindex.Diagnostic.Error]
        if errors:
            raise RuntimeError(errors[0])
        visit_unit(unit, project, folders, files)
    return sorted(point for file in files.values() for point in file.points)


def options_of(command):
    """Those that say what the source means."""
    words = shlex.split(command)
    pairs = zip(words, words[1:])
    return [word for last, word in pairs
            if word.startswith(('-I', '-D', '-std=')) or '-isystem' in (last, word)]


def is_below(path, folders):
    return any(path.is_relative_to(folder) for folder in folders)


def visit_unit(unit, project, folders, files):
    known = set(files)
    for cursor in unit.cursor.get_children():
        path = cursor.location.file and pathlib.Path(cursor.location.file.name)
        if not path or path in known or not is_below(path, folders):
            continue
        if path not in files:
            files[path] = FilePoints(str(path.relative_to(project)), path.read_bytes())
        files[path].visit(cursor, unit.cursor)
