#include "TransformSteps.h"

#include "Failure.h"
#include "Numbers.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <sstream>

namespace curvelab {

namespace {

using ZarnMath::point2d;
using Kind = TransformStep::Kind;

/// Beyond it a coordinate has no whole unit in 32 bits.
constexpr double farthest = 1e9;
/// Turns beyond it would leave 32 bits in millionths of a degree.
constexpr double largestTurn = 2000.0;
/// A right angle leans infinitely far.
constexpr double largestSkew = 89.0;
constexpr double largestFactor = 1e6;

constexpr double radiansPerDegree = 3.14159265358979323846 / 180.0;

/// How a kind of step is written.
struct Form
{
    const char* name;
    Kind kind;
    std::size_t count; ///< of its values
    double largest;    ///< the limit of their magnitudes
    bool hasCentre;
};

constexpr Form forms[] = {
    {"move", Kind::Move, 2, farthest, false},       {"rotate", Kind::Rotate, 1, largestTurn, true},
    {"scale", Kind::Scale, 2, largestFactor, true}, {"skew", Kind::Skew, 2, largestSkew, true},
    {"mirror", Kind::Mirror, 1, largestTurn, true}, {"matrix", Kind::Matrix, 6, farthest, false}};

const Form& FindForm(const std::string& option, const std::string& word)
{
    const std::string name = word.substr(0, word.find(':'));
    const auto form =
        std::find_if(std::begin(forms), std::end(forms), [&](const Form& each) { return each.name == name; });
    if (form == std::end(forms))
        throw Failure(option + ": " + Quoted(word) + " is no step, write move, rotate, scale, skew, mirror or matrix");
    return *form;
}

std::vector<std::string> Split(const std::string& text, char separator)
{
    std::vector<std::string> parts(1);
    for (const char c : text)
        if (c == separator)
            parts.emplace_back();
        else
            parts.back() += c;
    return parts;
}

std::vector<double> ReadValues(const std::string& option, const std::string& word, const Form& form,
                               const std::string& text)
{
    const std::string where = option + ", " + word;
    std::vector<double> values;
    for (const std::string& part : Split(text, ','))
        values.push_back(ReadNumberWithin(where, part, -form.largest, form.largest));
    if (form.kind == Kind::Scale && values.size() == 1)
        values.push_back(values.front());
    if (values.size() != form.count)
        throw Failure(option + ": " + Quoted(word) + " has " + std::to_string(values.size()) + " values, " + form.name +
                      " takes " + std::to_string(form.count));
    return values;
}

point2d ReadCentre(const std::string& option, const std::string& word, const std::string& text)
{
    const point2d centre = ReadPoint(option + ", " + word, text);
    if (std::fabs(centre.x) > farthest || std::fabs(centre.y) > farthest)
        throw Failure(option + ": the centre of " + Quoted(word) + " is farther than " + FormatNumber(farthest) +
                      " units away");
    return centre;
}

TransformStep ReadStep(const std::string& option, const std::string& word)
{
    const Form& form = FindForm(option, word);
    const std::size_t colon = word.find(':');
    if (colon == std::string::npos)
        throw Failure(option + ": " + Quoted(word) + " has no values, write them after a colon");
    const std::size_t at = word.find('@');
    TransformStep step{form.kind, ReadValues(option, word, form, word.substr(colon + 1, at - colon - 1)), {}};
    if (at == std::string::npos)
        return step;
    if (!form.hasCentre)
        throw Failure(option + ": " + Quoted(word) + " has a centre, but " + form.name + " takes none");
    step.centre = ReadCentre(option, word, word.substr(at + 1));
    return step;
}

/// The mirror whose axis passes through the origin at an angle.
MATRIX MirrorAt(double radians)
{
    MATRIX mirror = ZarnMath::ConstructRotationMatrix(-radians);
    mirror.ScaleMatrix(ZarnMath::vector2d{1.0, -1.0});
    mirror.Rotate(radians);
    return mirror;
}

void Apply(const TransformStep& step, const point2d& centre, MATRIX& m)
{
    const std::vector<double>& v = step.values;
    switch (step.kind) {
    case Kind::Move:
        m = ZarnMath::ConstructTranslationMatrix({v[0], v[1]}) * m;
        break;
    case Kind::Rotate:
        m.RotateAroundPoint(v[0] * radiansPerDegree, centre);
        break;
    case Kind::Scale:
        m.ScaleMatrix({v[0], v[1]}, centre);
        break;
    case Kind::Skew:
        m = ZarnMath::ConstructSkewAroundMatrix(v[0] * radiansPerDegree, v[1] * radiansPerDegree, centre) * m;
        break;
    case Kind::Mirror:
        m.TransformAroundPoint(MirrorAt(v[0] * radiansPerDegree), centre);
        break;
    case Kind::Matrix:
        m = MATRIX{v[0], v[1], v[2], v[3], v[4], v[5]} * m;
        break;
    }
}

int Units(double degrees)
{
    return ZarnMath::RoundToInt(degrees * 1e6);
}

void ApplyInWholeUnits(const TransformStep& step, const point2d& centre, MATRIX& m)
{
    const std::vector<double>& v = step.values;
    const int cx = ZarnMath::RoundToInt(centre.x);
    const int cy = ZarnMath::RoundToInt(centre.y);
    switch (step.kind) {
    case Kind::Move:
        UTLTranslateMatrix(&m, ZarnMath::RoundToInt(v[0]), ZarnMath::RoundToInt(v[1]));
        break;
    case Kind::Rotate:
        UTLRotateMatrixAround(&m, Units(v[0]), cx, cy);
        break;
    case Kind::Scale:
        UTLStretchMatrix(&m, cx, cy, v[0], v[1]);
        break;
    case Kind::Skew:
        UTLSkewMatrix(&m, Units(v[0]), Units(v[1]), cx, cy);
        break;
    case Kind::Mirror:
        UTLRotateMatrixAround(&m, Units(-v[0]), cx, cy);
        UTLStretchMatrix(&m, cx, cy, 1.0, -1.0);
        UTLRotateMatrixAround(&m, Units(v[0]), cx, cy);
        break;
    case Kind::Matrix:
        m = MATRIX{v[0], v[1], v[2], v[3], v[4], v[5]} * m;
        break;
    }
}

} // namespace

std::vector<TransformStep> ReadTransformSteps(const std::string& option, const std::string& text)
{
    std::istringstream words(text);
    std::vector<TransformStep> steps;
    for (std::string word; words >> word;)
        steps.push_back(ReadStep(option, word));
    if (steps.empty())
        throw Failure(option + ": no step given");
    return steps;
}

MATRIX Combine(const std::vector<TransformStep>& steps, const point2d& centre)
{
    MATRIX m = ZarnMath::IdentityMatrix();
    for (const TransformStep& step : steps)
        Apply(step, step.centre.value_or(centre), m);
    return m;
}

MATRIX CombineInWholeUnits(const std::vector<TransformStep>& steps, const point2d& centre)
{
    MATRIX m;
    UTLGetIdentityMatrix(&m);
    for (const TransformStep& step : steps)
        ApplyInWholeUnits(step, step.centre.value_or(centre), m);
    return m;
}

} // namespace curvelab
