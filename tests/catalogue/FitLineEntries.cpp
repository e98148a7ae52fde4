#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

void AddFitLine(std::vector<Function>& list)
{
    Family family(list, "FitLine");
    family.Add<void(const point2d*, int, point2d&, vector2d&)>("GetLeastSquaresLines", GetLeastSquaresLines,
                                                               points<point2d, -1>, countOfPoints<>, written<point2d>,
                                                               written<vector2d>);
    family.Add<void(double, double, double, double, double, const point2d*, int, point2d&, vector2d&)>(
        "GetLeastSquaresLines", GetLeastSquaresLines, number, number, number, number, number, points<point2d>,
        countOfPoints<>, written<point2d>, written<vector2d>);
}

} // namespace ZarnMath::Catalogue
