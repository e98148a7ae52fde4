#!/usr/bin/env python3
"""Runs curvelab on the drawings of this folder and on text in installed fonts, then the small examples that were built
beside it, and makes a page of the pictures.

    demo.py CURVELAB FOLDER [FONT...]

CURVELAB is the program, FOLDER the place for the pictures, the numbers and index.html (it is made if need be). FONTs are
font files to set text in; without any, the usual places of a Debian system are looked through, and the text is left out
where none of them is there.
"""

import html
import json
import os
import subprocess
import sys

DRAWINGS = os.path.join(os.path.dirname(os.path.abspath(__file__)), "drawings")

# One font with cubic outlines and one with quadratic ones.
USUAL_FONTS = [
    "/usr/share/texmf/fonts/opentype/public/tex-gyre/texgyrepagella-italic.otf",
    "/usr/share/fonts/truetype/dejavu/DejaVuSerif.ttf",
]

SMALL_EXAMPLES = [
    ("nearest", "From many places to the nearest point of a curve; in orange where that is an end."),
    ("spacing", "Marks at equal distances along a curve, and at equal steps of its parameter."),
    ("flatten", "One curve as polylines within four tolerances."),
    ("extents", "The tight box of a curve within that of its control points."),
    ("crossings", "Two cubics that cross in nine points."),
    ("offset", "Lines beside a curve, fitted to its offsets."),
    ("fit", "A cubic that approaches the points it is fitted to, pass by pass."),
    ("integers", "A curve in whole units, rounded once or halved again and again."),
    ("decomposition", "The steps that a matrix is made of."),
    ("ellipse", "What a matrix makes of a circle."),
    ("spline", "A closed curve through points by the cyclic solver, and beside it how much it bends."),
    ("warp", "A sparse field of displacements bends a grid of lines."),
    ("layout", "A page laid out by descriptions, with one ornament carried into each part."),
    ("cube", "A cube turned along the arc between two quaternions, in perspective."),
]


def drawing(name):
    return [os.path.join(DRAWINGS, name)]


def text(words, font):
    return ["--text", words, "--font", font]


def scenes(fonts):
    """What is shown: a heading, what there is to see, and the command line behind the program's name."""
    for name, to in (("nautilus.svg", "67000,52000"), ("rose-window.svg", "50000,19000")):
        yield (f"flatten {name}", "Polylines within 150 units of the curves.",
               ["flatten", *drawing(name), "--tolerance", "150"])
        yield (f"split {name}", "Every curve, cut at t = 0.4.", ["split", *drawing(name), "--at", "0.4"])
        yield (f"closest {name}", "The point of the drawing that is nearest to a given one.",
               ["closest", *drawing(name), "--to", to])
    yield ("transform nautilus.svg", "Turned, stretched and skewed: what circles become, and the point that stays.",
           ["transform", *drawing("nautilus.svg"), "--by", "rotate:30 scale:1.4,0.8 skew:10,0"])
    yield ("transform rose-window.svg", "A mirror, and the line that it leaves in place.",
           ["transform", *drawing("rose-window.svg"), "--by", "mirror:70@70000,50000"])
    yield ("flatten nautilus.svg, whole units", "A drawing 2000 units wide, in integers: vertices are rounded.",
           ["flatten", *drawing("nautilus.svg"), "--tolerance", "2", "--units", "2000", "--integer"])
    for name in ("nautilus.svg", "knots.svg"):
        yield (f"curvature {name}", "The comb: its teeth are as long as the curve bends. Dots where the speed is extreme.",
               ["curvature", *drawing(name)])
        yield (f"intersect {name}", "Every place where two curves cross, or one crosses itself.",
               ["intersect", *drawing(name)])
        yield (f"area {name}", "Which way each closed contour runs, and what it encloses.", ["area", *drawing(name)])
    for name, to in (("nautilus.svg", "90000,-4000"), ("rose-window.svg", "50000,50000")):
        yield (f"length {name}", "Rulers: ticks at equal lengths along each contour.",
               ["length", *drawing(name), "--spacing", "1000"])
        yield (f"bounds {name}", "The tight box of each curve, of each contour and of all.", ["bounds", *drawing(name)])
        yield (f"tangents {name}", "All tangents through a point.", ["tangents", *drawing(name), "--to", to])
    for name, distance in (("nautilus.svg", "-2500"), ("rose-window.svg", "-2500"), ("knots.svg", "2500")):
        yield (f"cusps {name}", "Offset curves, and where they turn back.",
               ["cusps", *drawing(name), "--distance", distance])
    yield ("offset nautilus.svg", "Cubics fitted to the offset; what would fold is left out.",
           ["offset", *drawing("nautilus.svg"), "--distance=-2500"])
    yield ("smooth rose-window.svg", "A coarse grid makes kinks; two cubics with a smooth joint take their place.",
           ["smooth", *drawing("rose-window.svg"), "--units", "150", "--integer"])
    for font in fonts:
        family = os.path.splitext(os.path.basename(font))[0]
        yield (f"flatten a line of text, {family}", "Outlines of a font; quadratics are raised to cubics.",
               ["flatten", *text("Ampersand &", font), "--tolerance", "100"])
        yield (f"split a line of text, {family}", "Every curve of the letters, cut in the middle.",
               ["split", *text("Ampersand &", font), "--at", "0.5"])
        yield (f"closest in a line of text, {family}", "A point beside the letters and the nearest point on them.",
               ["closest", *text("Ampersand &", font), "--to", "53000,16500"])
        yield (f"curvature of letters, {family}", "How letters bend: flat, round, and back at the inflections.",
               ["curvature", *text("Rag&", font)])
        yield (f"length of letters, {family}", "Points at equal lengths, from curve to curve.",
               ["length", *text("Rag&", font), "--spacing", "1000"])
        yield (f"bounds of letters, {family}", "Boxes, and the places where a coordinate is extreme.",
               ["bounds", *text("Rag&", font)])
        yield (f"tangents to letters, {family}", "All tangents through a point below the line.",
               ["tangents", *text("Rag&", font), "--to", "50000,-12000"])
        yield (f"area of letters, {family}", "Counters run the other way round: their area is subtracted.",
               ["area", *text("Rag&", font)])
        yield (f"cusps in letters, {family}", "An offset to the left of the outlines, and where it turns back.",
               ["cusps", *text("Rag&", font), "--distance", "900"])
        yield (f"offset of a letter, {family}", "An outline on both sides, fitted with cubics.",
               ["offset", *text("&", font), "--distance", "2500", "--sides", "2"])
        yield (f"fit of letters, {family}", "Points along the outlines, and as few cubics as come near enough.",
               ["fit", *text("Rg", font), "--tolerance", "60", "--spacing", "800"])
        yield (f"fit of noisy letters, {family}", "Points beside the outlines; the corners are kept.",
               ["fit", *text("R&", font), "--tolerance", "500", "--spacing", "600", "--noise", "250", "--reach", "10"])
        yield (f"smooth letters, {family}", "Rounded to a coarse grid, with the kinks taken out.",
               ["smooth", *text("g&", font), "--units", "150", "--integer"])


def run(curvelab, folder, number, scene):
    """Makes one picture; gives its figure for the page."""
    heading, remark, arguments = scene
    picture, numbers = f"{number:02}-{arguments[0]}.svg", f"{number:02}-{arguments[0]}.json"
    subprocess.run([curvelab, *arguments, "-o", os.path.join(folder, picture),
                    "--json", os.path.join(folder, numbers)], check=True)
    with open(os.path.join(folder, numbers), encoding="utf-8") as file:
        content = json.load(file)
    return figure(heading, remark, arguments, picture, numbers, content)


def readable(value):
    if isinstance(value, float):
        return f"{value:.6g}"
    if isinstance(value, list):
        return ", ".join(readable(each) for each in value) if len(value) <= 2 else f"{len(value)} values"
    return str(value)


def figure(heading, remark, arguments, picture, numbers, content):
    shown = [a if a.startswith("-") or "/" not in a else os.path.basename(a) for a in arguments]
    command = "curvelab " + " ".join(f'"{a}"' if " " in a else a for a in shown)
    facts = {"curves of the drawing": content["drawing"]["curves"], **content["answer"]}
    rows = "".join(f"<tr><th>{html.escape(key)}</th><td>{html.escape(readable(value))}</td></tr>"
                   for key, value in facts.items())
    return (f"<figure><h2>{html.escape(heading)}</h2><p>{html.escape(remark)}</p><code>{html.escape(command)}</code>"
            f'<a href="{picture}"><img src="{picture}" alt="{html.escape(heading)}"></a>'
            f'<details><summary>numbers</summary><table>{rows}</table><a href="{numbers}">all of them, as JSON</a>'
            "</details></figure>")


def run_small(examples, folder, number, name, remark):
    """Makes the picture of a small example; gives its figure for the page."""
    picture = f"{number:02}-{name}.svg"
    numbers = subprocess.run([os.path.join(examples, name, name), os.path.join(folder, picture)], check=True,
                             capture_output=True, text=True).stdout
    return (f"<figure><h2>{name}</h2><p>{html.escape(remark)}</p><code>{name} {picture}</code>"
            f'<a href="{picture}"><img src="{picture}" alt="{name}"></a>'
            f"<details><summary>numbers</summary><pre>{html.escape(numbers)}</pre></details></figure>")


PAGE = """<!DOCTYPE html>
<html lang="en">
<head>
<meta charset="utf-8">
<meta name="viewport" content="width=device-width, initial-scale=1">
<title>curvelab</title>
<style>
:root {{ color-scheme: light; }}
body {{ margin: 2rem; background: #eef0f3; color: #1d2530; font: 16px/1.5 Helvetica, Arial, sans-serif; }}
main {{ display: grid; grid-template-columns: repeat(auto-fit, minmax(26rem, 1fr)); gap: 2rem; align-items: start; }}
figure {{ margin: 0; padding: 1.25rem; background: #fff; border-radius: 8px; box-shadow: 0 1px 4px #0002; }}
h2 {{ margin: 0; font-size: 1.1rem; }}
p {{ margin: .2rem 0 .6rem; color: #5b6673; }}
code {{ display: block; padding: .4rem .6rem; background: #f4f5f7; border-radius: 4px; overflow-x: auto; white-space: nowrap; }}
img {{ display: block; width: 100%; margin: .8rem 0; }}
pre {{ margin: .6rem 0 0; overflow-x: auto; font-size: .8rem; }}
summary {{ cursor: pointer; color: #5b6673; }}
th {{ padding-right: 1.5rem; text-align: left; font-weight: 400; color: #5b6673; }}
td {{ font-variant-numeric: tabular-nums; }}
</style>
</head>
<body>
<h1>What ZarnMath knows about some drawings</h1>
<main>
{figures}
</main>
</body>
</html>
"""


def main():
    if len(sys.argv) < 3:
        sys.exit(__doc__)
    curvelab, folder = sys.argv[1], sys.argv[2]
    fonts = sys.argv[3:] or [font for font in USUAL_FONTS if os.path.exists(font)]
    if not fonts:
        print("demo: none of the usual fonts is installed, so there is no text", file=sys.stderr)
    os.makedirs(folder, exist_ok=True)
    try:
        figures = [run(curvelab, folder, number, scene) for number, scene in enumerate(scenes(fonts), 1)]
        examples = os.path.dirname(os.path.dirname(os.path.abspath(curvelab)))
        built = [small for small in SMALL_EXAMPLES if os.path.exists(os.path.join(examples, small[0], small[0]))]
        figures += [run_small(examples, folder, number, *small) for number, small in enumerate(built, len(figures) + 1)]
    except (OSError, subprocess.CalledProcessError) as error:
        sys.exit(f"demo: {error}")
    index = os.path.join(folder, "index.html")
    with open(index, "w", encoding="utf-8") as file:
        file.write(PAGE.format(figures="\n".join(figures)))
    print(f"{len(figures)} pictures and their numbers are in {os.path.abspath(folder)}")
    print(f"Look at them side by side: file://{os.path.abspath(index)}")


if __name__ == "__main__":
    main()
