// Draws all figures of the manual into a folder.

#include "docs/figures/Figures.h"

#include <cstdio>
#include <exception>

namespace ZarnMath::Figures {

namespace {

struct Entry
{
    const char* name; ///< of the file, as the pages say it
    Draw* draw;
};

constexpr Entry figures[] = {
    {"plane", Plane},
    {"neighbours", Neighbours},
    {"curvature-sign", CurvatureSign},
    {"sides", Sides},
    {"offset-sides", OffsetSides},
    {"angle-units", AngleUnits},
    {"matrix-columns", MatrixColumns},
    {"matrix-order", MatrixOrder},
    {"map-modes", MapModes},
    {"ellipse", EllipseAxes},
    {"boxes", BoxesOfTheSame},
    {"cutting", Cutting},
    {"three-points", ThroughThreePoints},
    {"nearest", NearestPoint},
    {"nearest-end", NearestIsAnEnd},
    {"tangents", TangentsToPoint},
    {"spacing", EqualSpacing},
    {"comb", CurvatureComb},
    {"extents", Extents},
    {"loop", Loop},
    {"flattening", Flattening},
    {"crossings", Crossings},
    {"line-crossings", LineCrossings},
    {"straight-band", StraightBand},
    {"cusps", OffsetCusps},
    {"fit", FittedCurve},
    {"joint-fit", JointFit},
    {"line-fit", FittedLine},
    {"ramps", Ramps},
    {"spline", Spline},
    {"field", Field},
    {"projection", Projection},
    {"layers", Layers},
};

void DrawAll(const std::string& folder)
{
    for (const auto& [name, draw] : figures)
        draw(folder + '/' + name + ".svg");
}

} // namespace

} // namespace ZarnMath::Figures

int main(int argumentCount, char** arguments)
try {
    if (argumentCount != 2) {
        std::fprintf(stderr, "usage: %s FOLDER\n", arguments[0]);
        return 2;
    }
    ZarnMath::Figures::DrawAll(arguments[1]);
    return 0;

} catch (const std::exception& trouble) {
    std::fprintf(stderr, "%s: %s\n", arguments[0], trouble.what());
    return 1;
}
