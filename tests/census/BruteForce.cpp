#include "tests/census/BruteForce.h"

#include "ZarnMath/Bezier.h"
#include "ZarnMath/Bezier/PowerForm.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace ZarnMath::Census {

namespace {

using namespace CubicBezier;

constexpr int deepest = 12;
/// More pairs than any number of isolated contacts leaves.
constexpr std::size_t mostPairs = 2000;
constexpr int samples = 2048;

struct Piece
{
    Cubic points;
    double start;
    double end;
};

struct Range
{
    double low;
    double high;
};

template <double point2d::*Axis>
Range RangeOf(const Cubic& c)
{
    const auto [low, high] = std::minmax({c[0].*Axis, c[1].*Axis, c[2].*Axis, c[3].*Axis});
    return {low, high};
}

bool Overlap(const Range& a, const Range& b)
{
    return a.low <= b.high && b.low <= a.high;
}

bool Overlap(const Cubic& a, const Cubic& b)
{
    return Overlap(RangeOf<&point2d::x>(a), RangeOf<&point2d::x>(b)) &&
           Overlap(RangeOf<&point2d::y>(a), RangeOf<&point2d::y>(b));
}

std::array<Piece, 2> Halve(const Piece& whole)
{
    const double middle = (whole.start + whole.end) * 0.5;
    std::array<Piece, 2> halves{{{{}, whole.start, middle}, {{}, middle, whole.end}}};
    Split(whole.points.data(), halves[0].points.data(), halves[1].points.data());
    return halves;
}

/// Collects the pairs of smallest pieces whose boxes overlap, up to the limit and a few beyond.
void CollectPairs(const Piece& first, const Piece& second, int depth, std::vector<std::pair<double, double>>& pairs)
{
    if (pairs.size() > mostPairs || !Overlap(first.points, second.points))
        return;
    if (depth == deepest) {
        pairs.emplace_back((first.start + first.end) * 0.5, (second.start + second.end) * 0.5);
        return;
    }
    for (const Piece& one : Halve(first))
        for (const Piece& other : Halve(second))
            CollectPairs(one, other, depth + 1, pairs);
}

double SizeOf(const Cubic& c)
{
    double size = 0.0;
    for (const point2d& p : c)
        size = std::max({size, std::fabs(p.x), std::fabs(p.y)});
    return size;
}

/// Newton's method on P(s) - Q(t).
std::optional<Contact> Polish(const PowerForm& f, const PowerForm& g, double s, double t, double tolerance)
{
    for (int step = 0; step < 60; ++step) {
        const vector2d gap = Evaluate(g, t) - Evaluate(f, s);
        const vector2d u = Derivative(f.a, f.b, f.c, s);
        const vector2d v = Derivative(g.a, g.b, g.c, t);
        const double determinant = Cross(u, v);
        if (determinant == 0.0)
            break;
        s += Cross(gap, v) / determinant;
        t += Cross(gap, u) / determinant;
    }
    constexpr double rounding = 1e-9;
    const bool isInside = s >= -rounding && s <= 1.0 + rounding && t >= -rounding && t <= 1.0 + rounding;
    if (!isInside || !(std::sqrt(LengthSquared(Evaluate(g, t) - Evaluate(f, s))) <= tolerance))
        return std::nullopt;
    return Contact{std::clamp(s, 0.0, 1.0), std::clamp(t, 0.0, 1.0), Evaluate(g, t)};
}

} // namespace

std::optional<std::vector<Contact>> FindContacts(const Cubic& first, const Cubic& second)
{
    std::vector<std::pair<double, double>> pairs;
    CollectPairs({first, 0.0, 1.0}, {second, 0.0, 1.0}, 0, pairs);
    if (pairs.size() > mostPairs)
        return std::nullopt;
    const PowerForm f = ToPowerForm(first.data());
    const PowerForm g = ToPowerForm(second.data());
    const double tolerance = 1e-11 * std::max(SizeOf(first), SizeOf(second));
    constexpr double nearby = 1.0 / 4096.0;
    std::vector<Contact> contacts;
    for (const auto& [s, t] : pairs) {
        const auto contact = Polish(f, g, s, t, tolerance);
        if (!contact || std::fabs(contact->s - s) > 8.0 * nearby || std::fabs(contact->t - t) > 8.0 * nearby)
            continue;
        const bool isKnown = std::any_of(contacts.begin(), contacts.end(), [&](const Contact& known) {
            return std::fabs(known.s - contact->s) < 1e-5 && std::fabs(known.t - contact->t) < 1e-5;
        });
        if (!isKnown)
            contacts.push_back(*contact);
    }
    return contacts;
}

std::vector<double> FindZeros(const std::function<double(double)>& f, double tolerance)
{
    // An odd number of samples keeps them off the halves and quarters, where drawings put their zeros.
    constexpr int count = samples + 1;
    std::vector<double> zeros;
    if (std::fabs(f(0.0)) <= tolerance)
        zeros.push_back(0.0);
    for (int i = 0; i < count; ++i) {
        double low = i == 0 ? 1e-9 : static_cast<double>(i) / count;
        double high = i + 1 == count ? 1.0 - 1e-9 : static_cast<double>(i + 1) / count;
        const double atLow = f(low);
        if (!(atLow * f(high) < 0.0))
            continue;
        for (int step = 0; step < 60; ++step) {
            const double middle = (low + high) * 0.5;
            (f(middle) * atLow > 0.0 ? low : high) = middle;
        }
        zeros.push_back((low + high) * 0.5);
    }
    if (std::fabs(f(1.0)) <= tolerance)
        zeros.push_back(1.0);
    return zeros;
}

double FindNearest(const Cubic& curve, const point2d& q)
{
    const PowerForm f = ToPowerForm(curve.data());
    const auto distance = [&](double t) { return LengthSquared(Evaluate(f, t) - q); };
    int best = 0;
    double least = std::numeric_limits<double>::max();
    for (int i = 0; i <= samples; ++i) {
        const double d = distance(static_cast<double>(i) / samples);
        if (d < least) {
            least = d;
            best = i;
        }
    }
    double low = std::max(0, best - 1) / static_cast<double>(samples);
    double high = std::min(samples, best + 1) / static_cast<double>(samples);
    for (int step = 0; step < 80; ++step) {
        const double third = (high - low) / 3.0;
        if (distance(low + third) <= distance(high - third))
            high -= third;
        else
            low += third;
    }
    // Where the curve starts or ends with no speed, the distance is too flat to tell its end from the parameters
    // beside.
    const double inside = (low + high) * 0.5;
    const double nearly = std::sqrt(distance(inside)) + 1e-9 * SizeOf(curve);
    for (const double end : {0.0, 1.0})
        if (std::sqrt(distance(end)) <= nearly)
            return end;
    return inside;
}

} // namespace ZarnMath::Census
