#!/usr/bin/env python3
"""Runs the commands that pages show: every fenced block marked sh, from the root of the repository.

    run_commands.py BUILD PAGE...

BUILD is the build folder, which the pages call build/dev. Stops at the first command that fails, and fails itself if the
pages show no command at all.
"""

import re
import subprocess
import sys
from pathlib import Path

ROOT = Path(__file__).resolve().parent.parent
BLOCK = re.compile(r"^```sh\n(.*?)^```$", re.MULTILINE | re.DOTALL)


def main(build, pages):
    count = 0
    for page in pages:
        for block in BLOCK.findall(Path(page).read_text(encoding="utf-8")):
            commands = block.replace("build/dev", str(Path(build).resolve()))
            result = subprocess.run(["bash", "-euo", "pipefail", "-c", commands], cwd=ROOT, text=True,
                                    stdout=subprocess.PIPE, stderr=subprocess.STDOUT, check=False)
            if result.returncode != 0:
                sys.exit(f"{page}: status {result.returncode} from\n{block}{result.stdout}")
            count += 1
    print(f"{count} blocks of commands run")
    return 0 if count else 1


if __name__ == "__main__":
    if len(sys.argv) < 3:
        sys.exit(__doc__)
    sys.exit(main(sys.argv[1], sys.argv[2:]))
