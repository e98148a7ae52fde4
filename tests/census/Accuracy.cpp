// zarnmath_accuracy [SEED [CASES]]: measures, over random curves, how exact lengths and polylines are, and prints Markdown.

#include "ZarnMath/Bezier.h"
#include "ZarnMath/BezierToLines.h"
#include "ZarnMath/Line.h"
#include "tests/Random.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <exception>
#include <iostream>
#include <limits>
#include <string>
#include <vector>

namespace ZarnMath::Census {

namespace {

constexpr double extent = 1000.0;
/// In so many pieces the length is taken that the others are compared with.
constexpr int referencePieces = 256;
/// So many places of a curve are compared with its polyline.
constexpr int samples = 512;

/// As curves are commonly drawn: handles of 0.2 to 0.5 of the chord, within 60 degrees of it.
Cubic GentleCurve(RandomSource& random)
{
    const point2d start = random.Point(extent);
    const point2d end = random.Point(extent);
    const vector2d along = end - start;
    const vector2d across = Perpendicular(along);
    const auto handle = [&] {
        const double angle = random.Uniform(-1.047, 1.047);
        return (along * std::cos(angle) + across * std::sin(angle)) * random.Uniform(0.2, 0.5);
    };
    const vector2d first = handle();
    const vector2d second = handle();
    return {start, start + first, end - second, end};
}

Cubic AnyCurve(RandomSource& random)
{
    return random.Curve(Shape::Generic, extent);
}

double ReferenceLength(const Cubic& curve)
{
    double length = 0.0;
    for (int i = 0; i < referencePieces; ++i) {
        Cubic piece;
        CubicBezier::Subsection(static_cast<double>(i) / referencePieces, (i + 1.0) / referencePieces, curve.data(),
                                piece.data());
        length += CubicBezier::Length(piece.data(), LengthAccuracy::Order16);
    }
    return length;
}

/// The value that so large a part of the values does not exceed.
double Quantile(std::vector<double>& values, double part)
{
    const auto place = values.begin() + static_cast<std::ptrdiff_t>(part * static_cast<double>(values.size() - 1));
    std::nth_element(values.begin(), place, values.end());
    return *place;
}

using Draw = Cubic(RandomSource&);

void MeasureLengths(const char* kind, Draw* draw, std::uint64_t seed, int cases)
{
    for (const LengthAccuracy accuracy : {LengthAccuracy::Order8, LengthAccuracy::Order10, LengthAccuracy::Order16}) {
        RandomSource random(seed);
        std::vector<double> errors;
        for (int i = 0; i < cases; ++i) {
            const Cubic curve = draw(random);
            errors.push_back(std::fabs(CubicBezier::Length(curve.data(), accuracy) / ReferenceLength(curve) - 1.0));
        }
        std::cout << "| " << kind << " | " << static_cast<int>(accuracy) << " | " << Quantile(errors, 0.5) << " | "
                  << Quantile(errors, 0.99) << " | " << Quantile(errors, 1.0) << " |\n";
    }
}

/// The largest squared distance of the curve from the polyline.
double LargestDeviation(const Cubic& curve, const std::vector<point2d>& points, int lines)
{
    double largest = 0.0;
    for (int i = 1; i < samples; ++i) {
        Cubic piece;
        CubicBezier::LeftOf(static_cast<double>(i) / samples, curve.data(), piece.data());
        double smallest = std::numeric_limits<double>::max();
        for (std::size_t k = 0; k < static_cast<std::size_t>(lines); ++k)
            smallest = std::min(smallest, DistanceToLineSegmentSqrd(points[k], points[k + 1], piece[3]));
        largest = std::max(largest, smallest);
    }
    return largest;
}

void MeasurePolylines(const char* kind, Draw* draw, std::uint64_t seed, int cases)
{
    constexpr int mostLines = 2047;
    constexpr double distance = 0.5;
    RandomSource random(seed);
    std::vector<point2d> points(mostLines + 1);
    std::vector<double> deviations;
    for (int i = 0; i < cases; ++i) {
        const Cubic curve = draw(random);
        const int lines = AdaptiveBezierToLines(curve.data(), points.data(), distance * distance, mostLines);
        deviations.push_back(std::sqrt(LargestDeviation(curve, points, lines)));
    }
    const auto straying = std::count_if(deviations.begin(), deviations.end(), [](double d) { return d > distance; });
    std::cout << "| " << kind << " | " << Quantile(deviations, 0.5) << " | " << Quantile(deviations, 0.99) << " | "
              << Quantile(deviations, 1.0) << " | " << straying << " of " << cases << " |\n";
}

void MeasureAll(std::uint64_t seed, int cases)
{
    std::cout.precision(1);
    std::cout << std::scientific << "\n### Lengths\n\n| curves | samples | median | 99 of 100 below | largest |\n"
              << "|---|---:|---:|---:|---:|\n";
    MeasureLengths("gentle", GentleCurve, seed, cases);
    MeasureLengths("any", AnyCurve, seed, cases);
    std::cout.precision(2);
    std::cout << std::fixed << "\n### Polylines\n\n| curves | median | 99 of 100 below | largest | beyond 0.5 |\n"
              << "|---|---:|---:|---:|---:|\n";
    MeasurePolylines("gentle", GentleCurve, seed, cases);
    MeasurePolylines("any", AnyCurve, seed, cases);
}

} // namespace

} // namespace ZarnMath::Census

int main(int argc, char** argv)
{
    try {
        const std::uint64_t seed = argc > 1 ? std::stoull(argv[1]) : 20261120;
        const int cases = argc > 2 ? std::stoi(argv[2]) : 5000;
        ZarnMath::Census::MeasureAll(seed, cases);
    } catch (const std::exception& trouble) {
        std::cerr << "usage: zarnmath_accuracy [SEED [CASES]]\n" << trouble.what() << '\n';
        return 2;
    }
    return 0;
}
