// The questions of the comparison, asked of bezier-js, paper and flo-poly on the same corpus.
//
//   node peers.js FOLDER     FOLDER as written by zarnmath_peers --corpus

import { readFileSync } from "node:fs";
import { join } from "node:path";
import { Bezier } from "bezier-js";
import { allRoots } from "flo-poly";
import paper from "paper/dist/paper-core.js";

const rounds = 7;

/** Long enough for the clock, and for the compiler to have warmed up. */
const sliceInNanoseconds = 3e7;

const folder = process.argv[2];

/** Elements of a given number of doubles. */
function read(file, size) {
  const bytes = readFileSync(join(folder, file));
  const doubles = new Float64Array(bytes.buffer.slice(bytes.byteOffset, bytes.byteOffset + bytes.byteLength));
  const elements = [];
  for (let i = 0; i < doubles.length; i += size) elements.push(Array.from(doubles.subarray(i, i + size)));
  return elements;
}

const curves = read("curves", 8);
const others = read("others", 8);
const points = read("points", 2);
const lines = read("lines", 4);
const nearest = read("nearest", 1);
const lengths = read("lengths", 1);
const boxes = read("boxes", 4);

const bezierCurves = curves.map((c) => new Bezier(...c));
const bezierOthers = others.map((c) => new Bezier(...c));
const bezierPoints = points.map(([x, y]) => ({ x, y }));
const bezierLines = lines.map(([x1, y1, x2, y2]) => ({ p1: { x: x1, y: y1 }, p2: { x: x2, y: y2 } }));

paper.setup(new paper.Size(1, 1));
const toPaper = ([x0, y0, x1, y1, x2, y2, x3, y3]) =>
  new paper.Curve(new paper.Point(x0, y0), new paper.Point(x1 - x0, y1 - y0), new paper.Point(x2 - x3, y2 - y3), new paper.Point(x3, y3));
const paperCurves = curves.map(toPaper);
const paperOthers = others.map(toPaper);
const paperLines = lines.map(([x1, y1, x2, y2]) => toPaper([x1, y1, x1, y1, x2, y2, x2, y2]));
const paperPoints = points.map(([x, y]) => new paper.Point(x, y));

/** What answers are worth: kept, so that no call is optimised away. */
let sink = 0;

/** The median time of an answer in nanoseconds, over passes through the first `count` elements. */
function time(count, answer) {
  const pass = (repetitions) => {
    const start = process.cpuUsage();
    for (let k = 0; k < repetitions; ++k) for (let i = 0; i < count; ++i) sink += answer(i) ? 1 : 0;
    const { user, system } = process.cpuUsage(start);
    return ((user + system) * 1e3) / (count * repetitions);
  };
  const once = pass(1) * count;
  if (once > 10 * sliceInNanoseconds) return once / count;
  const repetitions = Math.max(1, Math.floor(sliceInNanoseconds / once));
  const times = Array.from({ length: rounds }, () => pass(repetitions)).sort((a, b) => a - b);
  return times[Math.floor(rounds / 2)];
}

function errors(all) {
  const sorted = Float64Array.from(all.filter((e) => !Number.isNaN(e))).sort();
  const measures = {
    "median error": sorted[Math.floor(sorted.length / 2)],
    "nine in ten": sorted[Math.floor((sorted.length * 9) / 10)],
    "largest error": sorted[sorted.length - 1],
  };
  if (sorted.length < all.length) measures.failed = all.length - sorted.length;
  return measures;
}

function tell(question, library, setting, nanoseconds, measures) {
  console.log(JSON.stringify({ question, library, setting, nanoseconds, measures }));
}

const indices = curves.map((_, i) => i);

/** @param answer answer(i), timed; @param error error(i) of what it returns */
function ask(question, library, setting, answer, error) {
  tell(question, library, setting, time(curves.length, answer), errors(indices.map(error)));
}

function at([x0, y0, x1, y1, x2, y2, x3, y3], t) {
  const s = 1 - t;
  const [a, b, c, d] = [s * s * s, 3 * s * s * t, 3 * s * t * t, t * t * t];
  return [a * x0 + b * x1 + c * x2 + d * x3, a * y0 + b * y1 + c * y2 + d * y3];
}

const distance = ([ax, ay], [bx, by]) => Math.hypot(ax - bx, ay - by);

function askForNearest() {
  const error = (t) => (i) => Math.abs(distance(at(curves[i], t(i)), points[i]) - nearest[i][0]);
  const project = (i) => bezierCurves[i].project(bezierPoints[i]);
  ask("nearest point", "bezier-js", "", project, error((i) => project(i).t));
  const search = (i) => paperCurves[i].getNearestLocation(paperPoints[i]);
  ask("nearest point", "paper", "", search, error((i) => search(i).time));
}

/** @param find find(i) as pairs of parameters, for the errors; @param answer the timed call */
function askForCrossings(question, library, answer, find, second, count = curves.length) {
  const gaps = [];
  for (let i = 0; i < count; ++i)
    for (const [s, t] of find(i)) gaps.push(distance(at(curves[i], s), second(i, t)));
  const found = (gaps.length * curves.length) / count;
  tell(question, library, "", time(count, answer), { found, ...errors(gaps) });
}

function askForCurveCrossings() {
  const question = "crossings of two curves";
  const onOther = (i, t) => at(others[i], t);
  const byBezier = (i) => bezierCurves[i].intersects(bezierOthers[i]);
  const pairs = (i) => byBezier(i).map((pair) => pair.split("/").map(Number));
  // It halves both curves into thousands of pairs: the first of the corpus have to do.
  askForCrossings(question, "bezier-js", byBezier, pairs, onOther, 60);
  const byPaper = (i) => paperCurves[i].getIntersections(paperOthers[i]);
  const locations = (i) => byPaper(i).map((l) => [l.time, l.intersection.time]);
  askForCrossings(question, "paper", byPaper, locations, onOther);
}

function askForLineCrossings() {
  const question = "crossings with a segment";
  const onLine = (i, t) => [lines[i][0] + (lines[i][2] - lines[i][0]) * t, lines[i][1] + (lines[i][3] - lines[i][1]) * t];
  const project = (i, [x, y]) => {
    const [x1, y1, x2, y2] = lines[i];
    return ((x - x1) * (x2 - x1) + (y - y1) * (y2 - y1)) / ((x2 - x1) ** 2 + (y2 - y1) ** 2);
  };
  const byBezier = (i) => bezierCurves[i].intersects(bezierLines[i]);
  // It names the parameter on the curve alone.
  const pairs = (i) => byBezier(i).map((t) => [t, project(i, at(curves[i], t))]);
  askForCrossings(question, "bezier-js", byBezier, pairs, onLine);
  const byPaper = (i) => paperCurves[i].getIntersections(paperLines[i]);
  const locations = (i) => byPaper(i).map((l) => [l.time, project(i, [l.point.x, l.point.y])]);
  askForCrossings(question, "paper", byPaper, locations, onLine);
}

function askForLength() {
  const error = (length) => (i) => Math.abs(length(i) - lengths[i][0]);
  const byBezier = (i) => bezierCurves[i].length();
  ask("arc length", "bezier-js", "", byBezier, error(byBezier));
  // Kept by a curve once it is known: a copy has to work it out again.
  const byPaper = (i) => paper.Curve.getLength(paperCurves[i].getValues());
  ask("arc length", "paper", "", byPaper, error(byPaper));
}

function askForBox() {
  const gap = (i, left, bottom, right, top) =>
    Math.max(Math.abs(left - boxes[i][0]), Math.abs(bottom - boxes[i][1]), Math.abs(right - boxes[i][2]), Math.abs(top - boxes[i][3]));
  const byBezier = (i) => new Bezier(...curves[i]).bbox();
  ask("tight box", "bezier-js", "", byBezier, (i) => {
    const { x, y } = byBezier(i);
    return gap(i, x.min, y.min, x.max, y.max);
  });
  const byPaper = (i) => paperCurves[i].getBounds();
  ask("tight box", "paper", "", byPaper, (i) => {
    const box = byPaper(i);
    return gap(i, box.left, box.top, box.right, box.bottom);
  });
}

/** Highest power first, by forward differences. */
function toFallingPowers(bernstein) {
  const n = bernstein.length - 1;
  const differences = [...bernstein];
  const coefficients = new Array(n + 1);
  let binomial = 1;
  for (let i = 0; i <= n; ++i) {
    coefficients[n - i] = binomial * differences[0];
    for (let j = 0; j + i < n; ++j) differences[j] = differences[j + 1] - differences[j];
    binomial = (binomial * (n - i)) / (i + 1);
  }
  return coefficients;
}

function askForRoots(degree) {
  const polynomials = read(`polynomials-${degree}`, degree + 1).map(toFallingPowers);
  const truths = read(`roots-${degree}`, degree + 1).map(([count, ...roots]) => roots.slice(0, count));
  // It takes intervals, and may need several to narrow a root down: the middle of each counts.
  const answer = (i) => allRoots(polynomials[i], 0, 1);
  let [found, missed, largest] = [0, 0, 0];
  truths.forEach((expected, i) => {
    const roots = answer(i).map((r) => (typeof r === "number" ? r : (r.tS + r.tE) / 2));
    found += roots.length;
    for (const root of expected) {
      const error = Math.min(1, ...roots.map((r) => Math.abs(r - root)));
      if (error < 1e-5) largest = Math.max(largest, error);
      else ++missed;
    }
  });
  const measures = { "roots each": found / truths.length, missed, "largest error": largest };
  tell(`roots of degree ${degree}`, "flo-poly", "", time(truths.length, answer), measures);
}

askForNearest();
[3, 5, 9, 12].forEach(askForRoots);
askForCurveCrossings();
askForLineCrossings();
askForLength();
askForBox();
