#!/usr/bin/python3
"""Asks all libraries the same questions in one run, and shows the answers side by side.

    peers.py BUILD [--rounds N] [--page FILE]

BUILD holds zarnmath_peers; a program of kurbo and the packages of Node are used where ./dev has built them there. The
programs take turns, round after round, and medians are compared. Without a page the tables go to the terminal alone.
"""
import argparse
import dataclasses
import datetime
import json
import math
import pathlib
import platform
import re
import statistics
import subprocess

OURS = "ZarnMath"


@dataclasses.dataclass
class Section:
    """Questions shown in one table, and what a reader has to know where libraries answer slightly different ones."""
    title: str
    pattern: str  # of the questions' names; what it captures tells them apart
    variant: str = ""  # what is captured
    remark: str = ""
    depends_on_error: bool = False  # time depends on how exact the answer has to be


SECTIONS = [
    Section("Nearest point", "nearest point",
            remark="The ends are compared besides with ours, which finds stationary points. kurbo takes a tolerance, "
                   "and searches a quadratic approximation."),
    Section("Roots", r"roots of degree (\d+)", "degree",
            remark="kurbo solves a cubic in closed form, and returns all real roots. GSL finds the eigenvalues of "
                   "the companion matrix, at every degree. The plain form is our own algorithm with every sum a loop "
                   "and each root polished where it is found; it gives the same bits."),
    Section("One crossing", r"one crossing, degree (\d+)", "degree"),
    Section("Crossings of two curves", "crossings of two curves",
            remark="Ours takes a curve that is straight within 2 units for its chord, which is its largest error; "
                   "bezier-js reports a crossing many times, and is asked for 60 pairs only."),
    Section("Crossings with a segment", "crossings with a segment",
            remark="Ours returns the crossings with the whole line; those on the segment are counted."),
    Section("Arc length", "arc length", depends_on_error=True,
            remark="Ours is given a number of samples, the peers a tolerance. *Halved to* a tolerance is a loop of "
                   "ten lines around ours, as a caller would write it: a stretch is measured with 16 samples, and so "
                   "are its halves, and where the two differ by more, each half is halved in its turn. Our samples "
                   "stand at abscissae of 14 decimal places, which shows below an error of about 1e-11. paper and "
                   "bezier-js have one setting."),
    Section("Tight box", "tight box",
            remark="FreeType works in whole 64ths of a unit, and takes the first end for inside. bezier-js keeps "
                   "what it found: a curve is made anew for each box, which is part of its time."),
    Section("Polyline", "polyline", depends_on_error=True,
            remark="A tolerance means another distance to each library. cairo works in 256ths of a unit."),
    Section("Offset on both sides", "offset on both sides",
            remark="By 10 units. Ours is cut where it folds, and each stretch gets one cubic; *cut to* a tolerance, "
                   "stretches are halved until the fit says that it is near. FreeType draws round caps besides. "
                   "Where a side folds, all come nearer to the curve than asked for, which is nearly all of the "
                   "error."),
    Section("Offset, where nothing folds", "offset on both sides, apart from the curve", depends_on_error=True,
            remark="The same for those curves whose offset stays at its distance from all of the curve. Ours takes "
                   "longer: it solves for the cusps of the offset, a polynomial of degree 12, and fits each cubic in "
                   "ten passes that project every sample on it, where FreeType places the handles of a short arc by "
                   "the angles of its control polygon alone. More than half of our time goes there."),
    Section("One cubic to 60 points", "one cubic to 60 points", depends_on_error=True,
            remark="Both start from the chord length. The peer stops by its own rule."),
    Section("A field sampled", r"field sampled (.*), (\d+), (\d+ %)", "where, size, written",
            remark="The dense grid is an array of all cells with an index worked out by hand. Ours stores the written "
                   "part of each row alone."),
    Section("Points through a matrix", r"points through a matrix, (\d+)", "points",
            remark="By hand is a loop of intrinsics for four doubles at a time."),
    Section("Integer points through a matrix", r"integer points through a matrix, (\d+)", "points",
            remark="Ours, and the loop by hand, round to nearest and saturate; Eigen truncates."),
    Section("Tridiagonal solve", r"tridiagonal solve, (\d+)", "rows",
            remark="LAPACK's dgtsv pivots, and overwrites its arrays: filling them is part of its time."),
]

EVERY_PEER = ""

# How many times our time a peer is to take at least: question, library or all of them, setting, ratio. A question that
# depends on the error is judged at every setting of the peer.
TARGETS = [
    ("nearest point", "lib2geom", None, 10),
    ("roots of degree 3", EVERY_PEER, None, 2),
    ("roots of degree 5", EVERY_PEER, None, 2),
    ("roots of degree 9", "lib2geom", None, 4),
    ("roots of degree 9", "GSL", None, 15),
    *((f"roots of degree {degree}", OURS, "plain form", 1.4) for degree in (3, 4, 5)),
    *((f"roots of degree {degree}", OURS, "plain form", 2) for degree in (9, 10, 11, 12)),
    ("crossings of two curves", "lib2geom", None, 5),
    ("crossings of two curves", "paper", None, 10),
    ("crossings of two curves", "bezier-js", None, 50),
    ("crossings with a segment", "lib2geom", None, 5),
    ("arc length", EVERY_PEER, None, 2),
    ("tight box", "lib2geom", None, 10),
    ("polyline", "kurbo", None, 2),
    ("polyline", "cairo", None, 2),
    ("one cubic to 60 points", "lib2geom", None, 1),
    *((f"field sampled {where}, {size}, {written} %", "dense grid", None, 0.77)
      for size in (256, 8192) for written in (1, 100) for where in ("at random", "along scanlines")),
    ("points through a matrix, 4000000", "memcpy", None, 0.9),
    ("integer points through a matrix, 4000000", "memcpy", None, 0.4),
    ("points through a matrix, 4096", "by hand", None, 0.8),
    ("integer points through a matrix, 4096", "by hand", None, 0.8),
]

# What time cannot fall below, or what was written for the one case alone: no peers.
BOUNDS = ["dense grid", "memcpy", "by hand"]

# By question and library.
WHY_AHEAD = {
    ("roots of degree 3", "kurbo"): "A closed form has no steps that wait for each other.",
    ("crossings with a segment", "kurbo"):
        "The same closed form; its largest error is ten orders of magnitude above ours.",
    ("offset on both sides", "FreeType"): "It places handles by angles, where ours fits.",
    ("offset on both sides, apart from the curve", "FreeType"): "It places handles by angles, where ours fits.",
    ("integer points through a matrix, 4096", "Eigen"): "It truncates, where ours rounds and saturates.",
    ("integer points through a matrix, 4000000", "Eigen"): "It truncates, where ours rounds and saturates.",
}

# What an answer costs; only our own program counts cycles.
COSTS = ["nanoseconds", "cycles"]

# The measures of error at which times are compared.
ERRORS = ["median error", "nine in ten"]


AT = {"": "", "median error": " at equal median error", "nine in ten": " at equal error of nine in ten"}


def section_of(question):
    return next(section for section in SECTIONS if re.fullmatch(section.pattern, question))


# Measuring

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
    """Rows by question: library, setting, median time and cycles, measures."""
    runs = {}
    for _ in range(rounds):
        for command in commands:
            for row in lines_of(command):
                runs.setdefault((row["question"], row["library"], row["setting"]), []).append(row)
    questions = {}
    for (question, _, _), rows in runs.items():
        costs = {kind: statistics.median(row[kind] for row in rows) for kind in COSTS if kind in rows[0]}
        questions.setdefault(question, []).append(rows[-1] | costs)
    return questions


# Comparing

def own_time(rows):
    return next(row for row in rows if row["library"] == OURS)["nanoseconds"]


def frontier(rows, measure):
    """A library's settings as (error, time), less those that another one beats in both."""
    points = [(row["measures"][measure], row["nanoseconds"]) for row in rows]
    return sorted(p for p in points if not any(q != p and q[0] <= p[0] and q[1] <= p[1] for q in points))


def time_at(points, error):
    """The time of a library at an error: between its settings, on logarithmic scales; beyond the coarsest one, that of
    this; and None beyond the finest."""
    if error > points[-1][0]:
        return points[-1][1]
    for (e0, t0), (e1, t1) in zip(points, points[1:]):
        if e0 <= error <= e1:
            share = math.log(error / e0) / math.log(e1 / e0)
            return t0 * (t1 / t0) ** share
    return None


def ratio_at_error(rows, row, measure):
    """How many times our time at its own error a peer takes; None beyond our settings."""
    time = time_at(frontier([r for r in rows if r["library"] == OURS], measure), row["measures"][measure])
    return row["nanoseconds"] / time if time else None


def target_ratios(rows, library, setting):
    """The ratios of a peer, or of all of them, with what each was measured for."""
    own = own_time(rows)
    for row in rows:
        if setting is not None and (row["library"], row["setting"]) != (library, setting):
            continue
        if setting is None and (row["library"] == OURS or library not in (EVERY_PEER, row["library"])):
            continue
        if not section_of(row["question"]).depends_on_error:
            yield row["library"], "", row["nanoseconds"] / own
            continue
        for measure in ERRORS:
            ratio = ratio_at_error(rows, row, measure)
            if ratio:
                yield row["library"], measure, ratio


# Showing

def number(value):
    if value == 0 or 0.01 <= abs(value) < 1e5:
        return f"{value:.3g}" if abs(value) < 1000 else f"{value:.0f}"
    return f"{value:.1e}"


def table(header, rows):
    widths = [max(len(str(row[i])) for row in [header, *rows]) for i in range(len(header))]
    line = lambda row: "| " + " | ".join(str(cell).ljust(width) for cell, width in zip(row, widths)) + " |"
    rule = "|" + "|".join("-" * (width + 2) for width in widths) + "|"
    return "\n".join([line(header), rule, *map(line, rows)])


def least_ratios(rows, library, setting):
    """The least ratio of each peer, or of the setting, by its name and what it was measured for."""
    least = {}
    for name, measure, ratio in target_ratios(rows, library, setting):
        key = (setting or name, measure)
        least[key] = min(ratio, least.get(key, ratio))
    return least


def targets_table(questions):
    body = []
    for question, library, setting, asked in TARGETS:
        for (name, measure), ratio in least_ratios(questions.get(question, []), library, setting).items():
            verdict = "" if ratio >= asked else "**missed**"
            body.append([question + AT[measure], name, f"{asked:g}", f"{ratio:.3g}", verdict])
    return table(["question", "peer", "aim", "measured", ""], body)


def ahead_table(questions):
    body = []
    for question, rows in questions.items():
        for (name, measure), ratio in least_ratios(rows, EVERY_PEER, None).items():
            if ratio < 1 and name not in BOUNDS:
                body.append([question + AT[measure], name, f"{ratio:.3g}", WHY_AHEAD.get((question, name), "")])
    return table(["question", "peer", "time / ours", ""], body)


def section_table(section, questions):
    rows = [row for all_rows in questions.values() for row in all_rows]
    names = list(dict.fromkeys(name for row in rows for name in row.get("measures") or {}))
    has_pieces = "pieces" in names
    has_cycles = section.title == "One crossing"
    header = [*(section.variant.split(", ") if section.variant else []), "library", "setting", "ns",
              *(["cycles"] if has_cycles else []), "time / ours", *names, *(["ns a piece"] if has_pieces else [])]
    body = []
    for question, all_rows in questions.items():
        own = own_time(all_rows)
        variant = re.fullmatch(section.pattern, question).groups()
        for row in all_rows:
            measures, time = row.get("measures") or {}, row["nanoseconds"]
            body.append([*variant, row["library"], row["setting"], f"{time:.4g}",
                         *([f"{row['cycles']:.0f}"] if has_cycles else []), f"{time / own:.3g}",
                         *(number(measures[name]) if name in measures else "" for name in names),
                         *([number(time / measures["pieces"])] if has_pieces else [])])
    return table(header, body)


def equal_error_table(rows):
    body = []
    for row in sorted((r for r in rows if r["library"] != OURS), key=lambda r: r["library"]):
        cells = [row["library"], row["setting"], f"{row['nanoseconds']:.4g}"]
        for measure in ERRORS:
            ratio = ratio_at_error(rows, row, measure)
            cells += [number(row["measures"][measure]), f"{ratio:.3g}" if ratio else "beyond our settings"]
        body.append(cells)
    return table(["library", "setting", "ns", *(cell for name in ERRORS for cell in (name, "time / ours"))], body)


# Latencies of Zen 3, in cycles, from the maker's optimisation guide.
ADD, MULTIPLY, DIVIDE = 3, 3, 13


def chain(degree, steps=4):
    """The operations of a search for one root that wait for each other, in cycles: the conversion to a control polygon,
    the start, and the steps of Newton's method."""
    convert = DIVIDE + ADD + (degree - 1) * (MULTIPLY + 2 * ADD)
    start = ADD + DIVIDE + MULTIPLY + ADD
    step = degree * (MULTIPLY + ADD) + DIVIDE + ADD
    return convert + start + steps * step


def chain_remark(questions):
    """What bounds a call, where cycles could be counted."""
    parts = []
    for degree in (3, 5):
        cycles = questions[f"one crossing, degree {degree}"][0].get("cycles")
        if cycles:
            parts.append(f"{chain(degree)} of {cycles:.0f} cycles at degree {degree}")
    closed = [ratio for library, _, ratio in target_ratios(questions["roots of degree 3"], "kurbo", None)]
    remark = ("Polynomials whose control polygon changes sign once, so that there is one root and no cut. Each "
              "operation waits for the one before: of the conversion, a division and for each further coefficient a "
              "product, a difference and a sum; of the start, a division and three more; and of each step of Newton's "
              "method, a product and a sum for each degree, a division and a difference.")
    if parts:
        remark += (f" With four steps and the latencies of Zen 3 ({ADD} cycles for a sum or a product, {DIVIDE} for a "
                   f"division), this chain accounts for {' and '.join(parts)}.")
    remark += (" The same bits take the same chain, whoever writes it, so that the plain form cannot be left behind "
               "here, let alone by a factor of two. Up to degree 5 ours takes four steps before it looks, of 3.6 that are "
               "needed in the mean, which pays where several roots are polished at once; a single root of a higher "
               "degree is left to the plain method. The plain form also branches on each sign, where ours computes "
               "which leg it is that crosses: that makes it the faster one here, and the slower one where there are "
               "more roots.")
    if closed:
        remark += (f" A closed form has no such chain: kurbo's takes {closed[0]:.2f} of our time at degree 3, over all "
                   "polynomials.")
    return remark + "\n"


EQUAL_ERROR = ("At equal error, where *time / ours* is that at the error before it; a peer less exact than our "
               "coarsest setting is compared with that one:\n")


def sections(questions):
    for section in SECTIONS:
        own = {name: rows for name, rows in questions.items() if section_of(name) is section}
        if not own:
            continue
        yield f"### {section.title}\n"
        if section.remark:
            yield section.remark + "\n"
        if section.title == "One crossing":
            yield chain_remark(questions)
        yield section_table(section, own) + "\n"
        if section.depends_on_error:
            yield EQUAL_ERROR
            yield equal_error_table(*own.values()) + "\n"


def new_figure(*arguments, **keywords):
    import matplotlib
    matplotlib.use("svg")
    matplotlib.rcParams["svg.hashsalt"] = "peers"
    from matplotlib import pyplot
    return pyplot.subplots(*arguments, **keywords)


def save(figure, file):
    figure.savefig(file, bbox_inches="tight", metadata={"Date": None})


def plot_ratios(questions, file):
    bars = []
    for question, rows in questions.items():
        if section_of(question).depends_on_error:
            continue
        own = own_time(rows)
        best = {}
        for row in rows:
            if row["library"] != OURS:
                ratio = row["nanoseconds"] / own
                best[row["library"]] = min(ratio, best.get(row["library"], ratio))
        bars += [(f"{question} \u2013 {library}", ratio) for library, ratio in best.items()]
    figure, axes = new_figure(figsize=(9, 0.24 * len(bars) + 0.8))
    axes.barh([name for name, _ in bars], [ratio - 1 for _, ratio in bars], left=1,
              color=["#2a6f97" if ratio >= 1 else "#c1553b" for _, ratio in bars])
    axes.set_xscale("log")
    axes.axvline(1, color="black", linewidth=0.8)
    axes.invert_yaxis()
    axes.margins(y=0.01)
    axes.tick_params(labelsize=8)
    axes.set_xlabel("time / ours: right of the line this library is ahead", fontsize=8)
    save(figure, file)


def plot_errors(title, rows, file):
    figure, both = new_figure(1, len(ERRORS), figsize=(11, 4.2), sharey=True)
    for axes, measure in zip(both, ERRORS):
        for library in dict.fromkeys(row["library"] for row in rows):
            points = sorted((row["measures"][measure], row["nanoseconds"]) for row in rows if row["library"] == library)
            if library == OURS:
                points = frontier([row for row in rows if row["library"] == library], measure)
            axes.plot(*zip(*points), marker="o", markersize=4, linewidth=2.2 if library == OURS else 1.2, label=library)
        axes.set_xscale("log")
        axes.set_yscale("log")
        axes.set_xlabel(f"{measure}, drawing units")
        axes.grid(alpha=0.3)
    both[0].set_ylabel("ns a call")
    both[1].legend(bbox_to_anchor=(1.02, 1), loc="upper left")
    figure.suptitle(title)
    save(figure, file)


def processor():
    for line in pathlib.Path("/proc/cpuinfo").read_text().splitlines():
        if line.startswith("model name"):
            return line.split(":", 1)[1].strip()
    return platform.machine()


AIMS = ("How many times our time a peer is to take, and takes. Where time depends on the error, it is compared with "
        "ours at the peer's own error, and the least of its settings counts; settings finer than all of ours are in "
        "the tables below.\n")

AHEAD = "All such places, by the fastest setting of each peer:\n"

BEGIN, END = "<!-- peers: begin -->", "<!-- peers: end -->"


def write_page(page, questions):
    pictures = page.parent / "pictures"
    compiler = subprocess.run(["g++", "-dumpfullversion"], capture_output=True, text=True).stdout.strip()
    parts = [f"Measured on {datetime.date.today()}, {processor()}, GCC {compiler} at -O3, by `./dev bench --peers`. "
             "Times are those of the thread, and medians over rounds in which the libraries take turns.\n",
             "### What we aim at\n", AIMS, targets_table(questions) + "\n",
             "### Where a peer is ahead\n", AHEAD, ahead_table(questions) + "\n",
             "### In pictures\n", "![Time of each peer as a multiple of ours](pictures/peers-ratios.svg)\n"]
    plot_ratios(questions, pictures / "peers-ratios.svg")
    for question, rows in questions.items():
        section = section_of(question)
        if section.depends_on_error:
            name = "peers-" + re.sub(r"\W+", "-", section.title.lower()) + ".svg"
            plot_errors(section.title, rows, pictures / name)
            parts.append(f"![{section.title}: time against error](pictures/{name})\n")
    text = page.read_text()
    before, after = text[:text.index(BEGIN) + len(BEGIN)], text[text.index(END):]
    page.write_text(before + "\n\n" + "\n".join([*parts, *sections(questions)]) + "\n" + after)


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build", type=pathlib.Path)
    parser.add_argument("--rounds", type=int, default=3)
    parser.add_argument("--page", type=pathlib.Path)
    arguments = parser.parse_args()
    questions = measure(programs(arguments.build), arguments.rounds)
    (arguments.build / "peers.json").write_text(json.dumps(questions, indent=1))
    print(targets_table(questions) + "\n")
    for part in sections(questions):
        print(part)
    if arguments.page:
        write_page(arguments.page, questions)


if __name__ == "__main__":
    main()
