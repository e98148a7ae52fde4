// Arc length. A setting of ours is a number of samples of the speed, or the tolerance of a loop around them, which stands
// here as a caller would write it; of the peers, it is the tolerance they are asked for. Which settings come to the same
// error is for the reader of the results to find.

#include "ZarnMath/Bezier.h"
#include "benchmarks/peers/GslLength.h"
#include "benchmarks/peers/Lib2geom.h"
#include "benchmarks/peers/Questions.h"
#include "benchmarks/peers/Truth.h"

#include <cmath>

namespace ZarnMath::Peers {
namespace {

using Benchmarks::Corpus;
using CubicBezier::PowerForm;

/// A part of a curve, and its length by 16 samples.
struct Stretch
{
    double start;
    double end;
    double length;
};

Stretch Measure(const PowerForm& f, double start, double end)
{
    return {start, end, CubicBezier::Length(f.a, f.b, f.c, 16, start, end)};
}

/// Stretches that differ from their halves by no more than a tolerance count as these halves, the others are halved. At
/// a cusp that ends after so many halvings.
double HalveWhileFar(const PowerForm& f, const Stretch& whole, double tolerance, int mostHalvings = 16)
{
    const double middle = 0.5 * (whole.start + whole.end);
    const Stretch first = Measure(f, whole.start, middle);
    const Stretch second = Measure(f, middle, whole.end);
    const double length = first.length + second.length;
    if (mostHalvings == 0 || std::fabs(length - whole.length) <= tolerance)
        return length;
    return HalveWhileFar(f, first, tolerance, mostHalvings - 1) + HalveWhileFar(f, second, tolerance, mostHalvings - 1);
}

} // namespace

void AskForLength(const Corpus& corpus)
{
    const GslLength lengthByGsl;
    std::vector<double> truths;
    for (const Cubic& curve : corpus.real.curves)
        truths.push_back(TrueLength(curve));

    Question question("arc length", corpus.forms.size());
    const auto add = [&](const char* library, std::string setting, auto answer) {
        std::vector<double> errors;
        for (std::size_t i = 0; i < truths.size(); ++i)
            errors.push_back(std::fabs(answer(i) - truths[i]));
        question.Add(library, std::move(setting), answer, Errors(errors));
    };
    for (const int order : {4, 8, 10, 16})
        add("ZarnMath", std::to_string(order) + " samples", [&corpus, order](std::size_t i) {
            const PowerForm& f = corpus.forms[i];
            return CubicBezier::Length(f.a, f.b, f.c, order, 0.0, 1.0);
        });
    for (const char* tolerance : {"1", "1e-2", "1e-4", "1e-6", "1e-8", "1e-10"})
        add("ZarnMath", std::string("halved to ") + tolerance, [&corpus, e = std::stod(tolerance)](std::size_t i) {
            return HalveWhileFar(corpus.forms[i], Measure(corpus.forms[i], 0.0, 1.0), e);
        });
    const auto geomCurves = ToGeom(corpus.real.curves);
    for (const char* tolerance : {"1", "0.01", "1e-4", "1e-6"}) {
        add("lib2geom", tolerance, [&, e = std::stod(tolerance)](std::size_t i) { return geomCurves[i].length(e); });
        add("GSL", tolerance, [&, e = std::stod(tolerance)](std::size_t i) { return lengthByGsl(corpus.forms[i], e); });
    }
    question.Ask();
}

} // namespace ZarnMath::Peers
