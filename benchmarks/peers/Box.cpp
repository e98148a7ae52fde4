// The box that a cubic fills. FreeType's is in whole 64ths of a unit, which is its error.

#include "ZarnMath/BezierInternal.h"
#include "benchmarks/peers/FreeType.h"
#include "benchmarks/peers/Lib2geom.h"
#include "benchmarks/peers/Questions.h"
#include "benchmarks/peers/Truth.h"

#include FT_BBOX_H

#include <cmath>

namespace ZarnMath::Peers {
namespace {

using Benchmarks::Corpus;

Box TightBounds(const CubicBezier::PowerForm& f)
{
    Box box;
    CubicBezier::GetTightBounds(f.a, f.b, f.c, f.d, box.left, box.bottom, box.right, box.top);
    return box;
}

double Gap(const Box& a, const Box& b)
{
    return std::max({std::fabs(a.left - b.left), std::fabs(a.bottom - b.bottom), std::fabs(a.right - b.right),
                     std::fabs(a.top - b.top)});
}

} // namespace

void AskForBox(const Corpus& corpus)
{
    std::vector<Box> truths;
    for (const Cubic& curve : corpus.real.curves)
        truths.push_back(TrueBox(curve));
    Question question("tight box", corpus.forms.size());
    const auto add = [&](const char* library, auto answer) {
        std::vector<double> errors;
        for (std::size_t i = 0; i < truths.size(); ++i)
            errors.push_back(Gap(answer(i), truths[i]));
        question.Add(library, "", answer, Errors(errors));
    };
    // Control points are what the peers are given; the power form is part of our time.
    add("ZarnMath", [&](std::size_t i) { return TightBounds(CubicBezier::ToPowerForm(corpus.real.curves[i].data())); });
    const auto geomCurves = ToGeom(corpus.real.curves);
    add("lib2geom", [&](std::size_t i) {
        const Geom::Rect box = geomCurves[i].boundsExact();
        return Box{box.left(), box.top(), box.right(), box.bottom()};
    });
    Outlines outlines(corpus.real.curves);
    add("FreeType", [&](std::size_t i) {
        FT_BBox box;
        FT_Outline_Get_BBox(&outlines[i].outline, &box);
        return Box{FromFixed(box.xMin), FromFixed(box.yMin), FromFixed(box.xMax), FromFixed(box.yMax)};
    });
    question.Ask();
}

} // namespace ZarnMath::Peers
