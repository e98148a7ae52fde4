#!/usr/bin/env python3
"""Makes the manual.

    build_manual.py FIGURES OUTPUT

FIGURES is the program that draws the figures, OUTPUT the folder that gets the manual: html/index.html is its first page.
The docstrings of the exported functions are checked on the way. Fails if anything is amiss: a figure that a page shows and
nobody draws, a reference that leads nowhere, a docstring that leaves something out.
"""

import os
import re
import shutil
import subprocess
import sys
from pathlib import Path

import check_docstrings

ROOT = Path(__file__).resolve().parent.parent
EXPORTED = ROOT / "tests/library/ExportedSymbols.txt"


def version():
    text = (ROOT / "CMakeLists.txt").read_text(encoding="utf-8")
    return re.search(r"project\(ZarnMath VERSION ([\d.]+)", text)[1]


def main(figures, output):
    output = Path(output).resolve()
    shutil.rmtree(output, ignore_errors=True)
    (output / "figures").mkdir(parents=True)
    subprocess.run([figures, output / "figures"], check=True)
    environment = dict(os.environ, MANUAL_VERSION=version(), MANUAL_OUTPUT=str(output))
    subprocess.run(["doxygen", "docs/Doxyfile"], cwd=ROOT, env=environment, check=True)
    return check_docstrings.main(output / "xml", EXPORTED)


if __name__ == "__main__":
    if len(sys.argv) != 3:
        sys.exit(__doc__)
    try:
        sys.exit(main(Path(sys.argv[1]).resolve(), sys.argv[2]))
    except subprocess.CalledProcessError as trouble:
        sys.exit(f"build_manual.py: {trouble}")
