"""Builds the library for many compilers, options and processors, runs its tests, its vectors and its digests there, and
writes what came out into a table of the manual.

    check_everywhere.py [--part PART]... [--jobs N] [--calls N] [TARGET...]

All targets, or those named; `list` names them. The parts are digests, vectors and tests, and without a choice all three.
What was run is put into the target's row in docs/same-bits.md, and the rest of the row stays. The program ends with 1 where
a test or a vector failed, or a function of the arithmetic class gave other bits than those recorded in tests/digests.txt.
"""

import argparse
import datetime
import os
import platform
import re
import subprocess
import sys
from dataclasses import dataclass, field
from pathlib import Path

ROOT = Path(__file__).resolve().parents[2]
PAGE = ROOT / "docs" / "same-bits.md"
DIGESTS = ROOT / "tests" / "digest" / "digests.py"
RECORDED = ROOT / "tests" / "digests.txt"

TABLE_BEGIN = "<!-- table made by ./dev check-all -->"
TABLE_END = "<!-- end of the table -->"
DIFFERENCES_BEGIN = "<!-- differences found by ./dev check-all -->"
DIFFERENCES_END = "<!-- end of the differences -->"
COLUMNS = ["target", "calls", "arithmetic", "platform", "vectors", "C library differs in", "tests"]
NOT_RUN = "not run"

# What is left out needs threads, a heap that can be limited, files of the system or a shared library: these say nothing
# about numbers, and run where the library is built for this machine by ./dev test.
TEST_PROGRAMS = ["UnitTests", "RootFinderLiteralTests"]
PARTS = {"digests": ["zarnmath_digest"], "vectors": ["VectorTests"], "tests": [*TEST_PROGRAMS, "ZarnMathStatic"]}


@dataclass
class Target:
    """One way to build the library and to run it."""

    name: str
    preset: str = "everywhere"
    settings: list = field(default_factory=list)
    emulator: list = field(default_factory=list)
    suffix: str = ""

    @property
    def folder(self):
        return ROOT / "build" / ("everywhere/" + self.name.replace(" ", "") if self.preset == "everywhere" else self.preset)

    def command(self, program):
        folder = "tests/digest" if program == "zarnmath_digest" else "tests"
        return [*self.emulator, str(self.folder / folder / (program + self.suffix))]


def list_targets():
    targets = []
    for compiler, program in (("GCC 12", "g++-12"), ("Clang 14", "clang++-14"), ("Clang 19", "clang++-19")):
        for options in ("-O0", "-O2", "-O3", "-O3 -march=x86-64-v3"):
            targets.append(Target(f"{compiler} {options}", settings=[f"-DCMAKE_CXX_COMPILER={program}",
                                                                     f"-DCMAKE_CXX_FLAGS_RELEASE={options}"]))
    for processor in ("aarch64", "riscv64", "s390x"):
        targets.append(Target(f"{processor}, GCC 12 -O2", processor, emulator=[f"qemu-{processor}"]))
    targets.append(Target("i686, GCC 12 -O2", "i686"))
    targets.append(Target("WebAssembly, emscripten -O2", "wasm", emulator=["node"], suffix=".js"))
    return targets


def run(command, **options):
    return subprocess.run(command, cwd=ROOT, capture_output=True, text=True, check=False, **options)


def build(target, programs, jobs):
    """Whether everything was built; what went wrong is shown."""
    environment = {**os.environ, "NODE_PATH": "/usr/share/nodejs"}
    configure = ["cmake", "--preset", target.preset, "-B", str(target.folder), *target.settings]
    compile_all = ["cmake", "--build", str(target.folder), "--parallel", str(jobs), "--target", *programs]
    for command in (configure, compile_all):
        result = run(command, env=environment)
        if result.returncode != 0:
            print(result.stdout[-4000:], result.stderr[-4000:])
            return False
    return True


def run_tests(target):
    """How many cases passed. A fused instruction counts as a test that failed."""
    passed = 0
    fused = run(["ctest", "--test-dir", str(target.folder), "--output-on-failure", "-R", "^Contraction$"])
    if fused.returncode != 0:
        print(fused.stdout[-4000:])
        return "**fused operations**"
    for program in TEST_PROGRAMS:
        result = run([*target.command(program), "--gtest_brief=1"])
        count = re.search(r"\[  PASSED  \] (\d+) test", result.stdout)
        if result.returncode != 0 or not count:
            print(result.stdout[-4000:], result.stderr[-4000:])
            return f"**{program} failed**"
        passed += int(count.group(1))
    return f"{passed} passed"


def run_vectors(target):
    """How many cases passed, and which functions of the C library are not those of the recording."""
    result = run(target.command("VectorTests"))
    total = re.search(r"All files: (\d+) cases", result.stdout)
    differing = re.findall(r"The platform's (\w+) differs", result.stdout)
    if result.returncode != 0 or not total:
        print(result.stdout[-4000:], result.stderr[-4000:])
        return "**failed**", differing
    return f"{total.group(1)} passed", differing


def run_digests(target, calls):
    """Two cells, and the names of the functions that differ."""
    result = run([sys.executable, str(DIGESTS), "compare", str(RECORDED), calls, *target.command("zarnmath_digest")])
    counts, *names = result.stdout.splitlines() or ["failed"]
    match = re.match(r"(\d+) of (\d+) arithmetic, (\d+) of (\d+) platform$", counts)
    if not match:
        print(result.stdout[-4000:], result.stderr[-4000:])
        return "**failed**", "**failed**", []
    equal, arithmetic, equal_platform, all_platform = match.groups()
    cell = f"{equal} of {arithmetic}"
    return (cell if equal == arithmetic else f"**{cell}**"), f"{equal_platform} of {all_platform}", names


def measure(target, parts, jobs, calls):
    """New cells of the target's row, by column, and the functions that differ there, or None where none was called."""
    if not build(target, [program for part in parts for program in PARTS[part]], jobs):
        return {column: "**not built**" for column in COLUMNS[1:]}, None
    cells, names = {}, None
    if "digests" in parts:
        arithmetic, of_platform, names = run_digests(target, calls)
        cells |= {"calls": calls, "arithmetic": arithmetic, "platform": of_platform}
    if "vectors" in parts:
        cells["vectors"], differing = run_vectors(target)
        cells["C library differs in"] = ", ".join(differing) or "nothing"
    if "tests" in parts:
        cells["tests"] = run_tests(target)
    return cells, names


def between(page, begin, end):
    return page[page.index(begin) + len(begin):page.index(end)]


def cells_of(line):
    return [cell.strip() for cell in line.strip("|").split("|")]


def as_line(cells):
    return "| " + " | ".join(cells) + " |"


def write_row(target, cells):
    """Puts new cells into the target's row, and the row in its place among those of the others."""
    page = PAGE.read_text(encoding="utf-8")
    old = between(page, TABLE_BEGIN, TABLE_END)
    lines = [cells_of(line) for line in old.splitlines() if line.startswith("|")]
    rows = {name: dict(zip(COLUMNS[1:], row)) for name, *row in lines[2:]}
    rows[target.name] = dict.fromkeys(COLUMNS[1:], NOT_RUN) | rows.get(target.name, {}) | cells
    table = [as_line(COLUMNS), as_line(["---"] * len(COLUMNS))]
    table += [as_line([one.name, *rows[one.name].values()]) for one in list_targets() if one.name in rows]
    table += ["", f"Last run on {datetime.date.today():%d %B %Y}, {platform.system()} on {platform.machine()}, "
                  "by `./dev check-all`."]
    PAGE.write_text(page.replace(TABLE_BEGIN + old, "\n".join([TABLE_BEGIN, *table, ""])), encoding="utf-8")


def write_differences(target, names):
    """One line a target: which functions have other digests there."""
    page = PAGE.read_text(encoding="utf-8")
    old = between(page, DIFFERENCES_BEGIN, DIFFERENCES_END)
    lines = {line.split("**")[1]: line for line in old.splitlines() if line.startswith("- **")}
    lines.pop(target.name, None)
    if names:
        lines[target.name] = f"- **{target.name}**: " + ", ".join(f"`{name}`" for name in names)
    ordered = [lines[one.name] for one in list_targets() if one.name in lines]
    page = page.replace(DIFFERENCES_BEGIN + old, DIFFERENCES_BEGIN + "\n" + "".join(line + "\n" for line in ordered))
    PAGE.write_text(page, encoding="utf-8")


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("targets", nargs="*")
    parser.add_argument("--part", action="append", choices=PARTS, dest="parts")
    parser.add_argument("--jobs", type=int, default=2)
    parser.add_argument("--calls", default="100000", help="one of the numbers in the first line of tests/digests.txt")
    arguments = parser.parse_args()
    targets = list_targets()
    if arguments.targets == ["list"]:
        print(*(target.name for target in targets), sep="\n")
        return 0
    chosen = [target for target in targets if not arguments.targets or target.name in arguments.targets]
    is_well = True
    for target in chosen:
        cells, names = measure(target, arguments.parts or list(PARTS), arguments.jobs, arguments.calls)
        print(target.name, *cells.values(), sep="  ", flush=True)
        write_row(target, cells)
        if names is not None:
            write_differences(target, names)
        is_well &= not any("**" in cell for cell in cells.values())
    return 0 if is_well and chosen else 1


if __name__ == "__main__":
    sys.exit(main())
