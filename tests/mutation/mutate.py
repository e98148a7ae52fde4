#!/usr/bin/env python3
"""Changes the library in one small place at a time, and sees whether a test notices.

The choice of mutants follows from the text of the sources and a seed alone. Results are keyed by content, so that a run
takes up where the last one stopped, and edits elsewhere in a file leave its results standing. A mutant that does not
compile, or compiles to the same machine code, is none and is not counted.
"""
import argparse
import collections
import csv
import hashlib
import json
import pathlib
import re
import resource
import shlex
import shutil
import subprocess
import sys

from changes import ROOT, chosen, mutants_of

BUILD = ROOT / "build/mutation"
SCRATCH = BUILD / "mutants"
RESULTS = ROOT / "tests/mutation/results.tsv"
FIELDS = ("unit", "line", "occurrence", "mutation", "verdict", "by", "reason")
HEADERS = ("ZarnUtils/interval_vector.h", "ZarnMath/Bezier/Pair.h", "ZarnMath/Bezier/Polynomial.h",
           "ZarnMath/Bezier/PowerForm.h", "ZarnMath/Bezier/RootPolishing.h", "ZarnMath/Bezier/Speed.h",
           "ZarnMath/Bounds.h", "ZarnMath/BezierInternal.h", "ZarnMath/FitBezier/Moments.h",
           "ZarnMath/FitBezier/Passes.h", "ZarnMath/FitBezierInternal.h", "ZarnMath/RootFinder.h",
           "ZarnMath/SmallMatrix.h", "ZarnMath/ValueTypes.h", "ZarnMath/ValueTypesInternal.h",
           "ZarnMath/VectorField.h", "ZarnMath/WMath/Batches.h", "ZarnMath/WMath/WideRegisters.h",
           "ZarnMath/WMathInternal.h")


class Tests:
    """The test programs, those cases first that guard the unit."""

    def __init__(self):
        listing = (ROOT / "tests/CMakeLists.txt").read_text()
        self.sources = {program: files.split() for program, files in
                        re.findall(r"zarnmath_add_test\((\w+)\s+([^)$]+)\)", listing)}
        self.programs = ["VectorTests"] + [p for p in self.sources if p != "VectorTests"]
        self.seconds = {}
        for program in self.programs:
            before = resource.getrusage(resource.RUSAGE_CHILDREN)
            if self.run(program, BUILD / "Engines/ZarnMath", 600):
                sys.exit(f"{program} fails without a change")
            after = resource.getrusage(resource.RUSAGE_CHILDREN)
            self.seconds[program] = after.ru_utime - before.ru_utime + after.ru_stime - before.ru_stime

    def limit(self, program):
        """In seconds of the processor's time, so that a hang ends and a busy machine does no harm."""
        return int(4 * self.seconds[program]) + 3

    def run(self, program, library, seconds, *arguments):
        """Whether the program fails with that library."""
        def limit():
            resource.setrlimit(resource.RLIMIT_CPU, (seconds, seconds + 1))
            resource.setrlimit(resource.RLIMIT_AS, (8 << 30, 8 << 30))
            resource.setrlimit(resource.RLIMIT_CORE, (0, 0))
        path = program if "/" in program else str(BUILD / "tests" / program)
        command = [path, "--gtest_fail_fast", "--gtest_brief=1", *arguments]
        try:
            return subprocess.run(command, env={"LD_LIBRARY_PATH": str(library)}, preexec_fn=limit, timeout=600,
                                  stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL, cwd=SCRATCH).returncode != 0
        except subprocess.TimeoutExpired:
            return True

    def own(self, unit):
        """The test files of a unit, those whose names begin with its name, by program."""
        stem = pathlib.Path(unit).stem.removesuffix("Internal").replace("_", "")
        for program, files in self.sources.items():
            own = [ROOT / "tests" / f for f in files
                   if re.match(stem + r"\w*Test\.cpp", pathlib.Path(f).name, re.IGNORECASE)]
            if own:
                yield program, own

    def killer(self, unit, library):
        """The program that notices the changed library, the unit's own cases first; None where there is none."""
        for program, files in self.own(unit):
            suites = {suite for f in files for suite in re.findall(r"^\w*TEST\w*\((\w+)", f.read_text(), re.M)}
            names = ":".join(f"*{suite}.*:*{suite}/*" for suite in sorted(suites))
            if self.run(program, library, self.limit(program), f"--gtest_filter={names}"):
                return f"own cases in {program}"
        for program in self.programs:
            if self.run(program, library, self.limit(program)):
                return program
        return None


class Bench:
    """Where mutants are built. The tests share the library, so that it alone is linked again."""

    def __init__(self):
        SCRATCH.mkdir(parents=True, exist_ok=True)
        shutil.rmtree(SCRATCH / "Engines", ignore_errors=True)  # what an interrupted run has left
        entries = json.loads((BUILD / "compile_commands.json").read_text())
        self.commands = {entry["file"]: shlex.split(entry["command"]) for entry in entries}
        self.objects = {file: BUILD / command[command.index("-o") + 1] for file, command in self.commands.items()
                        if "ZarnMathObjects" in command[command.index("-o") + 1]}
        self.tests = Tests()

    def compile(self, source, mutated, unit):
        """The object of a source with the mutant in place of its original, or None."""
        command = list(self.commands[source])
        output = SCRATCH / (hashlib.sha256(source.encode()).hexdigest()[:16] + ".o")
        command[command.index("-o") + 1] = str(output)
        if source == str(ROOT / "Engines" / unit):
            command[-1] = str(mutated)
        command[1:1] = ["-w", f"-I{SCRATCH / 'Engines'}", f"-I{SCRATCH}"]
        return output if subprocess.run(command, cwd=BUILD, capture_output=True, check=False).returncode == 0 else None

    def link(self, changed):
        objects = [str(changed.get(file, original)) for file, original in self.objects.items()]
        subprocess.run(["g++", "-shared", "-o", SCRATCH / "libZarnMathStatic.so", *objects], check=True)

    def dependents(self, unit):
        """The library's sources that a file goes into."""
        path = ROOT / "Engines" / unit
        if str(path) in self.objects:
            return [str(path)]
        listing = subprocess.run(["ninja", "-t", "deps"], cwd=BUILD, capture_output=True, text=True, check=True).stdout
        files = {}
        for block in listing.split("\n\n"):
            output, _, inputs = block.partition(":")
            files[str(BUILD / output.strip())] = {(BUILD / name.strip()).resolve() for name in inputs.split("\n")[1:]}
        return [file for file, original in self.objects.items() if path in files[str(original)]]

    def own_program_notices(self, unit, mutated):
        """How the test files of a header, compiled against the changed one, take it."""
        same = True
        for program, files in self.tests.own(unit):
            objects = []
            for file in map(str, files):
                changed = self.compile(file, mutated, unit)
                if changed is None:
                    return "none"
                original = BUILD / self.commands[file][self.commands[file].index("-o") + 1]
                same = same and changed.read_bytes() == original.read_bytes()
                objects.append(changed)
            others = [f for f in self.tests.sources[program] if not f.endswith("Test.cpp")]
            objects += [BUILD / f"tests/CMakeFiles/{program}.dir/{f}.o" for f in others]
            target = SCRATCH / "Own"
            subprocess.run(["g++", "-o", target, *objects, "-lgtest_main", "-lgtest", f"-L{BUILD}/Engines/ZarnMath",
                            "-lZarnMathStatic", "-pthread"], check=True)
            if not same and self.tests.run(str(target), BUILD / "Engines/ZarnMath", self.tests.limit(program)):
                return "killed"
        return "same" if same else "passed"

    def verdict(self, mutant):
        mutated = SCRATCH / "Engines" / mutant.unit
        mutated.parent.mkdir(parents=True, exist_ok=True)
        mutated.write_text(mutant.text)
        try:
            own = "same" if mutant.unit.endswith(".cpp") else self.own_program_notices(mutant.unit, mutated)
            if own in ("none", "killed"):
                return ("no code", "") if own == "none" else ("killed", "own cases, rebuilt")
            changed = {file: self.compile(file, mutated, mutant.unit) for file in self.dependents(mutant.unit)}
        finally:
            mutated.unlink()
        if None in changed.values():
            return "no code", ""
        if own == "same" and all(new.read_bytes() == self.objects[file].read_bytes() for file, new in changed.items()):
            return "same code", ""
        self.link(changed)
        killer = self.tests.killer(mutant.unit, SCRATCH)
        return ("killed", killer) if killer else ("survived", "")


def read_results():
    if not RESULTS.exists():
        return {}
    with RESULTS.open(newline="") as file:
        rows = list(csv.DictReader(file, delimiter="\t", quoting=csv.QUOTE_NONE))
    return {tuple(row[f] for f in FIELDS[:4]): row for row in rows}


def write_results(results):
    rows = ["\t".join(FIELDS)] + ["\t".join(results[key][f] for f in FIELDS) for key in sorted(results)]
    RESULTS.with_suffix(".new").write_text("\n".join(rows) + "\n")
    RESULTS.with_suffix(".new").replace(RESULTS)


def report(results):
    """The tables of the manual."""
    tally = collections.defaultdict(collections.Counter)
    for row in results.values():
        tally[row["unit"]][row["verdict"]] += 1
    print("| unit | mutants | killed | survivors | without effect on the code |\n|---|---:|---:|---:|---:|")
    total = collections.Counter()
    for unit, counts in sorted(tally.items()) + [("all", total)]:
        killed, survived, same = counts["killed"], counts["survived"], counts["same code"]
        print(f"| {unit} | {killed + survived} | {killed} | {survived} | {same} |")
        total += counts if unit != "all" else {}
    print("\n| unit | line | became | why no test can tell |\n|---|---|---|---|")
    code = lambda text: "`" + text.replace("|", "\\|") + "`"
    for row in results.values():
        if row["verdict"] == "survived":
            print(f"| {row['unit']} | {code(row['line'])} | {code(row['mutation'])} | {row['reason']} |")


def main():
    sources = sorted(str(p.relative_to(ROOT / "Engines")) for p in (ROOT / "Engines").rglob("*.cpp"))
    parser = argparse.ArgumentParser(description=__doc__.split("\n")[0])
    parser.add_argument("--units", nargs="+", help="parts of the names of the files to change; default: all")
    parser.add_argument("--except", nargs="+", dest="excepted", default=[], help="parts of the names to leave out")
    parser.add_argument("--count", type=int, default=900, help="how many changes to try, over all units (default 900)")
    parser.add_argument("--seed", default="1", help="another seed chooses other mutants")
    parser.add_argument("--again", action="store_true", help="try those again that have survived")
    parser.add_argument("--list", action="store_true", help="print what would be tried")
    parser.add_argument("--report", action="store_true", help="print the tables of the results")
    arguments = parser.parse_args()
    wanted = lambda unit: (not arguments.units or any(name in unit for name in arguments.units)) and \
        not any(name in unit for name in arguments.excepted)
    known = read_results()
    every = {unit: {m[:4]: m for m in mutants_of(unit)} for unit in [*sources, *HEADERS]}
    known = {key: row for key, row in known.items() if key in every.get(key[0], {})}
    if arguments.report:
        return report(known)
    todo = []
    for mutants, share in chosen([*sources, *HEADERS], arguments.count, arguments.seed):
        todo += [m for m in mutants[:share] if wanted(m.unit) and m[:4] not in known]
    if arguments.again:
        todo = [every[key[0]][key] for key, row in known.items() if row["verdict"] == "survived" and wanted(key[0])]
    if arguments.list:
        for mutant in todo:
            print("\t".join(mutant[:5]))
        return None
    bench = Bench()
    for number, mutant in enumerate(todo, 1):
        verdict, by = bench.verdict(mutant)
        reason = known.get(mutant[:4], {}).get("reason", "") if verdict == "survived" else ""
        print(f"{number}/{len(todo)} {mutant.unit}: {mutant.mutation}: {verdict} {by}", flush=True)
        known = {**read_results(), mutant[:4]: dict(zip(FIELDS, (*mutant[:4], verdict, by, reason)))}
        write_results({key: row for key, row in known.items() if key in every.get(key[0], {})})
    open_ones = [row for row in known.values() if row["verdict"] == "survived" and not row["reason"]]
    print(f"{len(open_ones)} survivors without a reason")
    return None


if __name__ == "__main__":
    main()
