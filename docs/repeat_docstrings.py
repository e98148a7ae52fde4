#!/usr/bin/env python3
"""Prints a header with the docstring of a declaration repeated before the overloads that share it.

In the headers, declarations that stand together without an empty line share the docstring above the first of them.
Doxygen gives a docstring to the next declaration only, so it reads the headers through this filter. What the compiler makes
by itself, and nobody says anything about, is left out.
"""

import re
import sys

# A declaration that can share a docstring begins so, at the left or inside a type, and ends with a semicolon.
FUNCTION = re.compile(r" *(\[\[nodiscard\]\] )?(ZARNMATH_API|void TransformPoints)\b")


def repeat(lines):
    docstring = []
    reading = False
    inside = False
    for line in lines:
        is_default = line.rstrip().endswith("= default;") and not reading
        if is_default or line.startswith("extern template"):
            line = "\n"  # nothing that a reader would look for
        stripped = line.strip()
        if stripped.startswith("///"):
            if not reading:
                docstring = []
            reading = True
            docstring.append(line)
        elif not inside and not reading and FUNCTION.match(line):
            yield from docstring
        elif not stripped:
            docstring = []
        if not stripped.startswith("///"):
            reading = False
            inside = bool(stripped) and not stripped.endswith((";", "{", "}"))
        yield line


if __name__ == "__main__":
    with open(sys.argv[1], encoding="utf-8") as header:
        sys.stdout.writelines(repeat(header.readlines()))
