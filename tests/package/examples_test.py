#!/usr/bin/env python3
"""Runs the small examples that were built against an installed library, and compares the numbers that they print and the
curves that they draw with mathematics.

    examples_test.py SOURCES PROGRAMS PICTURES

SOURCES is the folder examples, PROGRAMS where they were built, PICTURES where they draw to.
"""

import itertools
import math
import os
import re
import subprocess
import sys
import unittest
import xml.etree.ElementTree as ElementTree

SOURCES, PROGRAMS, PICTURES = [os.path.abspath(folder) for folder in sys.argv[1:4]]
SVG = "{http://www.w3.org/2000/svg}"
NUMBER = r"-?\d+(?:\.\d+)?(?:e[-+]?\d+)?"


def names():
    """The examples: each has a folder and a source of the same name."""
    return sorted(name for name in os.listdir(SOURCES) if os.path.exists(os.path.join(SOURCES, name, name + ".cpp")))


def numbers(text):
    return [float(number) for number in re.findall(NUMBER, text)]


class Run:
    """What an example printed and drew."""

    def __init__(self, name):
        self.picture = os.path.join(PICTURES, name + ".svg")
        program = os.path.join(PROGRAMS, name, name)
        self.text = subprocess.run([program, self.picture], check=True, capture_output=True, text=True).stdout
        self.lines = self.text.splitlines()
        self.root = ElementTree.parse(self.picture).getroot()

    def paths(self):
        """Each path as a list of cubics."""
        return [cubics(numbers(path.get("d"))) for path in self.root.iter(SVG + "path")]

    def polylines(self, kind="polyline"):
        return [pairs(numbers(line.get("points"))) for line in self.root.iter(SVG + kind)]

    def circles(self):
        return [(float(circle.get("cx")), float(circle.get("cy"))) for circle in self.root.iter(SVG + "circle")]


def pairs(values):
    return list(zip(values[::2], values[1::2]))


def cubics(values):
    points = pairs(values)
    return [points[i:i + 4] for i in range(0, len(points) - 1, 3)]


def at(curve, t):
    """The point of a curve, by the Bernstein polynomials."""
    weights = ((1 - t) ** 3, 3 * t * (1 - t) ** 2, 3 * t * t * (1 - t), t ** 3)
    return tuple(sum(weight * p[axis] for weight, p in zip(weights, curve)) for axis in (0, 1))


def samples(curve, count):
    return [at(curve, i / count) for i in range(count + 1)]


def length(points):
    return sum(math.dist(p, q) for p, q in zip(points, points[1:]))


def to_segment(p, a, b):
    squared = math.dist(a, b) ** 2
    along = ((p[0] - a[0]) * (b[0] - a[0]) + (p[1] - a[1]) * (b[1] - a[1])) / squared if squared else 0.0
    along = min(max(along, 0.0), 1.0)
    return math.dist(p, (a[0] + along * (b[0] - a[0]), a[1] + along * (b[1] - a[1])))


def to_polyline(p, points):
    return min(to_segment(p, a, b) for a, b in zip(points, points[1:]))


def side(places, i, p):
    """Above 0 where p is to the left of a polyline, as seen from its place i."""
    a, b = places[max(i - 1, 0)], places[min(i + 1, len(places) - 1)]
    return (b[0] - a[0]) * (p[1] - a[1]) - (b[1] - a[1]) * (p[0] - a[0])


class Examples(unittest.TestCase):
    def near(self, actual, expected, tolerance):
        self.assertEqual(len(actual), len(expected))
        for one, other in zip(actual, expected):
            self.assertLessEqual(abs(one - other), tolerance, f"{actual} and {expected}")

    def test_all_of_them_are_compared(self):
        self.assertGreaterEqual(len(names()), 14)
        for name in set(names()) - {"curvelab"}:
            self.assertTrue(hasattr(self, "test_" + name), name)

    def test_all_of_them_are_short(self):
        for name in names():
            with open(os.path.join(SOURCES, name, name + ".cpp"), encoding="utf-8") as file:
                self.assertLess(len(file.readlines()), 80, name)

    def test_the_list_names_all_of_them(self):
        with open(os.path.join(SOURCES, "README.md"), encoding="utf-8") as file:
            table = file.read()
        for name in names():
            self.assertIn(f"\n| `{name}` | ", table)

    def test_all_of_them_say_what_they_want(self):
        program = os.path.join(PROGRAMS, "nearest", "nearest")
        nothing = subprocess.run([program], capture_output=True, text=True)
        self.assertEqual(nothing.returncode, 2)
        self.assertIn("usage: ", nothing.stderr)
        nowhere = subprocess.run([program, os.path.join(PICTURES, "no", "where.svg")], capture_output=True, text=True)
        self.assertEqual(nowhere.returncode, 1)
        self.assertIn("cannot write", nowhere.stderr)

    def test_nearest(self):
        run = Run("nearest")
        curve = run.paths()[0][0]
        places = samples(curve, 4000)
        self.assertEqual(len(run.lines), 6)
        ends = 0
        for line in run.lines:
            qx, qy, x, y, t, distance = numbers(line)
            self.assertAlmostEqual(distance, to_polyline((qx, qy), places), delta=1e-3)
            self.near(at(curve, t), (x, y), 1e-3)
            ends += t in (0.0, 1.0)
        self.assertEqual(ends, 2)
        # All that is drawn: a line from each place to its foot.
        lines = run.polylines()
        self.assertEqual(len(lines), 13 * 20 + 6)
        coarse = places[::40]
        for q, foot in lines:
            self.assertLessEqual(math.dist(q, foot), to_polyline(q, coarse) + 0.1)

    def test_spacing(self):
        run = Run("spacing")
        count = 20000
        places = samples(run.paths()[0][0], count)
        so_far = list(itertools.accumulate(map(math.dist, places, places[1:]), initial=0.0))
        whole = numbers(run.lines[0])[0]
        self.assertAlmostEqual(whole, so_far[-1], delta=1e-3)
        marks = [numbers(line) for line in run.lines[1:]]
        self.assertEqual([mark[0] for mark in marks], list(range(31)))
        equal = [whole * i / 30 for i in range(31)]
        self.near([so_far[round(mark[1] * count)] for mark in marks], equal, 0.05)
        self.near([mark[2] for mark in marks], equal, 1e-4)

    def test_flatten(self):
        run = Run("flatten")
        curve = [(20, 30), (120, 460), (240, -300), (460, 170)]
        polylines = run.polylines()
        counts = []
        for i, (line, polyline) in enumerate(zip(run.lines, polylines)):
            tolerance, lines, off = numbers(line)
            self.assertEqual(tolerance, 16 / 4 ** i)
            self.assertEqual(len(polyline), lines + 1)
            counts.append(lines)
            self.assertLess(off, tolerance)
            up = polyline[0][1] - 30
            moved = [(x, y + up) for x, y in curve]
            worst = max(to_polyline(p, polyline) for p in samples(moved, 300))
            self.assertAlmostEqual(worst, off, delta=0.02 * off + 1e-3)
        self.assertEqual(len(counts), 4)
        self.assertEqual(counts, sorted(set(counts)))

    def test_extents(self):
        run = Run("extents")
        places = samples(run.paths()[0][0], 20000)
        xs, ys = zip(*places)
        self.near(numbers(run.lines[-2]), (min(xs), max(ys), max(xs), min(ys)), 1e-4)
        xs, ys = zip(*run.paths()[0][0])
        self.near(numbers(run.lines[-1]), (min(xs), max(ys), max(xs), min(ys)), 0)
        self.assertEqual(len(run.lines), 2 + 5)

    def test_crossings(self):
        run = Run("crossings")
        # T(T(x)) is the Chebyshev polynomial of degree 9: with x = cos(u) it equals x where cos(9u) = cos(u).
        angles = [k * math.pi / 4 for k in range(5)] + [k * math.pi / 5 for k in range(1, 5)]
        expected = sorted((100 * math.cos(u), 100 * math.cos(3 * u)) for u in angles)
        found = sorted(tuple(numbers(line)[:2]) for line in run.lines[1:])
        self.assertEqual(len(found), 9)
        for one, other in zip(found, expected):
            self.near(one, other, 1e-5)
        first, second = (path[0] for path in run.paths())
        for line in run.lines[1:]:
            x, y, s, t = numbers(line)
            self.near(at(first, s), (x, y), 1e-2)
            self.near(at(second, t), (x, y), 1e-2)

    def test_offset(self):
        run = Run("offset")
        paths = run.paths()
        places = samples(paths[-1][0], 2000)
        drawn = 0
        for line in run.lines:
            distance, count, _, off = numbers(line)
            self.assertLessEqual(off, 0.0501)
            # Each place of an offset has a foot on the curve, at the distance and on its side: to the left is positive.
            for (offset,) in paths[drawn:drawn + int(count)]:
                for p in samples(offset, 4):
                    feet = [i for i, q in enumerate(places) if abs(math.dist(p, q) - abs(distance)) < 0.15]
                    self.assertTrue(any(side(places, i, p) * distance > 0 for i in feet), f"{p} at {distance}")
            drawn += int(count)
        self.assertEqual(drawn, len(paths) - 1)
        self.assertEqual([numbers(line)[0] for line in run.lines], [12 * i for i in range(-6, 7) if i])

    def test_fit(self):
        run = Run("fit")
        source = [(40, 50), (70, 300), (330, 320), (440, 40)]
        errors = [numbers(line)[1] for line in run.lines]
        self.assertEqual(errors, sorted(errors, reverse=True))
        self.assertLess(errors[-1], 0.1)
        self.near(numbers(run.lines[-1])[2:], source[1] + source[2], 0.2)
        # The first fit is off by what it says.
        points = run.circles()[-25:]
        first = samples(run.paths()[0][0], 2000)
        self.assertAlmostEqual(max(to_polyline(p, first) for p in points), errors[0], delta=0.01)
        for p in points:
            self.assertLess(to_polyline(p, samples(source, 2000)), 1e-3)

    def test_integers(self):
        run = Run("integers")
        curve = [(2, 3), (13, 43), (25, -25), (46, 22)]
        self.assertEqual(run.lines[-1], "the pieces meet")
        for i, line in enumerate(run.lines[:-1]):
            _, x, y, rx, ry, hx, hy = numbers(line)
            self.near((x, y), at(curve, i / 16), 1e-6)
            self.near((rx, ry), (x, y), 0.5)
            # A halving averages three times, and each average loses up to one half; there are four.
            self.near((hx, hy), (x, y), 4 * 3 * 0.5)
        self.assertEqual(i, 16)

    def test_decomposition(self):
        run = Run("decomposition")
        sx, sy, skew, rotation, dx, dy = numbers(run.lines[0])
        c, s = math.cos(rotation), math.sin(rotation)
        matrix = (c * sx, c * sy * skew - s * sy, dx, s * sx, s * sy * skew + c * sy, dy)
        self.near(matrix, (1.1, 0.05, 30, 0.4, 0.95, 25), 1e-8)
        self.near(numbers(run.lines[1]), (1.1, 0.05, 30, 0.4, 0.95, 25), 1e-8)
        self.assertEqual(len(run.polylines("polygon")), 1 + 10)

    def test_ellipse(self):
        run = Run("ellipse")
        a, b, c, d = 1.2, 0.9, -0.3, 0.8
        longer, shorter, mx, my, nx, ny = numbers(run.lines[0])
        self.assertAlmostEqual(longer * shorter, 100 ** 2 * (a * d - b * c), delta=1e-4)
        self.assertAlmostEqual(longer ** 2 + shorter ** 2, 100 ** 2 * (a * a + b * b + c * c + d * d), delta=1e-4)
        self.near((math.hypot(mx, my), math.hypot(nx, ny)), (longer, shorter), 1e-6)
        self.assertAlmostEqual(mx * nx + my * ny, 0, delta=1e-4)
        # The image of a vector is the longest where the matrix sends it along the longer axis.
        images = [(100 * (a * math.cos(u) + b * math.sin(u)), 100 * (c * math.cos(u) + d * math.sin(u)))
                  for u in (i * math.tau / 100000 for i in range(100000))]
        far = max(images, key=lambda p: math.hypot(*p))
        self.assertLess(abs(far[0] * my - far[1] * mx), 5)
        xs, ys = zip(*images)
        self.near(numbers(run.lines[1]), (min(xs), max(ys), max(xs), min(ys)), 1e-4)

    def test_spline(self):
        run = Run("spline")
        curves = run.paths()[0]
        points, count, printed = numbers(run.lines[0])
        self.assertEqual((points, count), (15, 15))
        self.assertEqual(len(curves), 15)
        self.assertAlmostEqual(printed, sum(length(samples(curve, 500)) for curve in curves), delta=0.02)
        self.assertLess(numbers(run.lines[1])[0], 1e-11)
        for one, other in zip(curves, curves[1:] + curves[:1]):
            self.near(one[3], other[0], 1e-4)
            for axis in (0, 1):
                self.assertAlmostEqual(one[3][axis] - one[2][axis], other[1][axis] - other[0][axis], delta=1e-3)
                bend = (one[3][axis] - 2 * one[2][axis] + one[1][axis], other[2][axis] - 2 * other[1][axis] + other[0][axis])
                self.assertAlmostEqual(*bend, delta=1e-3)

    def test_warp(self):
        run = Run("warp")
        self.assertEqual(numbers(run.lines[0])[:2], [193, 121])
        # The cells within the three circles.
        cells = sum(1 for radius in (44, 34, 17) for x in range(-radius, radius + 1) for y in range(-radius, radius + 1)
                    if x * x + y * y < radius * radius)
        self.assertLessEqual(numbers(run.lines[0])[2], 1.2 * cells)
        self.assertGreaterEqual(numbers(run.lines[0])[2], 0.9 * cells)

        def swirl(x, y):
            fade = 1 - (x * x + y * y) / 44 ** 2
            c, s = math.cos(2.4 * fade * fade), math.sin(2.4 * fade * fade)
            return c * x - s * y - x, s * x + c * y - y

        cell = [[swirl(x, y) for x in (0, 1)] for y in (28, 29)]
        between = [0.75 * 0.5 * (cell[0][0][axis] + cell[0][1][axis]) + 0.25 * 0.5 * (cell[1][0][axis] + cell[1][1][axis])
                   for axis in (0, 1)]
        self.near(numbers(run.lines[1])[2:], (54.5 + between[0], 90.25 + between[1]), 1e-4)

    def test_layout(self):
        run = Run("layout")
        boxes = [numbers(line.split("left", 1)[1]) for line in run.lines]
        self.assertEqual(boxes, [[40, 860, 1360, 716], [40, 680, 320, 40], [490, 600, 910, 300], [1040, 220, 1340, 40],
                                 [1100, 680, 1340, 440]])

    def test_cube(self):
        run = Run("cube")
        turns = [numbers(line) for line in run.lines]
        self.assertEqual(len(turns), 7)
        for turn in turns:
            self.assertAlmostEqual(turn[5], 1, delta=1e-14)
        # Equal steps along an arc.
        steps = [sum(a * b for a, b in zip(one[1:5], other[1:5])) for one, other in zip(turns, turns[1:])]
        self.near(steps, [steps[0]] * 6, 5e-5)
        self.assertLess(steps[0], 0.99)
        # At most three faces of a cube are seen at once.
        self.assertLessEqual(len(run.polylines("polygon")), 1 + 7 * 3)
        self.assertGreaterEqual(len(run.polylines("polygon")), 1 + 7)


if __name__ == "__main__":
    os.makedirs(PICTURES, exist_ok=True)
    unittest.main(argv=sys.argv[:1])
