// The offset on both sides. Ours cuts a curve where its offset folds, and fits one cubic to the offset of each stretch; a
// caller with a tolerance cuts stretches on until their fits are near. FreeType's stroker approximates the offset by many
// short pieces, and draws round caps around the ends besides, in 64ths of a unit. The error is how far the distance of a
// point of the result from the curve is from the one asked for.

#include "ZarnMath/Bezier.h"
#include "ZarnMath/BezierOffset.h"
#include "benchmarks/peers/FreeType.h"
#include "benchmarks/peers/Questions.h"
#include "tests/census/BruteForce.h"

#include FT_STROKER_H

#include <cmath>

namespace ZarnMath::Peers {
namespace {

using Benchmarks::Corpus;
using Pieces = std::vector<Cubic>;

constexpr double offsetDistance = 10.0;

/// The offset of a stretch that does not fold: one cubic, or those of both halves while it is too far off.
///
/// @param tolerance a distance in drawing units
void OffsetStretch(const point2d* stretch, double distance, double tolerance, Pieces& pieces, int mostCuts = 8)
{
    Cubic offset;
    double splitParameter;
    const bool isNear = FindBezierOffsetCurve(stretch, offset.data(), distance, tolerance * tolerance, splitParameter);
    if (isNear || mostCuts == 0) {
        pieces.push_back(offset);
        return;
    }
    for (const auto& [start, end] : {std::pair{0.0, splitParameter}, {splitParameter, 1.0}}) {
        Cubic half;
        CubicBezier::Subsection(start, end, stretch, half.data());
        OffsetStretch(half.data(), distance, tolerance, pieces, mostCuts - 1);
    }
}

Pieces OffsetBothSides(const Cubic& curve, double tolerance)
{
    Pieces pieces;
    std::vector<CubicBezier::bezier2dT<point2d>> stretches;
    for (const double distance : {offsetDistance, -offsetDistance}) {
        stretches.clear();
        GetSegmentsToOffset({curve[0], curve[1], curve[2], curve[3]}, stretches, distance, nullptr);
        for (const auto& stretch : stretches)
            OffsetStretch(&stretch[0], distance, tolerance, pieces);
    }
    return pieces;
}

/// Whether an offset folds, or runs through the curve or too near to another part of it: some point of it is nearer to the
/// curve than the distance, so that no stroke can keep it.
bool IsDisturbed(const Cubic& curve)
{
    constexpr int samples = 200;
    constexpr double slack = 1e-3;
    const auto f = CubicBezier::ToPowerForm(curve.data());
    for (int i = 0; i <= samples; ++i) {
        const double t = static_cast<double>(i) / samples;
        const point2d foot = CubicBezier::Evaluate(f, t);
        const vector2d aside = Perpendicular(Normalize(CubicBezier::Derivative(f.a, f.b, f.c, t))) * offsetDistance;
        for (const point2d& p : {foot + aside, foot - aside}) {
            const point2d nearest = CubicBezier::Evaluate(f, Census::FindNearest(curve, p));
            if (!(LengthSquared(p - nearest) > std::pow(offsetDistance - slack, 2)))
                return true;
        }
    }
    return false;
}

/// A stroker with its outline, which grows to what the longest stroke takes.
class Stroker
{
public:
    Stroker()
    {
        FT_Init_FreeType(&library);
        FT_Stroker_New(library, &stroker);
        FT_Stroker_Set(stroker, ToFixed(offsetDistance), FT_STROKER_LINECAP_ROUND, FT_STROKER_LINEJOIN_ROUND, 0);
        FT_Outline_New(library, mostPoints, mostContours, &stroke);
    }

    ~Stroker()
    {
        FT_Outline_Done(library, &stroke);
        FT_Stroker_Done(stroker);
        FT_Done_FreeType(library);
    }

    Stroker(const Stroker&) = delete;
    Stroker& operator=(const Stroker&) = delete;

    /// @return the stroke, until the next call
    FT_Outline& Stroke(CubicOutline& curve)
    {
        FT_Stroker_ParseOutline(stroker, &curve.outline, true);
        FT_UInt points, contours;
        FT_Stroker_GetCounts(stroker, &points, &contours);
        stroke.n_points = 0;
        stroke.n_contours = 0;
        if (points <= mostPoints && contours <= mostContours)
            FT_Stroker_Export(stroker, &stroke);
        return stroke;
    }

private:
    static constexpr FT_UInt mostPoints = 4096;
    static constexpr FT_UInt mostContours = 64;
    FT_Library library;
    FT_Stroker stroker;
    FT_Outline stroke;
};

/// Collects the pieces of an outline.
struct Collector
{
    Pieces pieces;
    point2d pen{};

    static point2d Place(const FT_Vector* v)
    {
        return {FromFixed(v->x), FromFixed(v->y)};
    }

    static Collector& Of(void* user)
    {
        return *static_cast<Collector*>(user);
    }

    void Add(const point2d& first, const point2d& second, const point2d& end)
    {
        pieces.push_back({pen, first, second, end});
        pen = end;
    }
};

Pieces ToPieces(FT_Outline& outline)
{
    Collector all;
    FT_Outline_Funcs walk{};
    walk.move_to = [](const FT_Vector* to, void* user) {
        Collector::Of(user).pen = Collector::Place(to);
        return 0;
    };
    walk.line_to = [](const FT_Vector* to, void* user) {
        Collector& collector = Collector::Of(user);
        const point2d end = Collector::Place(to);
        collector.Add(collector.pen, end, end);
        return 0;
    };
    walk.conic_to = [](const FT_Vector* middle, const FT_Vector* to, void* user) {
        Collector& collector = Collector::Of(user);
        const point2d control = Collector::Place(middle);
        const point2d end = Collector::Place(to);
        collector.Add(collector.pen + (control - collector.pen) * (2.0 / 3.0), end + (control - end) * (2.0 / 3.0),
                      end);
        return 0;
    };
    walk.cubic_to = [](const FT_Vector* first, const FT_Vector* second, const FT_Vector* to, void* user) {
        Collector::Of(user).Add(Collector::Place(first), Collector::Place(second), Collector::Place(to));
        return 0;
    };
    FT_Outline_Decompose(&outline, &walk, &all);
    return all.pieces;
}

/// @param pieces pieces(i) of the result for each curve
template <typename F>
Measures Compare(const std::vector<Cubic>& curves, F pieces)
{
    constexpr int samples = 8;
    std::vector<double> errors;
    double count = 0.0;
    for (std::size_t i = 0; i < curves.size(); ++i) {
        const auto source = CubicBezier::ToPowerForm(curves[i].data());
        double worst = 0.0;
        const Pieces result = pieces(i);
        for (const Cubic& piece : result)
            for (int k = 0; k < samples; ++k) {
                const point2d p = CubicBezier::Evaluate(CubicBezier::ToPowerForm(piece.data()), (k + 0.5) / samples);
                const point2d nearest = CubicBezier::Evaluate(source, Census::FindNearest(curves[i], p));
                const double error = std::fabs(std::sqrt(LengthSquared(p - nearest)) - offsetDistance);
                worst = std::isnan(error) ? error : std::max(worst, error);
            }
        count += static_cast<double>(result.size());
        errors.push_back(worst);
    }
    Measures measures = Errors(errors);
    measures.emplace_back("pieces", count / static_cast<double>(errors.size()));
    return measures;
}

void AskForOffsetOf(const std::vector<Cubic>& curves, const std::string& name)
{
    Question question(name, curves.size());
    for (const char* tolerance : {"", "1", "0.1", "0.01"}) {
        const bool isOneCubic = *tolerance == '\0';
        const double within = isOneCubic ? std::numeric_limits<double>::infinity() : std::stod(tolerance);
        const auto offset = [&curves, within](std::size_t i) { return OffsetBothSides(curves[i], within); };
        question.Add("ZarnMath", isOneCubic ? "a cubic each" : std::string("cut to ") + tolerance, offset,
                     Compare(curves, offset));
    }
    Outlines outlines(curves);
    Stroker stroker;
    const auto stroke = [&](std::size_t i) { return stroker.Stroke(outlines[i]).n_points; };
    question.Add("FreeType", "", stroke,
                 Compare(curves, [&](std::size_t i) { return ToPieces(stroker.Stroke(outlines[i])); }));
    question.Ask();
}

} // namespace

void AskForOffset(const Corpus& corpus)
{
    // The classes take turns, so that a part of the corpus has all of them.
    constexpr std::ptrdiff_t curveCount = 500;
    const std::vector<Cubic> curves(corpus.real.curves.begin(), corpus.real.curves.begin() + curveCount);
    std::vector<Cubic> undisturbed;
    std::ranges::remove_copy_if(curves, std::back_inserter(undisturbed), IsDisturbed);
    AskForOffsetOf(curves, "offset on both sides");
    AskForOffsetOf(undisturbed, "offset on both sides, apart from the curve");
}

} // namespace ZarnMath::Peers
