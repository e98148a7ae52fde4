#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

void AddLine(std::vector<Function>& list)
{
    using Point = const point2d&;
    Family family(list, "Line");
    family.Add<bool(const point2d*, unsigned long, double)>("AreCollinear", AreCollinear, points<point2d>,
                                                            countOfPoints<unsigned long>, tolerance);
    family.Add<bool(const POINT*, unsigned long, double)>("AreCollinear", AreCollinear, points<POINT>,
                                                          countOfPoints<unsigned long>, tolerance);
    family.Add<double(Point, Point, Point)>("DistanceToLineSegmentSqrd", DistanceToLineSegmentSqrd, point<>, point<>,
                                            point<>);
    family.Add<bool(Point, Point, Point, Point, double)>("DoesFatlineIntersectLine", DoesFatlineIntersectLine, point<>,
                                                         point<>, point<>, point<>, distance);
    family.Add<void(POINT, POINT, POINT*, unsigned long)>("ReflectAcross", ReflectAcross, point<POINT>, point<POINT>,
                                                          changedPoints<POINT>, countOfPoints<unsigned long>);
}

} // namespace ZarnMath::Catalogue
