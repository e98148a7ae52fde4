#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

LayoutMeasure DrawMeasure(Source& in)
{
    const auto unit = static_cast<LayoutUnit>(in.Count(-1, 3));
    return {unit, in.Distance()};
}

constexpr auto layout = [](Draft& draft) {
    Source& in = draft.in;
    return Given<Layout>{{DrawMeasure(in), DrawMeasure(in), DrawMeasure(in), DrawMeasure(in), DrawMeasure(in),
                          DrawMeasure(in), DrawMeasure(in), DrawMeasure(in), in.Count(-1, 3), in.Count(-1, 3)}};
};

} // namespace

void AddLayout(std::vector<Function>& list)
{
    using Box = BoundsT<double>;
    Family family(list, "Layout");
    family.Add<Box(Box, const Layout&)>("LayoutObject", LayoutObject, bounds, layout);
    family.Add<MATRIX(const Box&, const Box&, const Layout&)>("GetLayoutTransformation", GetLayoutTransformation,
                                                              bounds, bounds, layout);
}

} // namespace ZarnMath::Catalogue
