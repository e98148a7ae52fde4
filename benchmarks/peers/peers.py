#!/usr/bin/python3
"""Asks all libraries the same questions in one run, and shows the answers side by side.

    peers.py BUILD [--rounds N] [--page FILE]

BUILD holds zarnmath_peers; a program of kurbo and the packages of Node are used where ./dev has built them there. The
programs take turns, round after round, and medians are compared. Without a page the tables go to the terminal alone.
"""
import argparse
import datetime
import json
import math
import pathlib
import platform
import statistics
import subprocess

HERE = pathlib.Path(__file__).parent
OURS = "ZarnMath"

# What a reader has to know of a question, where the libraries answer slightly different ones.
REMARKS = {
    "nearest point": "The ends are compared besides with ours, which finds stationary points. kurbo takes a tolerance, "
                     "and searches a quadratic approximation.",
    "roots of degree 3": "kurbo solves in closed form, and returns all real roots. GSL finds the eigenvalues of the "
                         "companion matrix, at every degree.",
    "crossings of two curves": "Ours takes a curve that is straight within 2 units for its chord, which is its largest "
                               "error; bezier-js reports a crossing many times, and is asked for 60 pairs only.",
    "crossings with a segment": "Ours returns the crossings with the whole line; those on the segment are counted.",
    "arc length": "Ours is given a number of samples, the peers a tolerance: see the table of equal errors. paper and "
                  "bezier-js have one setting.",
    "tight box": "FreeType works in whole 64ths of a unit, and takes the first end for inside. bezier-js keeps what it "
                 "found: a curve is made anew for each box, which is part of its time.",
    "polyline": "A tolerance means another distance to each library: see the table of equal errors. cairo works in "
                "256ths of a unit.",
    "offset on both sides": "FreeType draws round caps besides. Where a side folds, both come nearer to the curve than "
                            "asked for, which is nearly all of the error.",
    "one cubic to 60 points": "Both start from the chord length. The peer stops by its own rule.",
    "integer points through a matrix, 4096": "Eigen truncates; ours rounds to nearest and saturates.",
    "integer points through a matrix, 4000000": "Eigen truncates; ours rounds to nearest and saturates.",
    "tridiagonal solve, 100": "LAPACK's dgtsv pivots, and overwrites its arrays: filling them is part of its time.",
}

# Questions where time depends on how exact the answer has to be.
EQUAL_ERROR = {"arc length": "nine in ten", "polyline": "nine in ten"}


def lines_of(command):
    output = subprocess.run(command, check=True, capture_output=True, text=True).stdout
    return [json.loads(line) for line in output.splitlines() if line.startswith("{")]


def programs(build):
    corpus = build / "corpus"
    ours = build / "benchmarks/peers/zarnmath_peers"
    subprocess.run([ours, "--corpus", corpus], check=True)
    commands = [[ours]]
    kurbo = build / "kurbo/release/kurbo-peer"
    if kurbo.exists():
        commands.append([kurbo, corpus])
    if (build / "node/node_modules").exists():
        commands.append(["node", build / "node/peers.js", corpus])
    return commands


def measure(commands, rounds):
    """Rows by question: library, setting, median time, measures."""
    times, rows = {}, {}
    for _ in range(rounds):
        for command in commands:
            for row in lines_of(command):
                key = row["question"], row["library"], row["setting"]
                times.setdefault(key, []).append(row["nanoseconds"])
                rows[key] = row
    questions = {}
    for key, row in rows.items():
        row["nanoseconds"] = statistics.median(times[key])
        questions.setdefault(row["question"], []).append(row)
    return questions


def number(value):
    if value == 0 or 0.01 <= abs(value) < 1e5:
        return f"{value:.3g}" if abs(value) < 1000 else f"{value:.0f}"
    return f"{value:.1e}"


def table(header, rows):
    widths = [max(len(str(row[i])) for row in [header, *rows]) for i in range(len(header))]
    line = lambda row: "| " + " | ".join(str(cell).ljust(width) for cell, width in zip(row, widths)) + " |"
    rule = "|" + "|".join("-" * (width + 2) for width in widths) + "|"
    return "\n".join([line(header), rule, *map(line, rows)])


def question_table(rows):
    own = next(row for row in rows if row["library"] == OURS)["nanoseconds"]
    names = list(dict.fromkeys(name for row in rows for name in row.get("measures", {})))
    body = []
    for row in rows:
        measures = row.get("measures", {})
        body.append([row["library"], row["setting"], f"{row['nanoseconds']:.4g}", f"{row['nanoseconds'] / own:.3g}",
                     *(number(measures[name]) if name in measures else "" for name in names)])
    return table(["library", "setting", "ns", "time / ours", *names], body)


def time_at(points, error):
    """The time of a library at an error, between its settings on logarithmic scales; None beyond them."""
    points = sorted(points)
    for (e0, t0), (e1, t1) in zip(points, points[1:]):
        if e0 <= error <= e1:
            share = math.log(error / e0) / math.log(e1 / e0) if e1 > e0 else 0.0
            return t0 * (t1 / t0) ** share
    return None


def frontier(rows, measure):
    """A library's settings as (error, time), less those that another one beats in both."""
    points = [(row["measures"][measure], row["nanoseconds"]) for row in rows]
    return [p for p in points if not any(q != p and q[0] <= p[0] and q[1] <= p[1] for q in points)]


def equal_error_table(rows, measure):
    by_library = {}
    for row in rows:
        by_library.setdefault(row["library"], []).append(row)
    own = frontier(by_library.pop(OURS), measure)
    body = []
    for library, settings in by_library.items():
        for row in settings:
            time = time_at(own, row["measures"][measure])
            ratio = f"{row['nanoseconds'] / time:.3g}" if time else "beyond our settings"
            body.append([library, row["setting"], number(row["measures"][measure]), f"{row['nanoseconds']:.4g}", ratio])
    return table(["library", "setting", f"error, {measure}", "ns", "time / ours at this error"], body)


def plot_ratios(questions, file):
    import matplotlib
    matplotlib.use("svg")
    matplotlib.rcParams["svg.hashsalt"] = "peers"
    from matplotlib import pyplot
    bars = []
    for question, rows in questions.items():
        if question in EQUAL_ERROR:
            continue
        own = next(row for row in rows if row["library"] == OURS)["nanoseconds"]
        best = {}
        for row in rows:
            if row["library"] != OURS:
                ratio = row["nanoseconds"] / own
                best[row["library"]] = min(ratio, best.get(row["library"], ratio))
        bars += [(f"{question} \u2013 {library}", ratio) for library, ratio in best.items()]
    figure, axes = pyplot.subplots(figsize=(9, 0.24 * len(bars) + 0.8))
    axes.barh([name for name, _ in bars], [ratio for _, ratio in bars],
              color=["#2a6f97" if ratio >= 1 else "#c1553b" for _, ratio in bars])
    axes.set_xscale("log")
    axes.axvline(1, color="black", linewidth=0.8)
    axes.invert_yaxis()
    axes.tick_params(labelsize=8)
    axes.set_xlabel("time / ours: right of the line this library is ahead", fontsize=8)
    figure.savefig(file, bbox_inches="tight", metadata={"Date": None})


def plot_errors(question, rows, file):
    import matplotlib
    matplotlib.use("svg")
    matplotlib.rcParams["svg.hashsalt"] = "peers"
    from matplotlib import pyplot
    figure, axes = pyplot.subplots(figsize=(7, 4.2))
    for library in dict.fromkeys(row["library"] for row in rows):
        points = sorted((row["measures"][EQUAL_ERROR[question]], row["nanoseconds"]) for row in rows
                        if row["library"] == library)
        axes.plot(*zip(*points), marker="o", markersize=4, linewidth=2.2 if library == OURS else 1.2, label=library)
    axes.set_xscale("log")
    axes.set_yscale("log")
    axes.set_xlabel("error of nine curves in ten, drawing units")
    axes.set_ylabel("ns a curve")
    axes.set_title(question)
    axes.grid(alpha=0.3)
    axes.legend()
    figure.savefig(file, bbox_inches="tight", metadata={"Date": None})


def sections(questions):
    for question, rows in questions.items():
        yield f"### {question[0].upper()}{question[1:]}\n"
        if question in REMARKS:
            yield REMARKS[question] + "\n"
        yield question_table(rows) + "\n"
        if question in EQUAL_ERROR:
            yield "At equal error:\n"
            yield equal_error_table(rows, EQUAL_ERROR[question]) + "\n"


def processor():
    for line in pathlib.Path("/proc/cpuinfo").read_text().splitlines():
        if line.startswith("model name"):
            return line.split(":", 1)[1].strip()
    return platform.machine()


BEGIN, END = "<!-- peers: begin -->", "<!-- peers: end -->"


def write_page(page, questions):
    pictures = page.parent / "pictures"
    plot_ratios(questions, pictures / "peers-ratios.svg")
    compiler = subprocess.run(["g++", "-dumpfullversion"], capture_output=True, text=True).stdout.strip()
    head = [f"Measured on {datetime.date.today()}, {processor()}, GCC {compiler} at -O3, by `./dev bench --peers`. Times "
            "are those of the thread, and medians over rounds in which the libraries take turns.\n",
            "![Time of each peer as a multiple of ours](pictures/peers-ratios.svg)\n"]
    for question in EQUAL_ERROR:
        name = "peers-" + question.replace(" ", "-") + ".svg"
        plot_errors(question, questions[question], pictures / name)
        head.append(f"![{question}: time against error](pictures/{name})\n")
    text = page.read_text()
    before, after = text[:text.index(BEGIN) + len(BEGIN)], text[text.index(END):]
    page.write_text(before + "\n\n" + "\n".join([*head, *sections(questions)]) + "\n" + after)


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build", type=pathlib.Path)
    parser.add_argument("--rounds", type=int, default=3)
    parser.add_argument("--page", type=pathlib.Path)
    arguments = parser.parse_args()
    questions = measure(programs(arguments.build), arguments.rounds)
    (arguments.build / "peers.json").write_text(json.dumps(questions, indent=1))
    for section in sections(questions):
        print(section)
    if arguments.page:
        write_page(arguments.page, questions)


if __name__ == "__main__":
    main()
