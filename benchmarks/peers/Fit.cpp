// One cubic to a run of points, with the end tangents left open. Each run is sampled from a curve of the corpus at uneven
// parameters, with noise. Both get the chord length for a start and improve it; ours by a given number of passes, the peer
// by its own rule, stopping below a tolerance. The error is the largest distance of a point from the fit.

#include "ZarnMath/FitBezier.h"
#include "benchmarks/peers/Lib2geom.h"
#include "benchmarks/peers/Questions.h"
#include "tests/census/BruteForce.h"

#include <2geom/bezier-utils.h>

#include <cmath>

namespace ZarnMath::Peers {
namespace {

using Benchmarks::Corpus;
using Run = std::vector<point2d>;

constexpr std::size_t runCount = 400;
constexpr int pointsInRun = 60;

Run SampleRun(RandomSource& random, const CubicBezier::PowerForm& form)
{
    Run run;
    for (int i = 0; i < pointsInRun; ++i) {
        const double t = (i + (i > 0 && i + 1 < pointsInRun ? random.Uniform(-0.4, 0.4) : 0.0)) / (pointsInRun - 1);
        run.push_back(CubicBezier::Evaluate(form, t) + AsVector(random.Point(0.25)));
    }
    return run;
}

double LargestDistance(const Run& run, const Cubic& fit)
{
    const auto form = CubicBezier::ToPowerForm(fit.data());
    double largest = 0.0;
    for (const point2d& p : run) {
        const point2d nearest = CubicBezier::Evaluate(form, Census::FindNearest(fit, p));
        largest = std::max(largest, std::sqrt(LengthSquared(p - nearest)));
    }
    return largest;
}

Cubic FitFree(const Run& run, int passes)
{
    Cubic fit;
    LeastSquares(run.data(), static_cast<int>(run.size()), fit.data(), passes);
    return fit;
}

} // namespace

void AskForFit(const Corpus& corpus)
{
    RandomSource random(60);
    std::vector<Run> runs;
    std::vector<std::vector<Geom::Point>> geomRuns;
    for (std::size_t i = 0; i < runCount; ++i) {
        runs.push_back(SampleRun(random, corpus.forms[i]));
        geomRuns.push_back(ToGeom(runs.back()));
    }
    Question question("one cubic to 60 points", runCount);
    const auto add = [&](const char* library, std::string setting, auto fit) {
        std::vector<double> errors;
        for (std::size_t i = 0; i < runCount; ++i)
            errors.push_back(LargestDistance(runs[i], fit(i)));
        question.Add(library, std::move(setting), fit, Errors(errors));
    };
    for (const int passes : {1, 2, 4, 8, 16})
        add("ZarnMath", std::to_string(passes) + (passes == 1 ? " pass" : " passes"),
            [&runs, passes](std::size_t i) { return FitFree(runs[i], passes); });
    add("lib2geom", "", [&](std::size_t i) {
        Geom::Point bezier[4];
        Geom::bezier_fit_cubic(bezier, geomRuns[i].data(), pointsInRun, 1e-6);
        Cubic fit;
        for (std::size_t k = 0; k < fit.size(); ++k)
            fit[k] = {bezier[k][Geom::X], bezier[k][Geom::Y]};
        return fit;
    });
    question.Ask();
}

} // namespace ZarnMath::Peers
