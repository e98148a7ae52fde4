#include "tests/vectors/WMathValues.h"

#include "ZarnMath/Layout.h"

namespace ZarnMath::Vectors {

static void Read(Input& in, LayoutMeasure& measure)
{
    in.Into(measure.kind, measure.value);
}

static void Read(Input& in, Layout& layout)
{
    in.Into(layout.width, layout.height, layout.minWidth, layout.minHeight, layout.leftMargin, layout.rightMargin,
            layout.topMargin, layout.bottomMargin, layout.verticalAlign, layout.horizontalAlign);
}

void AddLayoutAdapters(Table& table)
{
    table.Add("LayoutObject", [](Input& in, Output& out) {
        const auto frame = in.Get<BoundsT<double>>();
        out.Add(LayoutObject(frame, in.Get<Layout>()));
    });
    table.Add("GetLayoutTransformation", [](Input& in, Output& out) {
        const auto frame = in.Get<BoundsT<double>>();
        const auto object = in.Get<BoundsT<double>>();
        out.Add(GetLayoutTransformation(frame, object, in.Get<Layout>()));
    });
}

} // namespace ZarnMath::Vectors
