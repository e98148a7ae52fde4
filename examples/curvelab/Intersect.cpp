#include "Command.h"
#include "Measure.h"

#include <algorithm>
#include <array>
#include <optional>
#include <utility>

namespace curvelab {

namespace {

/// How near, in drawing units, two crossings of neighbouring curves are one, and one is the end that neighbours share: the
/// library's own band is 2 units wide.
constexpr double reach = 2.0;

/// A curve with what is needed to pair it.
struct Candidate
{
    std::size_t index;
    std::size_t next; ///< the index of the curve that goes on from its end; its own if there is none
    Cubic curve;
    IntegerCubic whole;
    Bounds box;
};

/// A place where two curves cross, or one crosses itself.
struct Crossing
{
    std::size_t first;
    std::size_t second;
    double t;
    double s;
    point2d point;
    bool isContact = false; ///< whether an end of one lies on the other there, and neither listed a crossing
};

/// What is known after all pairs.
struct Totals
{
    std::vector<Crossing> crossings;
    std::int64_t asked = 0;    ///< pairs whose boxes overlap
    std::int64_t bent = 0;     ///< pairs of parabolas, of which one was given a cubic term
    std::int64_t missed = 0;   ///< crossings found on pieces of the curves only
    std::int64_t together = 0; ///< crossings where the two curves run along each other
    std::int64_t selves = 0;   ///< crossings of a curve with itself
    std::int64_t loops = 0;    ///< loops found only when magnified
};

std::vector<Candidate> Candidates(const Job& job)
{
    std::vector<Candidate> candidates;
    for (const Contour& contour : job.drawing.contours) {
        const std::size_t start = candidates.size();
        for (const Cubic& exact : contour.curves) {
            const std::size_t index = candidates.size();
            Candidate each{index, index + 1, Asked(job, exact), Rounded(exact), NoBounds()};
            Include(each.box, each.curve);
            candidates.push_back(each);
        }
        candidates.back().next = contour.closed ? start : candidates.back().index;
    }
    return candidates;
}

/// What the library lists for two curves.
struct Listed
{
    std::vector<double> firstParameters;
    std::vector<double> secondParameters;
    std::vector<point2d> points;
    std::size_t onWhole = 0; ///< how many of them the whole curves show; those of pieces follow
};

Listed Ask(const Cubic& first, const Cubic& second)
{
    Listed listed;
    ZarnMath::CubicBezier::FindBezierIntersections(first.points, second.points, listed.firstParameters,
                                                   listed.secondParameters, listed.points);
    return listed;
}

Listed Ask(const IntegerCubic& first, const IntegerCubic& second)
{
    Listed listed;
    ZarnMath::CubicBezier::FindBezierIntersections(first.data(), second.data(), listed.firstParameters,
                                                   listed.secondParameters, listed.points);
    return listed;
}

/// A piece of a curve, the one from `from` to `from + width` of its parameters.
struct Piece
{
    Cubic curve;
    double from;
    double width;
};

/// The two pieces of an uneven cut.
std::array<Piece, 2> Pieces(const Cubic& curve)
{
    constexpr double cut = 3.0 / 7.0;
    std::array<Piece, 2> pieces{{{{}, 0.0, cut}, {{}, cut, 1.0 - cut}}};
    ZarnMath::CubicBezier::Split(cut, curve.points, pieces[0].curve.points, pieces[1].curve.points);
    return pieces;
}

/// The parameter at which a curve runs within 0.1 units of a point.
std::optional<double> ParameterAt(const Cubic& curve, const point2d& q)
{
    const PowerForm p = ToPowerForm(curve);
    std::vector<double> parameters;
    const bool isOn = ZarnMath::CubicBezier::Invert(p.a, p.b, p.c, p.d, q, parameters);
    return isOn ? std::optional(parameters.front()) : std::nullopt;
}

bool Holds(const std::vector<point2d>& points, const point2d& p)
{
    return std::any_of(points.begin(), points.end(), [&](const point2d& q) { return Distance(p, q) <= reach; });
}

/// Adds the crossings of the pieces that the whole curves do not list. The library's searches halve the range of a
/// parameter, and a root exactly on a cut is lost, as in the middle of a symmetric figure; on the pieces of an uneven cut it
/// lies elsewhere. A piece is straighter than its curve, so the band of straight curves is narrowed to 0.1 units here.
void AddMissed(const Cubic& first, const Cubic& second, Listed& listed)
{
    listed.onWhole = listed.points.size();
    for (const Piece& one : Pieces(first))
        for (const Piece& other : Pieces(second)) {
            const Listed found = Ask(one.curve, other.curve);
            for (std::size_t i = 0; i < found.points.size(); ++i) {
                const point2d& p = found.points[i];
                if (Holds(listed.points, p) || !ParameterAt(one.curve, p) || !ParameterAt(other.curve, p))
                    continue;
                listed.firstParameters.push_back(one.from + one.width * found.firstParameters[i]);
                listed.secondParameters.push_back(other.from + other.width * found.secondParameters[i]);
                listed.points.push_back(p);
            }
        }
}

bool IsParabola(const Cubic& curve)
{
    const PowerForm p = ToPowerForm(curve);
    return p.a.x == 0.0 && p.a.y == 0.0;
}

/// A parabola with its end moved across its axis by a hundred millionth of the drawing, which gives it a cubic term.
Cubic Bent(Cubic curve, double drawingSize)
{
    const ZarnMath::vector2d axis = ZarnMath::Normalize(ZarnMath::AsVector(ToPowerForm(curve).b));
    curve[3] = curve[3] + ZarnMath::Perpendicular(axis) * (1e-8 * drawingSize);
    return curve;
}

/// Whether two curves run along each other at a crossing: nearby points of the second lie on the first as well.
bool RunTogether(const Candidate& one, const Candidate& other, double s)
{
    constexpr double step = 0.1;
    const PowerForm p = ToPowerForm(other.curve);
    for (const double near : {s - step, s + step})
        if (near >= 0.0 && near <= 1.0 && !ParameterAt(one.curve, Evaluate(p, near)))
            return false;
    return true;
}

/// Whether a point is an end that the two curves share as neighbours in a contour.
bool IsJoint(const Candidate& one, const Candidate& other, const point2d& p)
{
    const bool goesOn = one.next == other.index && Distance(p, one.curve[3]) <= reach;
    return goesOn || (other.next == one.index && Distance(p, other.curve[3]) <= reach);
}

/// All that is listed for two curves, one way or another.
Listed AskAll(const Candidate& one, const Candidate& other, const Job& job, Totals& totals)
{
    Listed listed = job.integer ? Ask(one.whole, other.whole) : Ask(one.curve, other.curve);
    Cubic first = one.curve;
    if (IsParabola(one.curve) && IsParabola(other.curve)) {
        ++totals.bent;
        first = Bent(one.curve, LargerSide(job.drawing.bounds));
        if (listed.points.empty())
            listed = Ask(first, other.curve);
    }
    AddMissed(first, other.curve, listed);
    return listed;
}

/// The ends of the first curve that lie on the second.
void AddContacts(const Candidate& one, const Candidate& other, std::vector<Crossing>& crossings)
{
    for (const double t : {0.0, 1.0}) {
        const point2d& end = one.curve[t == 0.0 ? 0 : 3];
        if (IsJoint(one, other, end))
            continue;
        if (const std::optional<double> s = ParameterAt(other.curve, end))
            crossings.push_back({one.index, other.index, t, *s, end, true});
    }
}

void CrossPair(const Candidate& one, const Candidate& other, const Job& job, Totals& totals)
{
    ++totals.asked;
    const Listed listed = AskAll(one, other, job, totals);
    for (std::size_t i = 0; i < listed.points.size(); ++i) {
        const point2d& p = listed.points[i];
        const double t = listed.firstParameters[i], s = listed.secondParameters[i];
        if (IsJoint(one, other, p))
            continue;
        if (RunTogether(one, other, s)) {
            ++totals.together;
            continue;
        }
        totals.missed += i >= listed.onWhole ? 1 : 0;
        totals.crossings.push_back({one.index, other.index, t, s, p});
    }
    AddContacts(one, other, totals.crossings);
    AddContacts(other, one, totals.crossings);
}

bool HasLoop(const Candidate& each)
{
    double lateStart = 0.0, lateEnd = 0.0, earlyStart = 0.0, earlyEnd = 0.0;
    return ZarnMath::CubicBezier::DoesBezierSelfIntersect(each.curve.points, lateStart, lateEnd, earlyStart, earlyEnd,
                                                          false);
}

std::optional<Crossing> FindLoop(const Candidate& each, bool integer)
{
    Crossing c{each.index, each.index, 0.0, 0.0, {}};
    using ZarnMath::CubicBezier::FindBezierSelfIntersection;
    const bool isFound = integer ? FindBezierSelfIntersection(each.whole.data(), c.t, c.s, c.point)
                                 : FindBezierSelfIntersection(each.curve.points, c.t, c.s, c.point);
    return isFound ? std::optional(c) : std::nullopt;
}

/// Asks once more with the curve as large as a loop of it needs; parameters do not change.
std::optional<Crossing> FindMagnifiedLoop(Candidate each)
{
    const double factor = 1048576.0 / LargerSide(each.box);
    const PowerForm p = ToPowerForm(each.curve);
    for (point2d& point : each.curve.points)
        point = ZarnMath::AsPoint((point - p.d) * factor);
    std::optional<Crossing> crossing = FindLoop(each, false);
    if (crossing)
        crossing->point = Evaluate(p, crossing->t);
    return crossing;
}

void CrossSelf(const Candidate& each, const Job& job, Totals& totals)
{
    if (!HasLoop(each))
        return;
    std::optional<Crossing> crossing = FindLoop(each, job.integer);
    if (!crossing) {
        crossing = FindMagnifiedLoop(each);
        totals.loops += crossing ? 1 : 0;
    }
    if (!crossing)
        return;
    ++totals.selves;
    totals.crossings.push_back(*crossing);
}

/// Whether two curves are the same one or neighbours.
bool AreRelated(const std::vector<Candidate>& candidates, std::size_t i, std::size_t j)
{
    return i == j || candidates[i].next == j || candidates[j].next == i;
}

/// Whether two crossings are one, seen from both curves at a joint, or listed twice.
bool IsSame(const std::vector<Candidate>& candidates, const Crossing& one, const Crossing& other)
{
    const auto match = [&](std::size_t i, std::size_t j) { return AreRelated(candidates, i, j); };
    const bool sameCurves = (match(one.first, other.first) && match(one.second, other.second)) ||
                            (match(one.first, other.second) && match(one.second, other.first));
    return sameCurves && Distance(one.point, other.point) <= reach;
}

/// Leaves one of the crossings that are the same, a contact only if there is nothing else; the others stay in the order of
/// their x.
void RemoveRepeats(const std::vector<Candidate>& candidates, std::vector<Crossing>& crossings)
{
    std::sort(crossings.begin(), crossings.end(),
              [](const Crossing& a, const Crossing& b) { return a.point.x < b.point.x; });
    std::vector<Crossing> kept;
    for (const Crossing& each : crossings) {
        bool isRepeat = false;
        for (auto i = kept.rbegin(); i != kept.rend() && each.point.x - i->point.x <= reach && !isRepeat; ++i) {
            isRepeat = IsSame(candidates, *i, each);
            if (isRepeat && i->isContact)
                *i = each;
        }
        if (!isRepeat)
            kept.push_back(each);
    }
    crossings = std::move(kept);
}

/// Sweeps over the curves by the left sides of their boxes: those that begin beyond the right side of one are left out
/// together.
Totals Find(const std::vector<Candidate>& candidates, const Job& job)
{
    std::vector<const Candidate*> order;
    for (const Candidate& each : candidates)
        order.push_back(&each);
    std::stable_sort(order.begin(), order.end(),
                     [](const Candidate* a, const Candidate* b) { return a->box.left < b->box.left; });
    Totals totals;
    job.progress.Begin("crossing", order.size());
    for (std::size_t i = 0; i < order.size(); ++i) {
        const Candidate& one = *order[i];
        CrossSelf(one, job, totals);
        for (std::size_t j = i + 1; j < order.size() && order[j]->box.left <= one.box.right; ++j) {
            const Candidate& other = *order[j];
            if (one.box.bottom <= other.box.top && other.box.bottom <= one.box.top)
                CrossPair(one.index < other.index ? one : other, one.index < other.index ? other : one, job, totals);
        }
        job.progress.Step();
    }
    RemoveRepeats(candidates, totals.crossings);
    return totals;
}

void AddPlaces(const std::vector<Crossing>& crossings, bool contacts, const std::string& suffix, Report& report)
{
    std::vector<std::int64_t> first, second;
    std::vector<double> t, s;
    std::vector<point2d> points;
    for (const Crossing& each : crossings) {
        if (each.isContact != contacts)
            continue;
        first.push_back(static_cast<std::int64_t>(each.first));
        second.push_back(static_cast<std::int64_t>(each.second));
        t.push_back(each.t);
        s.push_back(each.s);
        points.push_back(each.point);
    }
    report.AddNumbers("points" + suffix, points);
    report.AddNumbers("firstCurve" + suffix, first);
    report.AddNumbers("secondCurve" + suffix, second);
    report.AddNumbers("firstT" + suffix, t);
    report.AddNumbers("secondT" + suffix, s);
}

void Describe(const Totals& totals, std::size_t curves, Report& report)
{
    const std::vector<Crossing>& all = totals.crossings;
    const std::int64_t contacts = std::count_if(all.begin(), all.end(), [](const Crossing& c) { return c.isContact; });
    const auto count = static_cast<std::int64_t>(curves);
    report.Add("crossings", "crossings", static_cast<std::int64_t>(all.size()) - contacts);
    report.Add("selfCrossings", "of a curve with itself", totals.selves);
    report.Add("contacts", "ends on other curves", contacts);
    report.Add("curves", "curves", count);
    report.Add("pairs", "pairs of curves", count * (count - 1) / 2);
    report.Add("pairsAsked", "pairs asked", totals.asked);
    report.Add("missedCrossings", "found on pieces only", totals.missed);
    report.Add("magnifiedLoops", "loops found magnified", totals.loops);
    report.Add("bentPairs", "pairs of parabolas", totals.bent);
    report.Add("runTogether", "left out, run together", totals.together);
    AddPlaces(all, false, "", report);
    AddPlaces(all, true, "OfContacts", report);
}

void Show(const std::vector<Candidate>& candidates, const Totals& totals, Picture& picture)
{
    std::vector<bool> takesPart(candidates.size());
    for (const Crossing& each : totals.crossings)
        if (!each.isContact)
            takesPart[each.first] = takesPart[each.second] = true;
    double length = 0.0;
    for (const Candidate& each : candidates)
        length += Distance(each.curve[0], each.curve[3]);
    const double dot = picture.DotWidth(totals.crossings.size(), length, 9.0);
    const Style curve{colour::blue, 2.0, "", 1.0};
    const Style pair{colour::orange, dot, "", 1.0};
    const Style self{colour::green, dot, "", 1.0};
    const Style contact{colour::ink, 0.75 * dot, "", 1.0};
    Layer& curves = picture.AddLayer(curve);
    for (const Candidate& each : candidates)
        if (takesPart[each.index])
            curves.AddCurve(each.curve);
    Layer& halos = picture.AddLayer({colour::paper, dot + 3.0, "", 1.0});
    Layer& contacts = picture.AddLayer(contact);
    Layer& pairs = picture.AddLayer(pair);
    Layer& selves = picture.AddLayer(self);
    for (const Crossing& each : totals.crossings) {
        halos.AddDot(each.point);
        (each.isContact ? contacts : each.first == each.second ? selves : pairs).AddDot(each.point);
    }
    picture.AddLegend(curve, Sample::Stroke, "curves that cross");
    picture.AddLegend(pair, Sample::Dot, "crossings of two");
    picture.AddLegend(self, Sample::Dot, "of one with itself");
    picture.AddLegend(contact, Sample::Dot, "an end on another curve");
}

void Run(const Job& job, Report& report, Picture& picture)
{
    const std::vector<Candidate> candidates = Candidates(job);
    const Totals totals = Find(candidates, job);
    Describe(totals, candidates.size(), report);
    Show(candidates, totals, picture);
}

Question Prepare(const Arguments&)
{
    return Run;
}

} // namespace

Command IntersectCommand()
{
    return {
        "intersect",
        "Finds where the curves of the drawing cross each other and themselves",
        "Every pair of curves whose boxes overlap is asked, and each curve with itself. The end that two curves\n"
        "share in a contour is no crossing. The library looks inside the curves, for crossings and not for\n"
        "touches: an end that lies on another curve is told apart, be it a touch or a place where the contour\n"
        "crosses. A crossing exactly on a cut of the library's search is lost; curvelab asks the pieces of uneven\n"
        "cuts as well, and counts what only they show. Of two parabolas, as in fonts with quadratic outlines, the\n"
        "library lists nothing; one of them is given a hundred millionth of the drawing as cubic term. A loop\n"
        "that is detected, and too small to be found, is asked for magnified. Where two curves run along each\n"
        "other there is no crossing. Repeats within 2 units at a joint count once. All lengths inside the library\n"
        "are absolute: with few --units, curves count as straight lines. With --integer the integer overloads are\n"
        "asked, except where curvelab asks once more.",
        {},
        {{"intersect knots.svg -o crossings.svg --json crossings.json", "All crossings, as a picture and as numbers"}},
        Prepare};
}

} // namespace curvelab
