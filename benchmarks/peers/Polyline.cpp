// Flattening. Each library takes a tolerance and means another thing by it, so that what counts is the time at the same
// true error: the largest distance of a curve from its polyline. cairo works in 256ths of a unit.

#include "ZarnMath/BezierToLines.h"
#include "benchmarks/peers/Questions.h"

#include <cairo.h>

#include <cmath>
#include <memory>

namespace ZarnMath::Peers {
namespace {

using Benchmarks::Corpus;

using Polyline = std::vector<point2d>;

double SquaredDistanceToSegment(const point2d& q, const point2d& start, const point2d& end)
{
    const vector2d along = end - start;
    const double length = LengthSquared(along);
    const double s = length > 0.0 ? std::clamp(Dot(q - start, along) / length, 0.0, 1.0) : 0.0;
    return LengthSquared(q - (start + along * s));
}

/// The largest distance of many points of a curve from a polyline.
double Deviation(const Cubic& curve, const Polyline& polyline)
{
    constexpr int samples = 160;
    const auto form = CubicBezier::ToPowerForm(curve.data());
    double largest = 0.0;
    for (int i = 0; i <= samples; ++i) {
        const point2d q = CubicBezier::Evaluate(form, static_cast<double>(i) / samples);
        double nearest = LengthSquared(q - polyline[0]);
        for (std::size_t k = 1; k < polyline.size(); ++k)
            nearest = std::min(nearest, SquaredDistanceToSegment(q, polyline[k - 1], polyline[k]));
        largest = std::max(largest, nearest);
    }
    return std::sqrt(largest);
}

constexpr int maxLines = 2047;

class Cairo
{
public:
    Cairo()
        : surface(cairo_image_surface_create(CAIRO_FORMAT_A8, 1, 1), cairo_surface_destroy),
          context(cairo_create(surface.get()), cairo_destroy)
    {}

    void SetTolerance(double tolerance)
    {
        cairo_set_tolerance(context.get(), tolerance);
    }

    using Path = std::unique_ptr<cairo_path_t, decltype(&cairo_path_destroy)>;

    Path Flatten(const Cubic& curve)
    {
        cairo_new_path(context.get());
        cairo_move_to(context.get(), curve[0].x, curve[0].y);
        cairo_curve_to(context.get(), curve[1].x, curve[1].y, curve[2].x, curve[2].y, curve[3].x, curve[3].y);
        return {cairo_copy_path_flat(context.get()), cairo_path_destroy};
    }

private:
    std::unique_ptr<cairo_surface_t, decltype(&cairo_surface_destroy)> surface;
    std::unique_ptr<cairo_t, decltype(&cairo_destroy)> context;
};

Polyline ToPolyline(const cairo_path_t& path)
{
    Polyline polyline;
    for (int i = 0; i < path.num_data; i += path.data[i].header.length)
        polyline.push_back({path.data[i + 1].point.x, path.data[i + 1].point.y});
    return polyline;
}

/// @param polyline polyline(i) for each curve
template <typename F>
Measures Compare(const std::vector<Cubic>& curves, F polyline)
{
    std::vector<double> errors;
    double segments = 0.0;
    for (std::size_t i = 0; i < curves.size(); ++i) {
        const Polyline points = polyline(i);
        segments += static_cast<double>(points.size() - 1);
        errors.push_back(Deviation(curves[i], points));
    }
    Measures measures = Errors(errors);
    measures.emplace_back("segments", segments / static_cast<double>(curves.size()));
    return measures;
}

} // namespace

void AskForPolyline(const Corpus& corpus)
{
    const auto& curves = corpus.real.curves;
    Question question("polyline", curves.size());
    Polyline room(maxLines + 1);
    for (const char* tolerance : {"16", "8", "4", "2", "1", "0.5", "0.2", "0.1", "0.05", "0.02"}) {
        const auto flatten = [&, square = std::pow(std::stod(tolerance), 2)](std::size_t i) {
            return AdaptiveBezierToLines(curves[i].data(), room.data(), square, maxLines);
        };
        question.Add("ZarnMath", tolerance, flatten, Compare(curves, [&](std::size_t i) {
                         return Polyline(room.begin(), room.begin() + flatten(i) + 1);
                     }));
    }
    for (const char* tolerance : {"2", "1", "0.5", "0.2", "0.1", "0.05", "0.02"}) {
        const auto cairo = std::make_shared<Cairo>();
        cairo->SetTolerance(std::stod(tolerance));
        question.Add(
            "cairo", tolerance, [&curves, cairo](std::size_t i) { return cairo->Flatten(curves[i])->num_data; },
            Compare(curves, [&](std::size_t i) { return ToPolyline(*cairo->Flatten(curves[i])); }));
    }
    question.Ask();
}

} // namespace ZarnMath::Peers
