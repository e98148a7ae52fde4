#include "benchmarks/Corpus.h"

#include "benchmarks/Glyphs.h"

#include <algorithm>

namespace ZarnMath::Benchmarks {

namespace {

using CubicBezier::Evaluate;
using CubicBezier::ToPowerForm;

/// Half the side of the square that the curves lie in.
constexpr double extent = 500.0;

Cubic NearStraight(RandomSource& random)
{
    Cubic curve = random.Curve(Shape::Straight, extent);
    for (point2d& p : curve)
        p = p + AsVector(random.Point(1.0));
    return curve;
}

Cubic LongThin(RandomSource& random)
{
    const double angle = random.Uniform(0.0, 6.283185307179586);
    const vector2d along = {std::cos(angle), std::sin(angle)};
    const vector2d across = Perpendicular(along) * 0.01;
    Cubic curve = random.Curve(Shape::Generic, extent);
    for (point2d& p : curve)
        p = AsPoint(along * p.x + across * p.y);
    return curve;
}

Cubic FromGlyph(RandomSource& random)
{
    static const std::vector<Cubic> outlines = GlyphCurves(2.0 * extent);
    Cubic curve = outlines[static_cast<std::size_t>(random.Integer(0, static_cast<int>(outlines.size()) - 1))];
    for (point2d& p : curve)
        p = p - vector2d{extent, extent};
    return curve;
}

Cubic RandomCurve(RandomSource& random, CurveClass kind)
{
    switch (kind) {
    case CurveClass::S:
        return random.Curve(Shape::S, extent);
    case CurveClass::Loop:
        return random.Curve(Shape::Loop, extent);
    case CurveClass::Cusp:
        return random.Curve(Shape::Cusp, extent);
    case CurveClass::NearStraight:
        return NearStraight(random);
    case CurveClass::LongThin:
        return LongThin(random);
    case CurveClass::Arc:
        return random.Curve(Shape::Arc, extent);
    case CurveClass::Tiny:
        return random.Curve(random.AnyShape(), 3.0);
    case CurveClass::Grid:
        return random.Curve(Shape::Grid, extent);
    case CurveClass::Glyph:
        return FromGlyph(random);
    case CurveClass::Generic:
        break;
    }
    return random.Curve(Shape::Generic, extent);
}

Cubic Moved(Cubic curve, const vector2d& by)
{
    for (point2d& p : curve)
        p = p + by;
    return curve;
}

/// The index of another curve. Over the corpus each class meets each class, its own included.
std::size_t PartnerOf(std::size_t i)
{
    return (i + curveClasses + i / curveClasses % curveClasses) % corpusSize;
}

/// A segment through a point, which divides it somewhere between a half and a sixth.
Line SegmentThrough(RandomSource& random, const point2d& p)
{
    const vector2d back = AsVector(random.Point(0.4 * extent));
    return {p + back, p - back * random.Uniform(0.2, 1.0)};
}

template <std::size_t N>
std::array<POINT, N> Rounded(const std::array<point2d, N>& points)
{
    std::array<POINT, N> rounded;
    std::transform(points.begin(), points.end(), rounded.begin(), ToPOINT);
    return rounded;
}

POINT Rounded(const point2d& p)
{
    return ToPOINT(p);
}

template <typename P, typename Q>
void Round(const std::vector<P>& from, std::vector<Q>& to)
{
    for (const P& element : from)
        to.push_back(Rounded(element));
}

Drawing<POINT> Rounded(const Drawing<point2d>& real)
{
    Drawing<POINT> integer;
    Round(real.curves, integer.curves);
    Round(real.others, integer.others);
    Round(real.points, integer.points);
    Round(real.pointsOnCurves, integer.pointsOnCurves);
    Round(real.lines, integer.lines);
    return integer;
}

} // namespace

Corpus::Corpus(std::uint64_t seed)
{
    RandomSource random(seed);
    for (std::size_t i = 0; i < corpusSize; ++i) {
        real.curves.push_back(RandomCurve(random, static_cast<CurveClass>(i % curveClasses)));
        forms.push_back(ToPowerForm(real.curves[i].data()));
    }
    for (std::size_t i = 0; i < corpusSize; ++i) {
        const double t = random.Uniform(0.0, 1.0);
        const point2d crossing = Evaluate(forms[i], t);
        const std::size_t partner = PartnerOf(i);
        const point2d onPartner = Evaluate(forms[partner], random.Uniform(0.0, 1.0));
        real.others.push_back(Moved(real.curves[partner], crossing - onPartner));
        real.points.push_back(random.Point(extent));
        real.pointsOnCurves.push_back(crossing + AsVector(random.Point(0.035)));
        real.lines.push_back(SegmentThrough(random, crossing));
        parameters.push_back(t);
        laterParameters.push_back(random.Uniform(t, 1.0));
        distances.push_back(random.Uniform(-100.0, 100.0));
    }
    integer = Rounded(real);
}

const Corpus& SharedCorpus()
{
    static const Corpus corpus(20261211);
    return corpus;
}

} // namespace ZarnMath::Benchmarks
