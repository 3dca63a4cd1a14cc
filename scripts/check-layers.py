#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Holds the #include lines of the tree against the table of rooms in docs/architecture.md.

Usage: check-layers.py [TREE]

Fails, one line for each, on an include that the table does not allow, on a circle of units, on a
file that no row names, and on names in the table that stand for nothing.
"""
import fnmatch
import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
TABLE = pathlib.PurePosixPath("docs/architecture.md")
COLUMNS = ["Room", "What", "May know", "Others' headers"]

SUFFIXES = {".c", ".cpp", ".h", ".hpp"}
INCLUDE = re.compile(r"^[ \t]*#[ \t]*include[ \t]*([<\"])([^>\"]+)[>\"]")
BLOCK_COMMENT = re.compile(r"/\*.*?\*/", re.DOTALL)
PLACEHOLDER = re.compile(r"<[a-z]+>")
NAME = re.compile(r"`([^`]+)`")
DEFINITION = re.compile(r"- `?([^`:]+)`?: ((?:`[^`]+`(?:, )?)+)\.")
# Beside the C++ library, whose headers have no suffix.
C_LIBRARY = {f"{name}.h" for name in (
    "assert ctype errno float inttypes limits locale math setjmp signal stdarg stdbool stddef "
    "stdint stdio stdlib string time wchar").split()}
# Where an include that is not beside its file is looked for.
ROOTS = ["", "src/", "include/", "platform/"]


class Broken(Exception):
    """The table cannot be read."""


class Room:
    """A row of the table, or what it is for one value of its placeholder."""

    def __init__(self, number, names, known, headers):
        self.number = number    # of the line
        self.names = names      # folders end with a slash
        self.known = known      # None: everything
        self.headers = headers  # None: all

    def closeness(self, path):
        """How closely a name of this room is that of a file. 0 when none is."""
        unit = unit_of(path)
        return max((len(unit) + 1 if name == unit else len(name)
                    for name in self.names
                    if name == unit or (name.endswith("/") and path.startswith(name))), default=0)

    def __str__(self):
        return self.names[0]


def unit_of(path):
    return str(pathlib.PurePosixPath(path).with_suffix(""))


def cells_of(line):
    return [cell.strip() for cell in line.strip().strip("|").split("|")]


def expanded(names, bound):
    return [PLACEHOLDER.sub(lambda found: bound.get(found[0], found[0]), name) for name in names]


class Table:
    """The rooms, and whom each may know."""

    def __init__(self, text):
        lines = text.splitlines()
        self.words = {found[1]: NAME.findall(found[2])
                      for found in map(DEFINITION.match, lines) if found}
        try:
            begin = [cells_of(line) for line in lines].index(COLUMNS)
        except ValueError:
            raise Broken(f"{TABLE}: there is no table | {' | '.join(COLUMNS)} |") from None
        self.rooms = []
        self.places = {}  # of files, as far as they were asked for
        for number, line in enumerate(lines[begin + 2:], begin + 3):
            if not line.startswith("|"):
                break
            self.rooms += self.rooms_of(number, cells_of(line))

    def rooms_of(self, number, cells):
        if len(cells) != len(COLUMNS):
            raise Broken(f"{TABLE}:{number}: a row has {len(COLUMNS)} cells")
        names, known = NAME.findall(cells[0]), NAME.findall(cells[2])
        if not names:
            raise Broken(f"{TABLE}:{number}: a row without a name")
        if not known and cells[2] not in ("nobody", "everything"):
            raise Broken(f"{TABLE}:{number}: {cells[2]!r} is neither names, nobody nor everything")
        known = None if cells[2] == "everything" else known
        headers = self.headers_of(number, cells[3])
        placeholder = PLACEHOLDER.search(cells[0])
        if not placeholder:
            return [Room(number, names, known, headers)]
        return [Room(number, expanded(names, {placeholder[0]: value}),
                     known and expanded(known, {placeholder[0]: value}), headers)
                for value in self.values_of(number, placeholder[0])]

    def headers_of(self, number, cell):
        if cell in ("none", "everything"):
            return None if cell == "everything" else []
        return [pattern for word in cell.split(", ") for pattern in self.values_of(number, word)]

    def values_of(self, number, word):
        if word not in self.words:
            raise Broken(f"{TABLE}:{number}: nothing says what {word} is")
        return self.words[word]

    def room_of(self, path):
        if path not in self.places:
            room = max(self.rooms, key=lambda room: room.closeness(path))
            self.places[path] = room if room.closeness(path) else None
        return self.places[path]

    def named(self, name):
        """What a name in the third column stands for: rooms, or one unit of a room."""
        values = [expanded([name], {found: value})[0]
                  for found in PLACEHOLDER.findall(name) for value in self.words.get(found, [])]
        names = values or [name]
        rooms = [room for room in self.rooms if set(names) & set(room.names)]
        return rooms, names

    def allows(self, room, target):
        """Whether a file of this room may include that file."""
        other = self.room_of(target)
        if other is room or room.known is None:
            return True
        for name in room.known:
            rooms, names = self.named(name)
            if other in rooms or (not rooms and unit_of(target) in names):
                return True
        return False


class Include:
    def __init__(self, path, number, name, target):
        self.path = path
        self.number = number
        self.name = name
        self.target = target  # None: not of this tree

    def __str__(self):
        return f"{self.path}:{self.number}"


def sources_of(root):
    for path in sorted(root.rglob("*")):
        parts = path.relative_to(root).parts
        if path.suffix in SUFFIXES and not parts[0].startswith(("build", ".")):
            yield "/".join(parts)


def includes_of(root, path, sources):
    text = (root / path).read_text(encoding="utf-8")
    text = BLOCK_COMMENT.sub(lambda comment: "\n" * comment[0].count("\n"), text)
    folder = f"{pathlib.PurePosixPath(path).parent}/"
    for number, line in enumerate(text.splitlines(), 1):
        found = INCLUDE.match(line)
        if not found:
            continue
        near = [folder] if found[1] == '"' else []
        target = next((place + found[2] for place in near + ROOTS if place + found[2] in sources),
                      None)
        yield Include(path, number, found[2], target)


def is_standard(header):
    return "." not in header and "/" not in header or header in C_LIBRARY


def forbidden(table, include):
    """What is wrong with an include, or None."""
    room = table.room_of(include.path)
    if include.target:
        if include.target.endswith((".c", ".cpp")):
            return f"{include}: includes {include.target}, which is compiled by itself"
        if not table.room_of(include.target) or table.allows(room, include.target):
            return None
        return f"{include}: {room} may not know {table.room_of(include.target)}, " \
               f"but includes {include.target}"
    if room.headers is None or is_standard(include.name):
        return None
    if any(fnmatch.fnmatchcase(include.name, pattern) for pattern in room.headers):
        return None
    return f"{include}: {room} may not include {include.name}"


def circles(arrows):
    """Circles of a graph {node: {other: where}}, each once, as lists of nodes."""
    found, done = [], set()

    def follow(node, way):
        if node in way:
            found.append(way[way.index(node):])
        elif node not in done:
            for other in sorted(arrows.get(node, {})):
                follow(other, way + [node])
            done.add(node)

    for node in sorted(arrows):
        follow(node, [])
    return found


def unit_circles(includes):
    arrows = {}
    for include in includes:
        ends = unit_of(include.path), include.target and unit_of(include.target)
        if ends[1] and ends[0] != ends[1]:
            arrows.setdefault(ends[0], {}).setdefault(ends[1], include)
    for circle in circles(arrows):
        yield f"{arrows[circle[0]][circle[1]]}: a circle: {' -> '.join(circle + circle[:1])}"


def room_circles(table):
    arrows = {str(room): {str(other): room.number
                          for name in room.known or [] for other in table.named(name)[0]
                          if other is not room}
              for room in table.rooms}
    for circle in circles(arrows):
        yield f"{TABLE}:{arrows[circle[0]][circle[1]]}: a circle of rooms: " \
              f"{' -> '.join(circle + circle[:1])}"


def loose_names(table, sources):
    """Names in the table that stand for nothing."""
    units = {unit_of(path) for path in sources}
    rows = {}
    for room in table.rooms:
        rows.setdefault(room.number, []).append(room)
        for name in room.known or []:
            rooms, names = table.named(name)
            if not rooms and not units & set(names):
                yield f"{TABLE}:{room.number}: {name} is neither a room nor a unit"
    occupied = {table.room_of(path) for path in sources}
    for number, rooms in rows.items():
        if not occupied & set(rooms):
            yield f"{TABLE}:{number}: there is nothing in {rooms[0]}"


def check(root):
    """Everything that is wrong with a tree, one line each."""
    try:
        table = Table((root / TABLE).read_text(encoding="utf-8"))
    except Broken as broken:
        return [str(broken)]
    sources = dict.fromkeys(sources_of(root))
    found = [*loose_names(table, sources), *room_circles(table)]
    found += [f"{path}: no row of {TABLE} names it"
              for path in sources if not table.room_of(path)]
    includes = [include for path in sources if table.room_of(path)
                for include in includes_of(root, path, sources)]
    found += filter(None, (forbidden(table, include) for include in includes))
    return found + list(unit_circles(includes))


def main():
    if len(sys.argv) > 2 or sys.argv[1:2] == ["--help"]:
        sys.exit(__doc__)
    found = check(pathlib.Path(sys.argv[1]) if sys.argv[1:] else ROOT)
    for line in found:
        print(line, file=sys.stderr)
    sys.exit(1 if found else 0)


if __name__ == "__main__":
    main()
