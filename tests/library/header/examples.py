#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Compiles the examples in a header's comments, each by itself.

Usage: examples.py HEADER COMPILER [ARGUMENT...]    what compiles C from standard input
"""
import pathlib
import re
import subprocess
import sys


def examples(text):
    """The blocks of code, each with the number of its first line."""
    for block in re.finditer(r"^ \* @code\{\.c\}\n(.*?)^ \* @endcode$", text, re.DOTALL | re.MULTILINE):
        code = re.sub(r"^ \* ?", "", block.group(1), flags=re.MULTILINE)
        yield text.count("\n", 0, block.start(1)) + 1, code


def main(header, *compiler):
    text = pathlib.Path(header).read_text(encoding="utf-8")
    found = list(examples(text))
    if not found or len(found) != text.count("@code"):
        sys.exit(f"{header}: {len(found)} examples in C, {text.count('@code')} blocks of code")
    failed = 0
    for line, code in found:
        # Messages name the header and the line there.
        unit = f'#line {line} "{header}"\n{code}'
        failed += subprocess.run(compiler, input=unit, text=True, check=False).returncode != 0
    print(f"{header}: {len(found)} compiled, {failed} failed")
    sys.exit(failed != 0)


if __name__ == "__main__":
    if len(sys.argv) < 3:
        sys.exit(__doc__)
    main(*sys.argv[1:])
