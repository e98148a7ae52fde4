// The offset on both sides. Ours cuts a curve and fits one cubic to the offset of each piece, without a check of the fit
// against the tolerance beyond its own. FreeType's stroker draws round caps around the ends besides, in 64ths of a unit.
// The error is how far the distance of a point of the result from the curve is from the one asked for.

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

Pieces OffsetBothSides(const Cubic& curve)
{
    Pieces pieces;
    std::vector<CubicBezier::bezier2dT<point2d>> segments;
    for (const double distance : {offsetDistance, -offsetDistance}) {
        segments.clear();
        GetSegmentsToOffset({curve[0], curve[1], curve[2], curve[3]}, segments, distance, nullptr);
        for (const auto& segment : segments) {
            Cubic offset;
            double splitParameter;
            FindBezierOffsetCurve(&segment[0], offset.data(), distance, 0.01, splitParameter);
            pieces.push_back(offset);
        }
    }
    return pieces;
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
    for (std::size_t i = 0; i < curves.size(); i += 5) {
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

} // namespace

void AskForOffset(const Corpus& corpus)
{
    const auto& curves = corpus.real.curves;
    Question question("offset on both sides", curves.size());
    const auto offset = [&](std::size_t i) { return OffsetBothSides(curves[i]).size(); };
    question.Add("ZarnMath", "", offset, Compare(curves, [&](std::size_t i) { return OffsetBothSides(curves[i]); }));
    Outlines outlines(curves);
    Stroker stroker;
    const auto stroke = [&](std::size_t i) { return stroker.Stroke(outlines[i]).n_points; };
    question.Add("FreeType", "", stroke,
                 Compare(curves, [&](std::size_t i) { return ToPieces(stroker.Stroke(outlines[i])); }));
    question.Ask();
}

} // namespace ZarnMath::Peers
