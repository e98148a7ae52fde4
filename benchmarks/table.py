#!/usr/bin/env python3
"""Runs the benchmark programs and makes one table of them, and one of how times grow with the number of things.

    table.py BUILD [--rounds N] [--page FILE] [FILTER] [--benchmark_...]

BUILD holds the programs. They take turns, round after round, and medians are compared; a page is worth three rounds.
Times are ratios to that of a reference call, which is measured just before each program, so that what else the machine
does falls out of them. A filter is a regular expression for the names, and other options are handed on to the programs.
The runs stay in BUILD/bench.json.
"""
import argparse
import datetime
import json
import math
import pathlib
import re
import statistics
import subprocess
import sys

sys.path.insert(0, str(pathlib.Path(__file__).parent / "peers"))
from peers import number, processor, table

REFERENCE = "FindRoots<5>"

# Which functions of the library are a step of work, by what their names hold; a lambda inside of one is none.
STEPS = {
    "passes": r"LeastSquaresSingleIteration(_2Cubics)?\(",
    "near steps": r"NearRoots::Step\(",
    "polynomials": r"FindRootsBySubdivision<|FindQuadraticRoots\(",
    "polygon cuts": r"SplitBezierT<\d+>::Split\(",
    "roots polished": r"Search<\d+>::AppendCrossing\(",
    "Newton steps": r"StepTogether<",
    "plain Newton searches": r"FindSolutionNewtonsMethod",
    "curve cuts": r"::CutBy<.*",
    "curve points": r"CubicBezier::Evaluate\(\w+::vector2dT",
    "pairs of speed samples": r"::Speed::At\(double __vector",
    "speed samples": r"::Speed::At\(double\)",
}

# Numbers that a benchmark reports beside its time, and that are no work: times, errors, memory.
NO_WORK = {"point", "row", "largest", "rms", "bytes"}


def run(program, *arguments):
    """What Google Benchmark says of a run; the results are missing where a filter leaves nothing."""
    process = subprocess.run([program, "--benchmark_format=json", *arguments], capture_output=True, text=True)
    if process.returncode != 0:
        sys.exit("\n" + (process.stderr or process.stdout))
    return json.loads(process.stdout or '{"benchmarks": []}')


def measure(build, rounds, arguments):
    """All results of all rounds, each with its family and the time of the reference call; and where they were made."""
    programs, results = build / "benchmarks", []
    for turn in range(rounds):
        for program in sorted(programs.glob("*Benchmark")):
            family = program.name.removesuffix("Benchmark")
            print(f"round {turn + 1} of {rounds}: {family:20}", end="\r", file=sys.stderr, flush=True)
            before = run(programs / "RootFinderBenchmark", f"--benchmark_filter=^{REFERENCE}$")
            reference = before["benchmarks"][0]["cpu_time"]
            for result in run(program, "--benchmark_min_time=0.05", *arguments)["benchmarks"]:
                results.append(result | {"family": family, "reference": reference})
    print(file=sys.stderr)
    return results, before["context"]


def count_steps(build):
    """By benchmark: the steps of a call. The program knows functions by their address, and the symbols give the names."""
    program = build / "benchmarks/StepCounts"
    symbols = subprocess.run(["nm", "-C", "--defined-only", program], check=True, capture_output=True, text=True).stdout
    steps, start = {}, 0
    for address, _, name in (line.split(" ", 2) for line in symbols.splitlines()):
        if name == "__executable_start":
            start = int(address, 16)
        for step, pattern in STEPS.items():
            if re.search(pattern + r"[^{]*$", name):
                steps[int(address, 16)] = step
    if renamed := STEPS.keys() - set(steps.values()):
        sys.exit(f"no function of the library is a step of these kinds any more: {renamed}")
    counts = {}
    # Without arrays that are too long to be counted in a moment.
    for result in run(program, "--benchmark_min_time=0", "--benchmark_filter=-/[0-9]{5,}$")["benchmarks"]:
        found = counts.setdefault(result["name"], dict.fromkeys(STEPS, 0))
        for name, count in result.items():
            if name.startswith("@") and int(name[1:]) + start in steps:
                found[steps[int(name[1:]) + start]] += count
    return counts


def work_of(result, steps):
    """What a call finds, and the steps that it takes."""
    standard = {"family_index", "per_family_instance_index", "repetitions", "repetition_index", "threads", "iterations",
                "real_time", "cpu_time", "items_per_second", "reference"}
    found = {name: value for name, value in result.items()
             if isinstance(value, (int, float)) and name not in standard | NO_WORK}
    return ", ".join([f"{number(value)} {name}" for name, value in found.items()] +
                     [f"{number(value)} {name}" for name, value in steps.get(result["name"], {}).items() if value])


def slope(points):
    """The exponent that fits logarithms best, and its standard error."""
    logs = [(math.log(n), math.log(time)) for n, time in points]
    middle_n, middle_time = (statistics.fmean(column) for column in zip(*logs))
    spread = sum((n - middle_n) ** 2 for n, _ in logs)
    exponent = sum((n - middle_n) * (time - middle_time) for n, time in logs) / spread
    rest = sum((time - middle_time - exponent * (n - middle_n)) ** 2 for n, time in logs)
    return exponent, math.sqrt(rest / (len(logs) - 2) / spread)


def tables(results, steps):
    """One row for each benchmark, and one for each that ran from 100 to a million of something."""
    runs = {}
    for result in results:
        runs.setdefault((result["family"], result["name"]), []).append(result)
    rows, grown = [], {}
    for (family, name), group in runs.items():
        time = statistics.median(result["cpu_time"] for result in group)
        ratio = statistics.median(result["cpu_time"] / result["reference"] for result in group)
        work = work_of(group[0], steps)
        if match := re.fullmatch(r"(.*)/(\d+)", name):
            grown.setdefault((family, match[1]), {})[int(match[2])] = ratio, time, work
        else:
            rows.append([family, name, f"{ratio:.3g}", f"{time:.4g}", work])
    sizes, growth = [10 ** k for k in range(2, 7)], []
    for (family, name), by_size in grown.items():
        if set(sizes) <= set(by_size):
            exponent, error = slope([(n, by_size[n][0]) for n in sizes])
            growth.append([family, name, *(f"{by_size[n][1] / n:.3g}" for n in sizes), f"{exponent:.3f} ± {error:.3f}",
                           by_size[1000][2]])
        else:
            rows += [[family, f"{name}/{n}", f"{ratio:.3g}", f"{time:.4g}", work]
                     for n, (ratio, time, work) in by_size.items()]
    return (table(["family", "function", f"time / {REFERENCE}", "ns", "work a call"], rows),
            table(["family", "function", *(f"ns each of 10^{k}" for k in range(2, 7)), "exponent", "work at 1000"], growth))


BEGIN, END = "<!-- bench: begin -->", "<!-- bench: end -->"


def write_page(page, rounds, functions, growth):
    compiler = subprocess.run(["g++", "-dumpfullversion"], capture_output=True, text=True).stdout.strip()
    head = f"Measured on {datetime.date.today()}, {processor()}, GCC {compiler} at -O3, by `./dev bench --rounds {rounds}`."
    text = page.read_text()
    before, after = text[:text.index(BEGIN) + len(BEGIN)], text[text.index(END):]
    page.write_text("\n\n".join([before, head, "### Times and steps", functions, "### Growth", growth, after]))


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build", type=pathlib.Path)
    parser.add_argument("--rounds", type=int, default=1)
    parser.add_argument("--page", type=pathlib.Path)
    arguments, others = parser.parse_known_args()
    if arguments.page and others:
        parser.error("a page takes all functions")
    others = [other if other.startswith("-") else f"--benchmark_filter={other}" for other in others]
    results, context = measure(arguments.build, arguments.rounds, others)
    if not results:
        sys.exit("no function has such a name")
    steps = count_steps(arguments.build)
    kept = arguments.build / "bench.json"
    kept.write_text(json.dumps({"context": context, "steps": steps, "benchmarks": results}, indent=1))
    functions, growth = tables(results, steps)
    print(*(shown for shown in (functions, growth) if shown.count("\n") > 1), sep="\n\n")
    if arguments.page:
        write_page(arguments.page, arguments.rounds, functions, growth)
    print(f"\nthe runs are in {kept}")


if __name__ == "__main__":
    main()
