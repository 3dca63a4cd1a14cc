#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Makes docs/wire-contract.md of dbus/interfaces/*.xml.

Usage: wire-contract.py          writes the page
       wire-contract.py --check  only says, with status 1, when the page is out of date
"""
import pathlib
import re
import sys
import xml.etree.ElementTree as ElementTree

ROOT = pathlib.Path(__file__).resolve().parent.parent
INTERFACES = ROOT / "dbus" / "interfaces"
PAGE = ROOT / "docs" / "wire-contract.md"

INTRODUCTION = """\
# The wire contract

What clients and the IMS service say to each other on the system bus, for the people who write the
service side. This page is made of the files in [dbus/interfaces](../dbus/interfaces) by
`scripts/wire-contract.py`; the tests hold the files against what the library really sends and
accepts, and against the stand-in.

- The service owns the bus name `org.kelvo.ims` and has one object for each subscription slot:
  `/org/kelvo/ims/sub0`, `/org/kelvo/ims/sub1` and so on. Each object has all interfaces.
- `result` is 0 for success. Clients use 1 and 2 for failures of the bus itself: avoid them.
- Refuse a caller with the error `org.freedesktop.DBus.Error.AccessDenied`.
- Clients wait 60 s for an answer, and 6 s for that of `RegisterApplication` with parameters.
- A reply or signal of another signature than the one here counts as a failure.
- Signals are sent from the object of the slot that they concern.
- `dbus/org.kelvo.ims.conf` is the bus policy: who may own the name, and who may call.
"""


def prose(comment):
    """A comment's paragraphs and list entries as Markdown, each on one line."""
    blocks = re.split(r"\n\s*\n|\n\s*(?=- )", comment.strip())
    blocks = [" ".join(block.split()) for block in blocks]
    text = blocks[0]
    for before, block in zip(blocks, blocks[1:]):
        in_list = before.startswith("- ") and block.startswith("- ")
        text += ("\n" if in_list else "\n\n") + block
    return text


def documented(parent):
    """The children of an element, each with the comment before it."""
    comment = ""
    for child in parent:
        if child.tag is ElementTree.Comment:
            comment = prose(child.text)
            continue
        if not comment and child.tag in ("interface", "method", "signal"):
            sys.exit(f"{child.get('name')} has no comment before it")
        if "\n" in comment and child.tag != "interface":
            sys.exit(f"{child.get('name')} has more to say than a table's cell holds")
        yield child, comment
        comment = ""


def signature(arguments):
    types = "".join(argument.get("type") for argument in arguments)
    names = ", ".join(argument.get("name") for argument in arguments)
    return f"`({types})` {names}".rstrip()


def directed(element, direction):
    return [each for each in element if each.get("direction", "out") == direction]


def table(header, rows):
    lines = [header, ["---"] * len(header), *rows]
    return "".join("| " + " | ".join(cells) + " |\n" for cells in lines)


def section(path):
    parser = ElementTree.XMLParser(target=ElementTree.TreeBuilder(insert_comments=True))
    root = ElementTree.parse(path, parser).getroot()
    for interface, comment in documented(root):
        text = f"\n## {interface.get('name')}\n\n{comment}\n"
        members = list(documented(interface))
        methods = [
            [f"`{each.get('name')}`", signature(directed(each, "in")),
             signature(directed(each, "out")), does]
            for each, does in members if each.tag == "method"
        ]
        signals = [
            [f"`{each.get('name')}`", signature(directed(each, "out")), when]
            for each, when in members if each.tag == "signal"
        ]
        if methods:
            text += "\n" + table(["Method", "In", "Out", "Does"], methods)
        if signals:
            text += "\n" + table(["Signal", "Members", "Says"], signals)
        return text
    sys.exit(f"{path} has no interface")


def main(arguments):
    page = INTRODUCTION + "".join(section(path) for path in sorted(INTERFACES.glob("*.xml")))
    if arguments == ["--check"]:
        if not PAGE.is_file() or PAGE.read_text(encoding="utf-8") != page:
            sys.exit(f"{PAGE.relative_to(ROOT)} is out of date: run scripts/wire-contract.py")
    elif not arguments:
        PAGE.write_text(page, encoding="utf-8")
    else:
        sys.exit(__doc__)


if __name__ == "__main__":
    main(sys.argv[1:])
