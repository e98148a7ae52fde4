#include "tests/census/BruteForce.h"
#include "tests/census/Cases.h"
#include "tests/census/Census.h"

#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/Line.h"
#include "ZarnMath/RootFinder.h"

#include <algorithm>
#include <utility>

namespace ZarnMath::Census {

namespace {

using namespace CubicBezier;

enum Row : std::size_t
{
    Pairs,
    Overlapping,
    Contacts,
    Reported,
    AtAnEnd,
    TakenAsStraight,
    NoCubicTerm,
    DoubledBack,
    Touching,
    InversionRejected,
    OnACut,
    Other,
    Twice,
    ChordOnly,
    Elsewhere
};

/// What the library did with one pair.
struct Attempt
{
    bool isStraight;
    bool isExchanged;
    bool hasCubicTerm;
    bool isImplicitFlat;
    std::vector<double> roots;
    std::vector<Contact> found;

    Attempt(const Cubic& first, const Cubic& second)
    {
        std::vector<double> s;
        std::vector<double> t;
        std::vector<point2d> points;
        isStraight = StraightBezierIntersectionTest(first.data(), second.data(), s, t, points) ||
                     StraightBezierIntersectionTest(second.data(), first.data(), t, s, points);
        PowerForm f = ToPowerForm(first.data());
        PowerForm g = ToPowerForm(second.data());
        const vector2d origin = AsVector(f.d);
        f.d = f.d - origin;
        g.d = g.d - origin;
        isExchanged = f.a == point2d{0.0, 0.0};
        if (isExchanged)
            std::swap(f, g);
        hasCubicTerm = f.a != point2d{0.0, 0.0};
        isImplicitFlat = AreCollinear(isExchanged ? second.data() : first.data(), 4, 4.0);
        double polynomial[10];
        GetBezierIntersectionPolynomial(f.a, f.b, f.c, f.d, g.a, g.b, g.c, g.d, polynomial);
        roots.resize(10);
        roots.resize(static_cast<std::size_t>(RootFinder::FindRoots<9>(polynomial, roots.data(), false)));

        s.clear();
        t.clear();
        points.clear();
        FindBezierIntersections(first.data(), second.data(), s, t, points);
        for (std::size_t i = 0; i < s.size(); ++i)
            found.push_back({s[i], t[i], points[i]});
    }

    [[nodiscard]] bool HasRootAt(const Contact& contact) const
    {
        const double parameter = isExchanged ? contact.s : contact.t;
        return std::any_of(roots.begin(), roots.end(), [=](double r) { return std::fabs(r - parameter) < 1e-4; });
    }
};

double SineAt(const Cubic& first, const Cubic& second, const Contact& contact)
{
    const PowerForm f = ToPowerForm(first.data());
    const PowerForm g = ToPowerForm(second.data());
    const vector2d u = Derivative(f.a, f.b, f.c, contact.s);
    const vector2d v = Derivative(g.a, g.b, g.c, contact.t);
    return std::fabs(Cross(u, v)) / std::sqrt(LengthSquared(u) * LengthSquared(v));
}

Row CauseOf(const Cubic& first, const Cubic& second, const Contact& missed, const Attempt& attempt)
{
    if (std::min({missed.s, missed.t, 1.0 - missed.s, 1.0 - missed.t}) < 1e-6)
        return AtAnEnd;
    if (attempt.isStraight)
        return TakenAsStraight;
    if (!attempt.hasCubicTerm)
        return NoCubicTerm;
    if (attempt.isImplicitFlat)
        return DoubledBack;
    if (!(SineAt(first, second, missed) > 1e-3))
        return Touching;
    if (attempt.HasRootAt(missed))
        return InversionRejected;
    return IsOnACut(attempt.isExchanged ? missed.s : missed.t) ? OnACut : Other;
}

/// How close a reported crossing is to a contact, in parameters; infinite where the points are apart.
double Mismatch(const Contact& contact, const Contact& reported, bool isStraight)
{
    const double apart = std::sqrt(LengthSquared(contact.point - reported.point));
    if (!(apart < (isStraight ? 6.0 : 0.5)))
        return std::numeric_limits<double>::infinity();
    return std::fabs(contact.s - reported.s) + std::fabs(contact.t - reported.t);
}

void CountPair(const Cubic& first, const Cubic& second, Placement placement, Tally& tally)
{
    tally.Count(Pairs, placement);
    const auto contacts = FindContacts(first, second);
    if (!contacts) {
        tally.Count(Overlapping, placement);
        return;
    }
    const Attempt attempt(first, second);
    std::vector<Contact> left = attempt.found;
    for (const Contact& contact : *contacts) {
        tally.Count(Contacts, placement);
        const auto distance = [&](const Contact& c) { return Mismatch(contact, c, attempt.isStraight); };
        const auto best = std::min_element(
            left.begin(), left.end(), [&](const Contact& a, const Contact& b) { return distance(a) < distance(b); });
        if (best != left.end() && distance(*best) < 0.5) {
            tally.Count(Reported, placement);
            left.erase(best);
        } else {
            tally.Count(CauseOf(first, second, contact, attempt), placement);
        }
    }
    for (const Contact& extra : left) {
        const bool isTwice = std::any_of(contacts->begin(), contacts->end(), [&](const Contact& contact) {
            return Mismatch(contact, extra, attempt.isStraight) < 0.01;
        });
        tally.Count(isTwice ? Twice : attempt.isStraight ? ChordOnly : Elsewhere, placement);
    }
}

} // namespace

Tally CountCurveCurve(std::uint64_t seed, int cases)
{
    Tally tally("Two curves", {
                                  "pairs",
                                  "pairs that run together along a stretch, not counted below",
                                  "contacts",
                                  "reported",
                                  "missed: at an end of a curve",
                                  "missed: one curve is taken as straight",
                                  "missed: neither curve has a cubic term",
                                  "missed: a straight curve doubles back on itself",
                                  "missed: the curves touch without crossing",
                                  "missed: the root is found, its inversion rejected",
                                  "missed: the root is on a cut",
                                  "missed: otherwise",
                                  "reported once more",
                                  "reported beyond the contacts: crossings with a chord",
                                  "reported beyond the contacts: within 0.1 of both curves",
                              });
    for (const Placement placement : placements) {
        CaseSource source(seed, placement);
        for (int i = 0; i < cases / 2; ++i) {
            source.Next();
            const Cubic first = source.Curve();
            CountPair(first, source.Curve(), placement, tally);
        }
    }
    return tally;
}

} // namespace ZarnMath::Census
