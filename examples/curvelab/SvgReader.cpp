#include "SvgReader.h"

#include "SvgTree.h"

#include <libxml/tree.h>

// The count of named template arguments that SVG++ takes: one more than its own default.
#define EXBOOST_PARAMETER_MAX_ARITY 9
#include <svgpp/policy/xml/libxml2.hpp>
#include <svgpp/svgpp.hpp>

#include <boost/mpl/set.hpp>

#include <utility>

// The geometry of the document is SVG++'s business: the grammars of paths, transforms and lengths, the shapes as paths,
// and the view boxes. It is a large header library, so this is the only source that includes it whole.

namespace curvelab {

namespace {

/// A length in user units that is 0 until it is set: SVG++ reads the size of a shape even where the file gives none.
struct Length
{
    double value = 0.0;

    Length() = default;

    Length(double v) : value(v) // NOLINT(google-explicit-constructor): SVG++ computes with it as with a number
    {}

    operator double() const // NOLINT(google-explicit-constructor)
    {
        return value;
    }
};

/// Lengths in user units at 96 to the inch, percentages of the nearest view box.
class Lengths : public svgpp::factory::length::unitless<Length, double>
{
public:
    using coordinate_type = double;

    template <typename Dimension>
    static double length_to_user_coordinate(Length length, Dimension)
    {
        return length;
    }
};

/// The affine map (x, y) -> (a*x + c*y + e, b*x + d*y + f), in the order of SVG's `matrix`.
struct Affine
{
    double a = 1.0, b = 0.0, c = 0.0, d = 1.0, e = 0.0, f = 0.0;

    [[nodiscard]] point2d operator()(const point2d& p) const
    {
        return {a * p.x + c * p.y + e, b * p.x + d * p.y + f};
    }

    /// The map that applies `inner` first.
    [[nodiscard]] Affine After(const Affine& inner) const
    {
        const point2d origin = (*this)({inner.e, inner.f});
        return {a * inner.a + c * inner.b,
                b * inner.a + d * inner.b,
                a * inner.c + c * inner.d,
                b * inner.c + d * inner.d,
                origin.x,
                origin.y};
    }
};

/// What an element inherits and draws. The names in lower case are those by which SVG++ calls.
class Context
{
public:
    using length_factory_type = const Lengths;

    explicit Context(Drawing& drawing) : drawing_(drawing) {}

    Context(const Context& parent, const xmlNode* element);

    void on_exit_element();

    bool IsShown() const
    {
        return shown_;
    }

    const Lengths& length_factory() const
    {
        return lengths_;
    }

    void transform_matrix(const boost::array<double, 6>& m)
    {
        toDrawing_ = toDrawing_.After({m[0], m[1], m[2], m[3], m[4], m[5]});
    }

    void transform_translate(double x, double y)
    {
        toDrawing_ = toDrawing_.After({1.0, 0.0, 0.0, 1.0, x, y});
    }

    void transform_scale(double x, double y)
    {
        toDrawing_ = toDrawing_.After({x, 0.0, 0.0, y, 0.0, 0.0});
    }

    void set_viewport(double, double, double width, double height)
    {
        lengths_.set_viewport_size(width, height);
    }

    void set_viewbox_size(double width, double height)
    {
        lengths_.set_viewport_size(width, height);
    }

    void disable_rendering()
    {
        shown_ = false;
    }

    void path_move_to(double x, double y, svgpp::tag::coordinate::absolute)
    {
        pen_.MoveTo({x, y});
    }

    void path_line_to(double x, double y, svgpp::tag::coordinate::absolute)
    {
        pen_.LineTo({x, y});
    }

    void path_quadratic_bezier_to(double x1, double y1, double x, double y, svgpp::tag::coordinate::absolute)
    {
        pen_.QuadraticTo({x1, y1}, {x, y});
    }

    void path_cubic_bezier_to(double x1, double y1, double x2, double y2, double x, double y,
                              svgpp::tag::coordinate::absolute)
    {
        pen_.CubicTo({x1, y1}, {x2, y2}, {x, y});
    }

    void path_elliptical_arc_to(double rx, double ry, double rotation, bool large, bool sweep, double x, double y,
                                svgpp::tag::coordinate::absolute)
    {
        pen_.ArcTo({rx, ry, rotation, large, sweep, {x, y}});
    }

    void path_close_subpath()
    {
        pen_.Close();
    }

    // The shape ends with its element: a path that breaks off never gets here.
    void path_exit() {}

private:
    Drawing& drawing_;
    Lengths lengths_;
    Affine toDrawing_{1.0, 0.0, 0.0, -1.0, 0.0, 0.0}; // y upward
    Shape shape_;
    Pen pen_;
    bool shown_ = true;
    bool visible_ = true;
};

Context::Context(const Context& parent, const xmlNode* element)
    : drawing_(parent.drawing_), lengths_(parent.lengths_), toDrawing_(parent.toDrawing_), shape_(parent.shape_),
      shown_(PropertyOf(element, "display") != "none"), visible_(parent.visible_)
{
    if (const std::string fill = PropertyOf(element, "fill"); !fill.empty() && fill != "inherit")
        shape_.filled = fill != "none" && fill != "transparent";
    if (const std::string rule = PropertyOf(element, "fill-rule"); !rule.empty() && rule != "inherit")
        shape_.evenOdd = rule == "evenodd";
    if (const std::string visibility = PropertyOf(element, "visibility"); !visibility.empty())
        visible_ = visibility == "visible" || (visibility == "inherit" && visible_);
}

void Context::on_exit_element()
{
    std::vector<Contour> contours = pen_.Finish();
    if (!shown_ || !visible_)
        return;
    for (Contour& contour : contours)
        for (Cubic& curve : contour.curves)
            for (point2d& p : curve.points)
                p = toDrawing_(p);
    AddShape(drawing_, shape_, std::move(contours));
}

struct ContextFactories
{
    template <typename Parent, typename Element>
    struct apply
    {
        using type = svgpp::factory::context::on_stack_with_xml_element<Context>;
    };
};

/// Passes over whatever SVG++ does not know or cannot read: real files are full of it.
struct PassOverErrors
{
    using context_type = Context;

    template <typename... T>
    static bool unknown_element(T&&...)
    {
        return true;
    }

    template <typename... T>
    static bool unknown_attribute(T&&...)
    {
        return true;
    }

    template <typename... T>
    static bool unexpected_attribute(T&&...)
    {
        return true;
    }

    template <typename... T>
    static bool required_attribute_not_found(T&&...)
    {
        return true;
    }

    template <typename... T>
    static bool parse_failed(T&&...)
    {
        return true;
    }

    template <typename... T>
    static bool unexpected_element(T&&...)
    {
        return true;
    }

    template <typename... T>
    static bool negative_value(T&&...)
    {
        return true;
    }
};

/// Leaves out what is not shown.
struct Traversal
{
    static bool proceed_to_element_content(const Context& context)
    {
        return context.IsShown();
    }

    static bool proceed_to_next_child(const Context&)
    {
        return true;
    }

    template <typename Element>
    static bool process_child(const Context&, const Element&)
    {
        return true;
    }
};

/// Style declarations say nothing about geometry.
struct WithoutStyles : svgpp::policy::attribute_traversal::default_policy
{
    static const bool parse_style = false;
};

namespace element = svgpp::tag::element;
namespace attribute = svgpp::tag::attribute;

using ProcessedElements = boost::mpl::set<element::svg, element::g, element::circle, element::ellipse, element::line,
                                          element::path, element::polygon, element::polyline, element::rect>;

using ProcessedAttributes =
    boost::mpl::set<attribute::transform, attribute::d, attribute::points, attribute::viewBox,
                    attribute::preserveAspectRatio, attribute::x, attribute::y, attribute::width, attribute::height,
                    attribute::rx, attribute::ry, attribute::cx, attribute::cy, attribute::r, attribute::x1,
                    attribute::y1, attribute::x2, attribute::y2>;

using Document = svgpp::document_traversal<
    svgpp::context_factories<ContextFactories>, svgpp::error_policy<PassOverErrors>,
    svgpp::document_traversal_control_policy<Traversal>, svgpp::attribute_traversal_policy<WithoutStyles>,
    svgpp::length_policy<svgpp::policy::length::forward_to_method<Context>>,
    svgpp::viewport_policy<svgpp::policy::viewport::as_transform>, svgpp::processed_elements<ProcessedElements>,
    svgpp::processed_attributes<ProcessedAttributes>>;

} // namespace

Drawing ReadSvg(const std::string& path)
{
    const XmlDocument document = LoadSvgTree(path);
    Drawing drawing;
    drawing.name = path;
    Context root(drawing);
    Document::load_document(xmlDocGetRootElement(document.get()), root);
    return drawing;
}

} // namespace curvelab
