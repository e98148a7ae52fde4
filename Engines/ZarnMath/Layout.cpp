#include "ZarnMath/Layout.h"

namespace ZarnMath {

namespace {

/// The two edges of an axis, left and right or top and bottom. From top to bottom the extent of a normal frame is
/// negative, and everything that is measured on that axis with it.
struct Span
{
    double first;
    double last;
};

/// Which edge keeps its place.
enum class Anchor
{
    First,
    Last,
    CentreByFirst,
    CentreByLast,
    Unknown
};

/// What a layout says of one axis.
struct AxisLayout
{
    LayoutMeasure size;
    LayoutMeasure minimum;
    LayoutMeasure firstMargin;
    LayoutMeasure lastMargin;
    Anchor anchor;
};

Anchor HorizontalAnchor(std::int32_t align) noexcept
{
    constexpr Anchor anchors[] = {Anchor::First, Anchor::Last, Anchor::CentreByFirst};
    return align >= 0 && align <= 2 ? anchors[align] : Anchor::Unknown;
}

Anchor VerticalAnchor(std::int32_t align) noexcept
{
    constexpr Anchor anchors[] = {Anchor::Last, Anchor::First, Anchor::CentreByLast};
    return align >= 0 && align <= 2 ? anchors[align] : Anchor::Unknown;
}

double Sign(double v) noexcept
{
    if (v > 0.0)
        return 1.0;
    return v < 0.0 ? -1.0 : 0.0;
}

double Resolve(const LayoutMeasure& measure, double extent, double otherwise) noexcept
{
    switch (measure.kind) {
    case LayoutUnit::Relative:
        return extent * measure.value;
    case LayoutUnit::Absolute:
        return measure.value * Sign(extent);
    default:
        return otherwise;
    }
}

bool IsShortOf(double available, double minimum) noexcept
{
    return minimum < 0.0 ? available > minimum : available < minimum;
}

/// Widens a span to a length. The centred one knows the extent of the frame but not where that lies.
Span WidenTo(double length, double extent, Span span, Anchor anchor) noexcept
{
    switch (anchor) {
    case Anchor::First:
        return {span.first, length + span.first};
    case Anchor::Last:
        return {span.last - length, span.last};
    case Anchor::CentreByFirst:
    case Anchor::CentreByLast: {
        const double first = (extent - length) * 0.5;
        return {first, length + first};
    }
    default:
        return span;
    }
}

/// Between the margins, but not below the minimum.
Span Stretch(const Span& frame, const AxisLayout& axis) noexcept
{
    const double extent = frame.last - frame.first;
    const Span span{frame.first + Resolve(axis.firstMargin, extent, 0.0),
                    frame.last - Resolve(axis.lastMargin, extent, 0.0)};
    if (axis.minimum.kind == LayoutUnit::None)
        return span;
    const double minimum = Resolve(axis.minimum, extent, 0.0);
    if (!IsShortOf(span.last - span.first, minimum))
        return span;
    return WidenTo(minimum, extent, span, axis.anchor);
}

/// A given size at a margin of the frame, or in its middle. Which edge is found first decides the last bits.
Span Place(const Span& frame, const AxisLayout& axis) noexcept
{
    const double extent = frame.last - frame.first;
    const double size = Resolve(axis.size, extent, extent);
    switch (axis.anchor) {
    case Anchor::First: {
        const double first = frame.first + Resolve(axis.firstMargin, extent, 0.0);
        return {first, size + first};
    }
    case Anchor::Last: {
        const double last = frame.last - Resolve(axis.lastMargin, extent, 0.0);
        return {last - size, last};
    }
    case Anchor::CentreByFirst: {
        const double first = (frame.first + frame.last - size) * 0.5;
        return {first, size + first};
    }
    case Anchor::CentreByLast: {
        const double last = (frame.first + frame.last + size) * 0.5;
        return {last - size, last};
    }
    default:
        return frame;
    }
}

Span LayOut(const Span& frame, const AxisLayout& axis) noexcept
{
    return axis.size.kind == LayoutUnit::None ? Stretch(frame, axis) : Place(frame, axis);
}

} // namespace

BoundsT<double> LayoutObject(BoundsT<double> frame, const Layout& layout) noexcept
{
    const Span x = LayOut({frame.left, frame.right}, {layout.width, layout.minWidth, layout.leftMargin,
                                                      layout.rightMargin, HorizontalAnchor(layout.horizontalAlign)});
    const Span y = LayOut({frame.top, frame.bottom}, {layout.height, layout.minHeight, layout.topMargin,
                                                      layout.bottomMargin, VerticalAnchor(layout.verticalAlign)});
    return {x.first, y.first, x.last, y.last};
}

MATRIX GetLayoutTransformation(const BoundsT<double>& frame, const BoundsT<double>& object,
                               const Layout& layout) noexcept
{
    const BoundsT<double> target = LayoutObject(frame, layout);
    const double sx = (target.right - target.left) / (object.right - object.left);
    const double sy = (target.top - target.bottom) / (object.top - object.bottom);
    const vector2d move{target.left - object.left * sx, target.bottom - object.bottom * sy};
    return ConstructTranslationMatrix(move) * ConstructMatrix({sx, 0.0}, {0.0, sy}, {0.0, 0.0});
}

} // namespace ZarnMath
