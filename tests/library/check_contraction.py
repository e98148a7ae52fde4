"""Looks whether every file of this project is compiled with one rounding per operation.

    check_contraction.py COMPILE_COMMANDS SOURCE_FOLDER [OBJDUMP LIBRARY]

GCC tells a program nothing of -ffp-contract, so that no file can refuse to be compiled without it: the commands are read
instead. With the name of a library, its instructions are looked at too: not one may be a fused multiply-add.
"""

import json
import re
import shlex
import subprocess
import sys
from pathlib import Path

# Each of these allows results that differ in their last bits, or more.
RELAXING = re.compile(r"-(Ofast|f(fast-math|unsafe-math-optimizations|associative-math|reciprocal-math|"
                      r"finite-math-only|no-signed-zeros|no-honor-nans|no-honor-infinities|fp-model=.*|"
                      r"excess-precision=fast|cx-limited-range))$")

# x86, ARM, RISC-V and S/390.
FUSED = re.compile(r"\t(vfn?m(add|sub)\w*|fn?m(add|sub)(\.[sd])?|fml[as]|m[as][ed]br?|wfn?m[as][sd]b)\b")


def trouble_of(arguments):
    """What is wrong with the options of a command, or None. The last of several counts."""
    contraction = [argument for argument in arguments if argument.startswith("-ffp-contract=")]
    if not contraction:
        return "no -ffp-contract=off"
    if contraction[-1] != "-ffp-contract=off":
        return contraction[-1]
    relaxing = [argument for argument in arguments if RELAXING.match(argument)]
    return relaxing[0] if relaxing else None


def check_commands(path, source_folder):
    """The files of the source folder, and of what unity builds make of them."""
    commands = json.loads(Path(path).read_text(encoding="utf-8"))
    checked = 0
    for command in commands:
        file = Path(command["file"])
        is_ours = file.is_relative_to(source_folder) and "googletest" not in file.parts
        if is_ours:
            checked += 1
            trouble = trouble_of(command.get("arguments") or shlex.split(command["command"]))
            if trouble:
                yield f"{file.relative_to(source_folder)}: {trouble}"
    if not checked:
        yield f"{path} names no file of {source_folder}"


def check_instructions(objdump, library):
    listing = subprocess.run([objdump, "-d", "--no-show-raw-insn", library], check=True, capture_output=True,
                             text=True).stdout
    fused = [line.strip() for line in listing.splitlines() if FUSED.search(line)]
    if fused:
        yield f"{len(fused)} fused instructions in {Path(library).name}, the first one {fused[0]}"


def main(commands, source_folder, *binary):
    trouble = list(check_commands(commands, Path(source_folder)))
    if binary:
        trouble += check_instructions(*binary)
    print(*trouble, f"{len(trouble)} in trouble", sep="\n")
    return 1 if trouble else 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
