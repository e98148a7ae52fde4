// The questions of the comparison, asked of kurbo on the same corpus.
//
//   kurbo-peer FOLDER     FOLDER as written by zarnmath_peers --corpus

use kurbo::common::solve_cubic;
use kurbo::{
    CubicBez, Line, ParamCurve, ParamCurveArclen, ParamCurveExtrema, ParamCurveNearest, PathEl, PathSeg, Point,
};
use std::hint::black_box;
use std::path::Path;

const ROUNDS: usize = 11;

/// Long enough for the clock.
const SLICE_IN_NANOSECONDS: f64 = 4e6;

struct Corpus {
    curves: Vec<CubicBez>,
    points: Vec<Point>,
    lines: Vec<Line>,
    nearest: Vec<f64>,
    lengths: Vec<f64>,
    boxes: Vec<Vec<f64>>,
    cubics: Vec<Vec<f64>>,
    roots: Vec<Vec<f64>>,
}

/// Elements of a given number of doubles.
fn read(folder: &Path, file: &str, size: usize) -> Vec<Vec<f64>> {
    let bytes = std::fs::read(folder.join(file)).expect("a file of the corpus");
    let doubles: Vec<f64> =
        bytes.chunks_exact(8).map(|b| f64::from_ne_bytes([b[0], b[1], b[2], b[3], b[4], b[5], b[6], b[7]])).collect();
    doubles.chunks_exact(size).map(|c| c.to_vec()).collect()
}

fn points(c: &[f64]) -> Vec<Point> {
    c.chunks_exact(2).map(|p| Point::new(p[0], p[1])).collect()
}

impl Corpus {
    fn read(folder: &Path) -> Corpus {
        let singles = |file| read(folder, file, 1).into_iter().map(|v| v[0]).collect();
        Corpus {
            curves: read(folder, "curves", 8)
                .iter()
                .map(|c| {
                    let p = points(c);
                    CubicBez::new(p[0], p[1], p[2], p[3])
                })
                .collect(),
            points: read(folder, "points", 2).iter().map(|c| points(c)[0]).collect(),
            lines: read(folder, "lines", 4).iter().map(|c| Line::new(points(c)[0], points(c)[1])).collect(),
            nearest: singles("nearest"),
            lengths: singles("lengths"),
            boxes: read(folder, "boxes", 4),
            cubics: read(folder, "polynomials-3", 4).iter().map(|b| rising_powers(b)).collect(),
            roots: read(folder, "roots-3", 4),
        }
    }
}

/// The coefficients of a cubic from its Bernstein coefficients.
fn rising_powers(b: &[f64]) -> Vec<f64> {
    vec![b[0], 3.0 * (b[1] - b[0]), 3.0 * (b[2] - 2.0 * b[1] + b[0]), b[3] - 3.0 * b[2] + 3.0 * b[1] - b[0]]
}

/// The time that this thread has run, in nanoseconds.
fn now() -> f64 {
    let mut time = libc::timespec { tv_sec: 0, tv_nsec: 0 };
    unsafe { libc::clock_gettime(libc::CLOCK_THREAD_CPUTIME_ID, &mut time) };
    time.tv_sec as f64 * 1e9 + time.tv_nsec as f64
}

/// The median time of an answer, over passes through the whole corpus.
fn time<T>(count: usize, mut answer: impl FnMut(usize) -> T) -> f64 {
    let mut pass = |repetitions: usize| {
        let start = now();
        for _ in 0..repetitions {
            for i in 0..count {
                black_box(answer(i));
            }
        }
        (now() - start) / (count * repetitions) as f64
    };
    let repetitions = (SLICE_IN_NANOSECONDS / (pass(1) * count as f64)).max(1.0) as usize;
    let mut times: Vec<f64> = (0..ROUNDS).map(|_| pass(repetitions)).collect();
    times.sort_by(|a, b| a.partial_cmp(b).unwrap());
    times[ROUNDS / 2]
}

fn errors(mut all: Vec<f64>) -> Vec<(&'static str, f64)> {
    all.sort_by(|a, b| a.partial_cmp(b).unwrap());
    vec![
        ("median error", all[all.len() / 2]),
        ("nine in ten", all[all.len() * 9 / 10]),
        ("largest error", all[all.len() - 1]),
    ]
}

fn tell(question: &str, setting: &str, nanoseconds: f64, measures: &[(&str, f64)]) {
    let list: Vec<String> = measures.iter().map(|(name, value)| format!("\"{}\":{:e}", name, value)).collect();
    println!(
        "{{\"question\":\"{}\",\"library\":\"kurbo\",\"setting\":\"{}\",\"nanoseconds\":{},\"measures\":{{{}}}}}",
        question,
        setting,
        nanoseconds,
        list.join(",")
    );
}

fn ask_for_nearest(corpus: &Corpus) {
    for &(setting, accuracy) in &[("0.1", 0.1), ("0.001", 0.001)] {
        let answer = |i: usize| corpus.curves[i].nearest(corpus.points[i], accuracy);
        let found = (0..corpus.curves.len())
            .map(|i| ((corpus.curves[i].eval(answer(i).0) - corpus.points[i]).hypot() - corpus.nearest[i]).abs())
            .collect();
        tell("nearest point", setting, time(corpus.curves.len(), answer), &errors(found));
    }
}

fn ask_for_roots(corpus: &Corpus) {
    let answer = |i: usize| {
        let c = &corpus.cubics[i];
        solve_cubic(c[0], c[1], c[2], c[3])
    };
    let (mut found, mut missed, mut largest) = (0.0, 0.0, 0.0_f64);
    for i in 0..corpus.cubics.len() {
        let roots: Vec<f64> = answer(i).into_iter().filter(|t| *t > 0.0 && *t < 1.0).collect();
        found += roots.len() as f64;
        for expected in &corpus.roots[i][1..1 + corpus.roots[i][0] as usize] {
            let error = roots.iter().map(|t| (t - expected).abs()).fold(1.0, f64::min);
            if error < 1e-5 {
                largest = largest.max(error);
            } else {
                missed += 1.0;
            }
        }
    }
    let count = corpus.cubics.len();
    let measures = [("roots each", found / count as f64), ("missed", missed), ("largest error", largest)];
    tell("roots of degree 3", "all real roots", time(count, answer), &measures);
}

fn ask_for_crossings_with_line(corpus: &Corpus) {
    let answer = |i: usize| PathSeg::Cubic(corpus.curves[i]).intersect_line(corpus.lines[i]);
    let mut gaps = Vec::new();
    for i in 0..corpus.curves.len() {
        for crossing in answer(i) {
            let on_curve = corpus.curves[i].eval(crossing.segment_t);
            gaps.push((on_curve - corpus.lines[i].eval(crossing.line_t)).hypot());
        }
    }
    let mut measures = vec![("found", gaps.len() as f64)];
    measures.extend(errors(gaps));
    tell("crossings with a segment", "", time(corpus.curves.len(), answer), &measures);
}

fn ask_for_length(corpus: &Corpus) {
    for &(setting, accuracy) in &[("1", 1.0), ("0.01", 0.01), ("1e-4", 1e-4), ("1e-6", 1e-6)] {
        let answer = |i: usize| corpus.curves[i].arclen(accuracy);
        let found = (0..corpus.curves.len()).map(|i| (answer(i) - corpus.lengths[i]).abs()).collect();
        tell("arc length", setting, time(corpus.curves.len(), answer), &errors(found));
    }
}

fn ask_for_box(corpus: &Corpus) {
    let answer = |i: usize| corpus.curves[i].bounding_box();
    let gap = |i: usize| {
        let found = answer(i);
        let expected = &corpus.boxes[i];
        [found.x0 - expected[0], found.y0 - expected[1], found.x1 - expected[2], found.y1 - expected[3]]
            .iter()
            .fold(0.0_f64, |worst, e| worst.max(e.abs()))
    };
    let found = (0..corpus.curves.len()).map(gap).collect();
    tell("tight box", "", time(corpus.curves.len(), answer), &errors(found));
}

fn distance_to_segment(q: Point, start: Point, end: Point) -> f64 {
    let along = end - start;
    let length = along.hypot2();
    let s = if length > 0.0 { ((q - start).dot(along) / length).max(0.0).min(1.0) } else { 0.0 };
    (q - (start + along * s)).hypot()
}

/// The largest distance of many points of a curve from a polyline.
fn deviation(curve: &CubicBez, polyline: &[Point]) -> f64 {
    let samples = 160;
    (0..=samples)
        .map(|i| {
            let q = curve.eval(i as f64 / samples as f64);
            let start = (q - polyline[0]).hypot();
            polyline.windows(2).map(|ends| distance_to_segment(q, ends[0], ends[1])).fold(start, f64::min)
        })
        .fold(0.0, f64::max)
}

fn ask_for_polyline(corpus: &Corpus) {
    for &(setting, tolerance) in
        &[("2", 2.0), ("1", 1.0), ("0.5", 0.5), ("0.2", 0.2), ("0.1", 0.1), ("0.05", 0.05), ("0.02", 0.02)]
    {
        let mut polyline = Vec::new();
        let mut answer = |i: usize| {
            let curve = &corpus.curves[i];
            polyline.clear();
            let path = [PathEl::MoveTo(curve.p0), PathEl::CurveTo(curve.p1, curve.p2, curve.p3)];
            kurbo::flatten(path.iter().cloned(), tolerance, |element| {
                if let PathEl::MoveTo(p) | PathEl::LineTo(p) = element {
                    polyline.push(p)
                }
            });
            polyline.len()
        };
        let nanoseconds = time(corpus.curves.len(), &mut answer);
        let (mut found, mut segments) = (Vec::new(), 0.0);
        for curve in &corpus.curves {
            let mut points = Vec::new();
            let path = [PathEl::MoveTo(curve.p0), PathEl::CurveTo(curve.p1, curve.p2, curve.p3)];
            kurbo::flatten(path.iter().cloned(), tolerance, |element| {
                if let PathEl::MoveTo(p) | PathEl::LineTo(p) = element {
                    points.push(p)
                }
            });
            segments += (points.len() - 1) as f64;
            found.push(deviation(curve, &points));
        }
        let mut measures = errors(found);
        measures.push(("segments", segments / corpus.curves.len() as f64));
        tell("polyline", setting, nanoseconds, &measures);
    }
}

fn main() {
    let folder = std::env::args().nth(1).expect("the folder of the corpus");
    let corpus = Corpus::read(Path::new(&folder));
    ask_for_nearest(&corpus);
    ask_for_roots(&corpus);
    ask_for_crossings_with_line(&corpus);
    ask_for_length(&corpus);
    ask_for_box(&corpus);
    ask_for_polyline(&corpus);
}
