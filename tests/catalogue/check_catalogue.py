"""Compares three lists of the exported functions: the catalogue, the shared library, and the headers with the class that
each docstring ends in.

    check_catalogue.py PROGRAM NM LIBRARY HEADERS

PROGRAM lists the catalogue (zarnmath_digest), HEADERS is the folder of the public headers.
"""

import subprocess
import sys
from pathlib import Path

import headers
import names


def list_catalogue(program):
    """The class of each function by its name."""
    output = subprocess.run([program, "list"], check=True, capture_output=True, text=True).stdout
    rows = (line.split("\t") for line in output.splitlines())
    return {name: number_class for name, _, number_class in rows}


def read_headers(folder):
    """The declarations of the public headers, each with the last line of its docstring."""
    found = {}
    for path in sorted(Path(folder).glob("*.h")):
        if path.stem.endswith("Internal") or path.stem == "PlainC":
            continue
        lines = path.read_text(encoding="utf-8").splitlines()
        for declaration in headers.declarations(path):
            last = lines[declaration.docstring[-1] - 1].strip() if declaration.docstring else ""
            found[declaration.name] = (declaration.place, last.removeprefix("/// "))
    return found


def compare_with_library(catalogue, exported):
    """A function with C linkage is exported without its parameters."""
    as_exported = {names.without_parameters(name) if names.without_parameters(name) in exported else name
                   for name in catalogue}
    yield from (f"exported, and not in the catalogue: {name}" for name in sorted(exported - as_exported))
    yield from (f"in the catalogue, and not exported: {name}" for name in sorted(as_exported - exported))


def compare_with_headers(catalogue, declared):
    yield from (f"in the catalogue, and in no header: {name}" for name in sorted(catalogue.keys() - declared.keys()))
    for name, (place, last) in sorted(declared.items()):
        if name not in catalogue:
            yield f"{place}: {name} is not in the catalogue"
        elif last != f"@{catalogue[name]}":
            yield f"{place}: the docstring of {name} should end in a line @{catalogue[name]}"


def main(program, nm, library, header_folder):
    catalogue = list_catalogue(program)
    trouble = [*compare_with_library(catalogue, names.exported(nm, library)),
               *compare_with_headers(catalogue, read_headers(header_folder))]
    print(*trouble, f"{len(catalogue)} functions: {len(trouble)} in trouble", sep="\n")
    return 1 if trouble else 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
