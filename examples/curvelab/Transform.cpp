#include "Command.h"
#include "Failure.h"
#include "Numbers.h"
#include "TransformSteps.h"

#include <algorithm>
#include <cmath>

namespace curvelab {

namespace {

using ZarnMath::vector2d;

/// Farther away, the rounding of the image's coordinates would be wider than the lines that it is drawn with.
constexpr double farthestImage = 1e15;
/// Farther away, a whole unit does not fit into 32 bits, not even half of one more.
constexpr double farthestInteger = 2147483647.0;

/// What was asked for.
struct Settings
{
    std::vector<TransformStep> steps;
    std::string text;
    double tolerance;
};

/// What stays in place.
struct Fixed
{
    std::optional<point2d> point;
    std::optional<std::array<point2d, 2>> line; ///< two of its points
};

/// A circle over the artwork, and the ellipse that it becomes.
struct Disc
{
    point2d centre;
    point2d image; ///< of the centre
    vector2d major;
    vector2d minor;
    double radius;
    Bounds box; ///< of the ellipse
};

/// What the library says about a matrix.
struct Answer
{
    MATRIX m;
    std::vector<Cubic> image;
    Bounds box = NoBounds();    ///< of the image, tight
    double rounding = 0.0;      ///< how far whole units are from the exact image of the same points
    std::optional<double> back; ///< how far the inverse misses the points; nothing without one
    std::optional<ZarnMath::AFF_TRANSFORM> parts;
    double recomposed = 0.0; ///< how far the recomposed parts are from the matrix
    Fixed fixed;
    std::vector<Disc> discs; ///< none if the matrix is singular
};

double Distance(const point2d& p, const point2d& q)
{
    return std::sqrt(ZarnMath::LengthSquared(p - q));
}

point2d Middle(const Bounds& box)
{
    return {(box.left + box.right) * 0.5, (box.top + box.bottom) * 0.5};
}

double Determinant(const MATRIX& m)
{
    return m.m11 * m.m22 - m.m21 * m.m12;
}

/// Transforms the control points, all at once; the curve goes along.
Cubic ImageOf(const MATRIX& m, const Cubic& curve)
{
    Cubic image = curve;
    m.TransformPoints(image.points, 4);
    return image;
}

Cubic ImageOf(const MATRIX& m, const IntegerCubic& curve)
{
    IntegerCubic image = curve;
    UTLTransformPoint(image.data(), &m, 4);
    return ToDouble(image);
}

double LargestDistance(const Cubic& a, const Cubic& b)
{
    double largest = 0.0;
    for (std::size_t i = 0; i < 4; ++i)
        largest = std::max(largest, Distance(a[i], b[i]));
    return largest;
}

void RequireNear(const Cubic& image, double farthest)
{
    for (const point2d& p : image.points)
        if (!(std::fabs(p.x) <= farthest && std::fabs(p.y) <= farthest))
            throw Failure("--by: the image lies too far away, beyond " + FormatNumber(farthest) + " units");
}

void TransformCurves(const Job& job, Answer& answer)
{
    MATRIX inverse = answer.m;
    const bool isInvertible = inverse.Invert(DBL_EPSILON);
    if (isInvertible)
        answer.back = 0.0;
    ForEachCurve(job, "transforming", [&](const Cubic& exact, std::size_t) {
        const IntegerCubic whole = Rounded(exact);
        const Cubic curve = job.integer ? ToDouble(whole) : exact;
        const Cubic ideal = ImageOf(answer.m, curve);
        RequireNear(ideal, job.integer ? farthestInteger : farthestImage);
        const Cubic image = job.integer ? ImageOf(answer.m, whole) : ideal;
        answer.rounding = std::max(answer.rounding, LargestDistance(image, ideal));
        if (isInvertible)
            answer.back = std::max(*answer.back, LargestDistance(ImageOf(inverse, image), curve));
        Include(answer.box, image);
        answer.image.push_back(image);
    });
}

void TakeApart(Answer& answer)
{
    ZarnMath::AFF_TRANSFORM parts{};
    MATRIX again{};
    if (!ZarnMath::DecomposeAffineTransform(parts, answer.m) || !std::isfinite(parts.skew))
        return;
    ZarnMath::ComposeAffineTransform(again, parts);
    answer.parts = parts;
    for (const auto field : {&MATRIX::m11, &MATRIX::m12, &MATRIX::m21, &MATRIX::m22})
        answer.recomposed = std::max(answer.recomposed, std::fabs(again.*field - answer.m.*field));
}

Fixed FindFixed(MATRIX m)
{
    Fixed fixed;
    point2d p{};
    if (m.GetCenterOfTransformation(p))
        fixed.point = p;
    std::array<point2d, 2> line{};
    if (m.GetLineOfTransformation(line[0], line[1]))
        fixed.line = line;
    return fixed;
}

/// Circles on a grid over the artwork, about as many as fit in three along its smaller side.
std::vector<Disc> LayCircles(const MATRIX& m, const Bounds& box)
{
    const double width = box.right - box.left;
    const double height = box.top - box.bottom;
    const double cell = std::max(std::min(width, height), std::max(width, height) / 4.0) / 3.0;
    const int columns = std::max(1, static_cast<int>(width / cell));
    const int rows = std::max(1, static_cast<int>(height / cell));
    Disc disc{};
    disc.radius = 0.4 * cell;
    ZarnMath::GetTransformedCircleAxes(m, disc.major, disc.minor);
    disc.major = disc.major * disc.radius;
    disc.minor = disc.minor * disc.radius;
    std::vector<Disc> discs;
    for (int row = 0; row < rows; ++row)
        for (int column = 0; column < columns; ++column) {
            disc.centre = {box.left + width * (column + 0.5) / columns, box.bottom + height * (row + 0.5) / rows};
            disc.image = m(disc.centre);
            disc.box = ZarnMath::GetTransformedCircleBBox(m, disc.radius, disc.image);
            discs.push_back(disc);
        }
    return discs;
}

Answer Find(const Settings& settings, const Job& job)
{
    const point2d centre = Middle(job.drawing.bounds);
    Answer answer;
    answer.m = job.integer ? CombineInWholeUnits(settings.steps, centre) : Combine(settings.steps, centre);
    TransformCurves(job, answer);
    TakeApart(answer);
    answer.fixed = FindFixed(answer.m);
    if (std::fabs(Determinant(answer.m)) > DBL_EPSILON)
        answer.discs = LayCircles(answer.m, job.drawing.bounds);
    return answer;
}

template <typename T>
Value OrNothing(const std::optional<T>& value)
{
    return value ? Value(*value) : Value();
}

void DescribeKind(const MATRIX& m, double tolerance, Report& report)
{
    report.Add("isMirrored", "mirrored", m.IsMirrored());
    report.Add("isScaled", "scaled", m.IsScaled(tolerance));
    report.Add("isSkewedOrRotated", "skewed or turned", m.IsSkewedOrRotated(tolerance));
    report.Add("isOrthogonal", "right angles stay", m.IsOrthogonal(tolerance));
    report.Add("isUniformOrthogonal", "shapes stay", m.IsUniformOrthogonal(tolerance));
    report.Add("isOrthonormal", "lengths stay", m.IsOrthonormal(tolerance));
    report.AddNumbers("isIdentity", m.IsIdentity(true, tolerance));
    report.AddNumbers("isOrthonormalAxisAligned", m.IsOrthonormalAxisAligned(tolerance));
    report.AddNumbers("isSkewedOrRotatedOrMirrored", m.IsSkewedOrRotatedOrMirrored(tolerance));
    report.AddNumbers("isScaledOrSkewedOrRotated", m.IsScaledOrSkewedOrRotated(tolerance));
    report.AddNumbers("isNonUniformScaledOrSkewedOrRotated", m.IsNonUniformScaledOrSkewedOrRotated(tolerance));
}

void DescribeParts(const Answer& answer, Report& report)
{
    constexpr double degreesPerRadian = 180.0 / 3.14159265358979323846;
    std::optional<double> scaleX, scaleY, skew, rotation, recomposed;
    if (const auto& parts = answer.parts) {
        scaleX = parts->scaleX;
        scaleY = parts->scaleY;
        skew = parts->skew + 0.0; // a negative zero would only puzzle
        rotation = parts->rotation * degreesPerRadian;
        recomposed = answer.recomposed;
    }
    report.Add("rotation", "turned by (degrees)", OrNothing(rotation));
    report.Add("scaleX", "scale along x", OrNothing(scaleX));
    report.Add("scaleY", "scale along y", OrNothing(scaleY));
    report.Add("skew", "skew (a tangent)", OrNothing(skew));
    report.AddNumbers("recomposed", OrNothing(recomposed));
}

void DescribeFixed(const Fixed& fixed, Report& report)
{
    report.Add("fixedPoint", "fixed point", OrNothing(fixed.point));
    Value line;
    if (fixed.line)
        line = std::vector<point2d>(fixed.line->begin(), fixed.line->end());
    report.AddNumbers("fixedLine", line);
    report.Add("hasFixedLine", "a whole line is fixed", fixed.line.has_value());
}

void DescribeEllipse(const MATRIX& m, Report& report)
{
    double major = 0.0;
    double minor = 0.0;
    ZarnMath::GetTransformedCircleAxisLengths(m, major, minor);
    const bool isEllipse = std::isfinite(major);
    report.Add("largestStretch", "largest stretch", m.GetMaximumMatrixVectorScale());
    report.Add("major", "major half axis", isEllipse ? Value(major) : Value());
    report.Add("minor", "minor half axis", isEllipse ? Value(minor) : Value());
}

void Describe(const Settings& settings, const Answer& answer, bool integer, Report& report)
{
    const MATRIX& m = answer.m;
    report.AddNumbers("by", settings.text);
    report.AddNumbers("tolerance", settings.tolerance);
    report.AddNumbers("matrix", std::vector<double>{m.m11, m.m12, m.dx, m.m21, m.m22, m.dy});
    report.AddNumbers("curves", static_cast<std::int64_t>(answer.image.size()));
    DescribeParts(answer, report);
    report.Add("determinant", "determinant", Determinant(m));
    DescribeEllipse(m, report);
    DescribeFixed(answer.fixed, report);
    DescribeKind(m, settings.tolerance, report);
    report.Add("width", "width of the image", answer.box.right - answer.box.left);
    report.Add("height", "height of the image", answer.box.top - answer.box.bottom);
    report.AddNumbers("box", std::vector<double>{answer.box.left, answer.box.top, answer.box.right, answer.box.bottom});
    report.Add("backError", "back by the inverse", OrNothing(answer.back));
    if (integer)
        report.Add("largestRounding", "farthest from exact", answer.rounding);
}

/// The ellipse with these half axes, by the cubics of a circle.
void AddEllipse(Layer& layer, const point2d& centre, const vector2d& major, const vector2d& minor)
{
    for (const double sign : {1.0, -1.0})
        for (Cubic piece : ArcAsCubics({sign, 0.0}, {1.0, 1.0, 0.0, false, true, {-sign, 0.0}})) {
            for (point2d& p : piece.points)
                p = centre + (major * p.x + minor * p.y);
            layer.AddCurve(piece);
        }
}

void ShowCircles(const Answer& answer, Picture& picture)
{
    const Style before{colour::green, 1.2, "2 5", 0.8};
    const Style after{colour::green, 1.8, "", 1.0};
    const Style axis{colour::green, 1.0, "", 1.0};
    Layer& circles = picture.AddLayer(before);
    Layer& ellipses = picture.AddLayer(after);
    Layer& axes = picture.AddLayer(axis);
    for (const Disc& disc : answer.discs) {
        circles.AddCircle(disc.centre, disc.radius);
        AddEllipse(ellipses, disc.image, disc.major, disc.minor);
        axes.AddPolyline({disc.image - disc.major, disc.image + disc.major});
        axes.AddPolyline({disc.image - disc.minor, disc.image + disc.minor});
    }
    if (answer.discs.empty())
        return;
    picture.AddLegend(before, Sample::Stroke, "circles");
    picture.AddLegend(after, Sample::Stroke, "their images and axes");
}

/// From one side of all that is shown to the other.
std::vector<point2d> Across(const std::array<point2d, 2>& line, const Bounds& shown)
{
    const vector2d along = ZarnMath::Normalize(line[1] - line[0]);
    const point2d middle = Middle(shown);
    const point2d foot = line[0] + along * ZarnMath::Dot(middle - line[0], along);
    const vector2d reach = along * ((shown.right - shown.left) + (shown.top - shown.bottom));
    return {foot - reach, foot + reach};
}

void ShowFixed(const Fixed& fixed, const Bounds& shown, Picture& picture)
{
    const Style line{colour::orange, 2.5, "10 6", 1.0};
    const Style dot{colour::orange, 12.0, "", 1.0};
    if (fixed.line) {
        picture.AddLayer(line).AddPolyline(Across(*fixed.line, shown));
        picture.AddLegend(line, Sample::Stroke, "fixed line");
    }
    if (fixed.point) {
        picture.AddLayer({colour::paper, dot.width + 4.0, "", 1.0}).AddDot(*fixed.point);
        picture.AddLayer(dot).AddDot(*fixed.point);
        picture.AddLegend(dot, Sample::Dot, "fixed point");
    }
}

/// Whether a fixed point lies so near that showing it leaves the artwork large enough to be seen.
bool IsWithinSight(const point2d& p, const Bounds& shown)
{
    const double size = (shown.right - shown.left) + (shown.top - shown.bottom);
    return Distance(p, Middle(shown)) <= size;
}

void IncludeBox(Bounds& bounds, const Bounds& more)
{
    Include(bounds, point2d{more.left, more.top});
    Include(bounds, point2d{more.right, more.bottom});
}

void Show(const Answer& answer, const Bounds& artwork, Picture& picture)
{
    Bounds shown = artwork;
    IncludeBox(shown, answer.box);
    for (const Disc& disc : answer.discs)
        IncludeBox(shown, disc.box);
    Fixed fixed = answer.fixed;
    if (fixed.point && !IsWithinSight(*fixed.point, shown))
        fixed.point.reset();
    if (fixed.point)
        Include(shown, *fixed.point);
    picture.MakeRoomFor({shown.left, shown.top});
    picture.MakeRoomFor({shown.right, shown.bottom});

    const Style image{colour::blue, 2.2, "", 1.0};
    Layer& curves = picture.AddLayer(image);
    for (const Cubic& curve : answer.image)
        curves.AddCurve(curve);
    picture.AddLegend(image, Sample::Stroke, "the image");
    ShowCircles(answer, picture);
    ShowFixed(fixed, shown, picture);
}

void Run(const Settings& settings, const Job& job, Report& report, Picture& picture)
{
    const Answer answer = Find(settings, job);
    Describe(settings, answer, job.integer, report);
    Show(answer, job.drawing.bounds, picture);
}

Question Prepare(const Arguments& arguments)
{
    const std::string& text = arguments.at("--by");
    const Settings settings{ReadTransformSteps("--by", text), text,
                            ReadNonNegative("--tolerance", arguments.at("--tolerance"))};
    return [settings](const Job& job, Report& report, Picture& picture) { Run(settings, job, report, picture); };
}

} // namespace

Command TransformCommand()
{
    return {
        "transform",
        "Applies an affine transform and tells what it is made of and what it leaves in place",
        "STEPS are set apart by blanks and act one after the other. @X,Y is the point that a step leaves in place, "
        "the\n"
        "centre of the drawing if there is none:\n"
        "  move:DX,DY   rotate:DEGREES@X,Y   scale:SX,SY@X,Y   skew:DEGREES,DEGREES@X,Y   mirror:DEGREES@X,Y\n"
        "  matrix:M11,M12,DX,M21,M22,DY with x' = DX + (M11*x + M12*y) and y' = DY + (M21*x + M22*y)\n"
        "Angles turn counter-clockwise. A skew leans x to the left by its first angle for positive angles, as the\n"
        "library does. With --integer the steps are the plain-C functions, in millionths of a degree and whole units,\n"
        "and no point of the image lies farther than sqrt(1/2) units from the exact one.",
        {{"--by", "STEPS", "The transform, as in \"rotate:30@50000,0 scale:2,1 skew:10,0\"", ""},
         {"--tolerance", "T", "How far off a number may be when the transform is classified", "1e-9"}},
        {{"transform rose-window.svg --by \"rotate:30@50000,0 scale:2,1 skew:10,0\" -o turned.svg",
          "Turned about a point, stretched and leant"},
         {"transform rose-window.svg --by mirror:70@70000,50000", "What a mirror leaves in place"}},
        Prepare};
}

} // namespace curvelab
