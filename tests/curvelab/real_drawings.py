#!/usr/bin/env python3
"""Runs every command of curvelab on drawings that people made: the SVG files of icon themes.

    real_drawings.py CURVELAB [--each COUNT] [--jobs COUNT] [--write PAGE] FOLDER...

Of each FOLDER it takes COUNT different files (120), spread evenly over all that are below it. A run has to end with status
0, a picture that is XML and numbers that are finite; or with status 2 and one of the reasons that are listed here with
what is behind them. Anything else fails. --write makes the page of the totals.
"""

import argparse
import collections
import concurrent.futures
import datetime
import hashlib
import json
import math
import os
import platform
import re
import subprocess
import sys
import tempfile
import textwrap
import xml.etree.ElementTree

# What each command is asked, in units of a hundred thousandth of the drawing.
QUESTIONS = {
    "flatten": ["--tolerance", "100"],
    "split": ["--at", "0.4"],
    "closest": ["--to", "30000,60000"],
    "curvature": [],
    "length": ["--spacing", "1000"],
    "bounds": [],
    "intersect": [],
    "tangents": ["--to", "50000,-12000"],
    "area": [],
    "cusps": ["--distance", "1000"],
    "transform": ["--by", "rotate:30 scale:2,1 skew:10,0"],
    "offset": ["--distance", "1000"],
    "fit": ["--tolerance", "100"],
    "smooth": [],
    "report": [],
}

# Members of the answers that are added up, and those of which the largest is kept.
SUMS = {
    "flatten": {"segments": "segments"},
    "split": {"pieces": "pieces"},
    "curvature": {"inflections": "inflections", "speedExtremes": "extremes of speed"},
    "length": {"points": "points set"},
    "bounds": {"extremesOfX": "extremes of x", "extremesOfY": "extremes of y"},
    "intersect": {"crossings": "crossings", "selfCrossings": "of a curve with itself",
                  "contacts": "ends on other curves", "pairsAsked": "pairs asked"},
    "tangents": {"tangents": "tangents"},
    "area": {"closedContours": "closed contours"},
    "cusps": {"cusps": "cusps"},
    "offset": {"cubics": "cubics"},
    "fit": {"cubics": "cubics", "points": "points"},
    "smooth": {"smoothed": "joints smoothed"},
}
WORST = {
    "flatten": {"largestDeviation": "farthest from a curve"},
    "split": {"largestGap": "largest gap"},
    "length": {"largestDifference": "farthest from a polyline's length"},
    "bounds": {"largestExcess": "farthest outside a box"},
}

# What a message may say, and what is behind it.
REASONS = [
    (r"nothing is drawn there, the drawing has no curves", "holds no shapes: an empty picture, or text and images only"),
    (r"the drawing has no extent", "all that it draws is one point"),
    (r"line \d+", "no well-formed XML"),
]

# What a long run says of how far it is.
PROGRESS = re.compile(r"curvelab: .*, \d+ of \d+ curves\n")

TIME_LIMIT = 600.0


def files_below(folder):
    """The different SVG files below a folder, by name; links lead to what is there already."""
    seen, files = set(), []
    for place, folders, names in os.walk(folder):
        folders.sort()
        for name in sorted(names):
            path = os.path.join(place, name)
            if name.endswith(".svg") and not os.path.islink(path):
                with open(path, "rb") as file:
                    digest = hashlib.sha256(file.read()).digest()
                if digest not in seen:
                    seen.add(digest)
                    files.append(path)
    return files


def spread(files, count):
    """So many of a list, at even steps."""
    if len(files) <= count:
        return files
    return [files[i * len(files) // count] for i in range(count)]


def is_finite(value):
    """Whether a list holds numbers only, be it of lists: JSON writes NaN as null."""
    if isinstance(value, list):
        return all(each is not None and is_finite(each) for each in value)
    return not isinstance(value, float) or math.isfinite(value)


Outcome = collections.namedtuple("Outcome", "command path verdict detail numbers")


def ask(curvelab, command, path):
    """Runs one command on one file. The verdict is "answered", "refused" or "failed"."""
    with tempfile.TemporaryDirectory(prefix="curvelab-") as folder:
        output = os.path.join(folder, "output")
        try:
            result = subprocess.run([curvelab, command, path, *QUESTIONS[command], "--json=-", "-o", output],
                                    capture_output=True, text=True, timeout=TIME_LIMIT, check=False)
        except subprocess.TimeoutExpired:
            return Outcome(command, path, "failed", f"took longer than {TIME_LIMIT} s", None)
        if result.returncode == 2:
            return Outcome(command, path, "refused", PROGRESS.sub("", result.stderr).strip(), None)
        if result.returncode != 0:
            return Outcome(command, path, "failed", f"status {result.returncode}", None)
        try:
            numbers = json.loads(result.stdout)
            if command != "report":
                xml.etree.ElementTree.parse(output)
            elif os.path.getsize(output) == 0:
                raise ValueError("the page is empty")
        except (ValueError, OSError, xml.etree.ElementTree.ParseError) as error:
            return Outcome(command, path, "failed", f"what it wrote cannot be read: {error}", None)
        infinite = [key for key, value in numbers["answer"].items() if not is_finite(value)]
        if infinite:
            return Outcome(command, path, "failed", f"not finite: {', '.join(infinite)}", None)
        return Outcome(command, path, "answered", "", numbers)


def reason_of(message):
    """What is behind a refusal, or nothing if that is not known."""
    for pattern, reason in REASONS:
        if re.search(pattern, message):
            return reason
    return None


def commands_of(curvelab):
    """The commands that the program's help lists."""
    text = subprocess.run([curvelab, "--help"], capture_output=True, text=True, check=True).stdout
    listed = re.search(r"^Commands:\n((?:  .*\n)+)", text, re.MULTILINE)
    return re.findall(r"^  ([a-z]+)", listed.group(1), re.MULTILINE) if listed else []


def total_of(outcomes, key):
    return sum(outcome.numbers["answer"].get(key, 0) for outcome in outcomes)


def worst_of(outcomes, key):
    return max((outcome.numbers["answer"].get(key) or 0 for outcome in outcomes), default=0)


def found(command, answered):
    """What a command found in all drawings, in words."""
    parts = [f"{total_of(answered, key):,} {words}" for key, words in SUMS.get(command, {}).items()]
    parts += [f"{words} {worst_of(answered, key):.3g} units" for key, words in WORST.get(command, {}).items()]
    return "; ".join(parts)


def machine():
    with open("/proc/cpuinfo", encoding="utf-8") as file:
        model = re.search(r"^model name\s*: (.*)$", file.read(), re.MULTILINE)
    with open("/etc/os-release", encoding="utf-8") as file:
        system = re.search(r'^PRETTY_NAME="?([^"\n]*)', file.read(), re.MULTILINE)
    names = [system.group(1) if system else platform.system(), platform.machine()]
    return ", ".join(names + ([model.group(1).strip()] if model else []))


def packages_of(folders):
    """The Debian packages that the folders come from, with their versions."""
    names = set()
    for folder in folders:
        owner = subprocess.run(["dpkg-query", "-S", folder], capture_output=True, text=True, check=False).stdout
        for line in owner.splitlines():
            names.update(name.strip() for name in line.rpartition(": ")[0].split(","))
    versions = subprocess.run(["dpkg-query", "-W", "-f=${Package} ${Version}\n", *sorted(names)], capture_output=True,
                              text=True, check=False).stdout if names else ""
    return versions.splitlines()


def paragraph(text):
    """Its lines, and an empty one."""
    return [*textwrap.wrap(text, 120, break_long_words=False, break_on_hyphens=False), ""]


def page_of(folders, files, outcomes):
    """The totals as a page."""
    by_command = collections.defaultdict(list)
    for outcome in outcomes:
        by_command[outcome.command].append(outcome)
    drawn = [o.numbers["drawing"] for o in by_command["bounds"] if o.verdict == "answered"]
    size = {key: sum(drawing[key] for drawing in drawn) for key in ("shapes", "contours", "curves")}
    curves = [drawing["curves"] for drawing in drawn]
    lines = ["# Real drawings", ""]
    lines += paragraph(
        f"Every command of `curvelab` on {len(files)} icons that people drew, from {' and '.join(packages_of(folders))}: "
        f"{len(outcomes):,} runs, and no crash. `./dev drawings` repeats that, and fails on a crash, on a picture that is no "
        "XML, on a number that is not finite, and on a refusal whose reason it does not know. The files are different ones, "
        "spread evenly over the folders of the themes.")
    lines += paragraph(
        f"The drawings hold {size['shapes']:,} shapes with {size['contours']:,} contours and {size['curves']:,} cubics, "
        f"{min(curves):,} to {max(curves):,} to a drawing. The larger side of each is 100000 units.")
    lines += ["| command | asked with | answered | refused | found |", "|---|---|---:|---:|---|"]
    for command, runs in by_command.items():
        answered = [run for run in runs if run.verdict == "answered"]
        question = " ".join(f'"{word}"' if " " in word else word for word in QUESTIONS[command])
        lines.append(f"| `{command}` | {f'`{question}`' if question else ''} | {len(answered)} | "
                     f"{len(runs) - len(answered)} | {found(command, answered)} |")
    lines.append("")
    refused = collections.defaultdict(set)
    for outcome in outcomes:
        if outcome.verdict == "refused":
            refused[reason_of(outcome.detail)].add(outcome.path)
    if refused:
        lines += ["| refused because the file | files |", "|---|---:|"]
        lines += [f"| {reason} | {len(paths)} |" for reason, paths in sorted(refused.items())]
        lines.append("")
    else:
        lines += paragraph("No file was refused.")
    lines += paragraph(f"Counted by `./dev drawings --write` on {datetime.date.today().isoformat()}: {machine()}.")
    return "\n".join(lines)


def run_all(curvelab, files, jobs):
    questions = [(command, path) for command in QUESTIONS for path in files]
    outcomes = []
    with concurrent.futures.ThreadPoolExecutor(max_workers=jobs) as pool:
        for outcome in pool.map(lambda question: ask(curvelab, *question), questions):
            outcomes.append(outcome)
            if outcome.verdict == "failed" or (outcome.verdict == "refused" and not reason_of(outcome.detail)):
                print(f"drawings: {outcome.command} {outcome.path}: {outcome.verdict}: {outcome.detail}", flush=True)
            if len(outcomes) % len(files) == 0:
                print(f"drawings: {outcome.command}, {len(files)} files", flush=True)
    return outcomes


def main():
    parser = argparse.ArgumentParser(usage=__doc__)
    parser.add_argument("curvelab")
    parser.add_argument("folders", nargs="+")
    parser.add_argument("--each", type=int, default=120)
    parser.add_argument("--jobs", type=int, default=2)
    parser.add_argument("--write")
    arguments = parser.parse_args()

    missing = set(commands_of(arguments.curvelab)) ^ set(QUESTIONS)
    if missing:
        sys.exit(f"drawings: no question, or no command: {', '.join(sorted(missing))}")
    files = [path for folder in arguments.folders for path in spread(files_below(folder), arguments.each)]
    if not files:
        sys.exit("drawings: there is no SVG file below these folders")
    outcomes = run_all(arguments.curvelab, files, arguments.jobs)
    bad = [o for o in outcomes if o.verdict == "failed" or (o.verdict == "refused" and not reason_of(o.detail))]
    answered = sum(o.verdict == "answered" for o in outcomes)
    print(f"drawings: {len(files)} files, {len(outcomes)} runs, {answered} answered, "
          f"{len(outcomes) - answered - len(bad)} refused for a known reason, {len(bad)} failed")
    if bad:
        sys.exit(1)
    if arguments.write:
        with open(arguments.write, "w", encoding="utf-8") as file:
            file.write(page_of(arguments.folders, files, outcomes))
        print(f"drawings: wrote {arguments.write}")


if __name__ == "__main__":
    main()
