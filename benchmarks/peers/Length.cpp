// Arc length. A setting of ours is a number of samples of the speed, and where stretches are named, of equal stretches in
// the parameter that are summed; of the peers, it is the tolerance they are asked for. Which settings come to the same
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

double LengthInStretches(const PowerForm& f, int order, int stretches)
{
    double length = 0.0;
    for (int i = 0; i < stretches; ++i)
        length += CubicBezier::Length(f.a, f.b, f.c, order, static_cast<double>(i) / stretches,
                                      static_cast<double>(i + 1) / stretches);
    return length;
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
    for (const auto& [order, stretches] :
         {std::pair{4, 1}, {8, 1}, {10, 1}, {16, 1}, {16, 2}, {16, 4}, {16, 8}, {16, 16}}) {
        std::string setting = std::to_string(order) + " samples";
        if (stretches > 1)
            setting = std::to_string(stretches) + " stretches of " + setting;
        add("ZarnMath", setting, [&corpus, order = order, stretches = stretches](std::size_t i) {
            return LengthInStretches(corpus.forms[i], order, stretches);
        });
    }
    const auto geomCurves = ToGeom(corpus.real.curves);
    for (const char* tolerance : {"1", "0.01", "1e-4", "1e-6"}) {
        add("lib2geom", tolerance, [&, e = std::stod(tolerance)](std::size_t i) { return geomCurves[i].length(e); });
        add("GSL", tolerance, [&, e = std::stod(tolerance)](std::size_t i) { return lengthByGsl(corpus.forms[i], e); });
    }
    question.Ask();
}

} // namespace ZarnMath::Peers
