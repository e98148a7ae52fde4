#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

void AddCircle(std::vector<Function>& list)
{
    Family family(list, "Circle");
    family.Add<void(const MATRIX&, double&, double&)>(
        "GetTransformedCircleAxisLengths", GetTransformedCircleAxisLengths, matrix, written<double>, written<double>);
    family.Add<vector2d(const MATRIX&, const point2d&)>("GetNormalOnTransformedCircle", GetNormalOnTransformedCircle,
                                                        matrix, point<>);
    family.Add<point2d(const vector2d&, double, double)>("FindPointOnEllipseThatHasNormal",
                                                         FindPointOnEllipseThatHasNormal, vector, distance, distance);
    family.Set(NumberClass::Platform);
    family.Add<void(const MATRIX&, vector2d&, vector2d&)>("GetTransformedCircleAxes", GetTransformedCircleAxes, matrix,
                                                          written<vector2d>, written<vector2d>);
}

} // namespace ZarnMath::Catalogue
