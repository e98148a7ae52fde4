#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

template <typename P>
void AddWalks(Family& family)
{
    family.Add<int(const P*, int)>("CalculateNumBezierLines", CalculateNumBezierLines, cubic<P>, integer);
    family.AddWith<void(const P*, P*, int)>("BezierToLines", BezierToLines, [](auto call, Source& in, Sink& out) {
        const CurveOf<P> curve = DrawCubic<P>(in);
        const int lines = in.Count(0, 40);
        std::vector<P> polyline(static_cast<std::size_t>(lines) + 1, unwritten<P>);
        call(curve.data(), polyline.data(), lines);
        out.Put(polyline);
    });
    family.AddWith<int(const P*, P*, double, int)>(
        "AdaptiveBezierToLines", AdaptiveBezierToLines, [](auto call, Source& in, Sink& out) {
            constexpr int mostLines = 2047;
            const CurveOf<P> curve = DrawCubic<P>(in);
            const double squaredDistance = in.Tolerance();
            const int maxLines = in.Count(-1, mostLines + 10);
            std::vector<P> polyline(mostLines + 1, unwritten<P>);
            const int lines = call(curve.data(), polyline.data(), squaredDistance, maxLines);
            out.Put(lines);
            polyline.resize(static_cast<std::size_t>(lines) + 1);
            out.Put(polyline);
        });
}

} // namespace

void AddBezierToLines(std::vector<Function>& list)
{
    Family family(list, "BezierToLines");
    family.Add<int(const RECT&, int)>("CalculateNumBezierLines", CalculateNumBezierLines, rect, integer);
    AddWalks<POINT>(family);
    AddWalks<point2d>(family);
}

} // namespace ZarnMath::Catalogue
