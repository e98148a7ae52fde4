#include "ZarnMath/Bezier.h"
#include "ZarnMath/ValueTypesInternal.h"

namespace ZarnMath::CubicBezier {

namespace {

/// The points of de Casteljau's triangle that a cut leaves: the six computed ones without the middle of the first row.
template <typename P>
struct Cut
{
    P q0; ///< first row: P1 of the left piece
    P r0; ///< second row: P2 of the left piece
    P s;  ///< the point of the cut
    P r1; ///< second row: P1 of the right piece
    P q2; ///< first row: P2 of the right piece
};

/// de Casteljau's construction with a step of the caller's.
template <typename P, typename Step>
Cut<P> CutBy(const P* in, Step step) noexcept
{
    const P q0 = step(in[0], in[1]);
    const P q1 = step(in[1], in[2]);
    const P q2 = step(in[2], in[3]);
    const P r0 = step(q0, q1);
    const P r1 = step(q1, q2);
    return {q0, r0, step(r0, r1), r1, q2};
}

Cut<point2d> CutAt(double t, const point2d* in) noexcept
{
    return CutBy(in, [t](const point2d& p, const point2d& q) { return p + (q - p) * t; });
}

point2d Middle(const point2d& p, const point2d& q) noexcept
{
    return {(p.x + q.x) * 0.5, (p.y + q.y) * 0.5};
}

POINT Middle(const POINT& p, const POINT& q) noexcept
{
    return {WrappingAdd(p.x, q.x) / 2, WrappingAdd(p.y, q.y) / 2};
}

template <typename P>
void StoreLeft(const P& start, const Cut<P>& cut, P* out) noexcept
{
    out[0] = start;
    out[1] = cut.q0;
    out[2] = cut.r0;
    out[3] = cut.s;
}

template <typename P>
void StoreRight(const Cut<P>& cut, const P& end, P* out) noexcept
{
    out[0] = cut.s;
    out[1] = cut.r1;
    out[2] = cut.q2;
    out[3] = end;
}

/// `left` may be the input, whose end is therefore stored before it is overwritten.
template <typename P>
void StoreBoth(const P* in, const Cut<P>& cut, P* left, P* right) noexcept
{
    StoreRight(cut, in[3], right);
    StoreLeft(in[0], cut, left);
}

template <typename P>
void SplitInHalf(const P* in, P* left, P* right) noexcept
{
    StoreBoth(in, CutBy(in, [](const P& p, const P& q) { return Middle(p, q); }), left, right);
}

} // namespace

void Split(double t, const point2d* in, point2d* left, point2d* right) noexcept
{
    StoreBoth(in, CutAt(t, in), left, right);
}

void Split(const point2d* in, point2d* left, point2d* right) noexcept
{
    SplitInHalf(in, left, right);
}

void Split(double t, const point2d* in, point2d* out) noexcept
{
    Split(t, in, out, out + 3);
}

void Split(double t0, double t1, const point2d* in, point2d* out) noexcept
{
    LeftOf(t0, in, out);
    Subsection(t0, t1, in, out + 3);
    RightOf(t1, in, out + 6);
}

void LeftOf(double t, const point2d* in, point2d* out) noexcept
{
    StoreLeft(in[0], CutAt(t, in), out);
}

void RightOf(double t, const point2d* in, point2d* out) noexcept
{
    StoreRight(CutAt(t, in), in[3], out);
}

void Subsection(double t0, double t1, const point2d* in, point2d* out) noexcept
{
    if (t0 <= 0.0) {
        LeftOf(t1, in, out);
    } else if (t1 >= 1.0) {
        RightOf(t0, in, out);
    } else {
        point2d left[4];
        LeftOf(t1, in, left);
        RightOf(t0 / t1, left, out);
    }
}

void Split(double t, const POINT* in, POINT* left, POINT* right) noexcept
{
    point2d pieces[7];
    Split(t, ToDoubleCubic(in).points, pieces);
    point2d2ZGIPOINT<4>(left, pieces);
    point2d2ZGIPOINT<4>(right, pieces + 3);
}

void Split(const POINT* in, POINT* left, POINT* right) noexcept
{
    SplitInHalf(in, left, right);
}

void Split(double t, const POINT* in, POINT* out) noexcept
{
    Split(t, in, out, out + 3);
}

void Split(double t0, double t1, const POINT* in, POINT* out) noexcept
{
    point2d pieces[10];
    Split(t0, t1, ToDoubleCubic(in).points, pieces);
    point2d2ZGIPOINT<10>(out, pieces);
}

void LeftOf(double t, const POINT* in, POINT* out) noexcept
{
    point2d piece[4];
    LeftOf(t, ToDoubleCubic(in).points, piece);
    point2d2ZGIPOINT<4>(out, piece);
}

void RightOf(double t, const POINT* in, POINT* out) noexcept
{
    point2d piece[4];
    RightOf(t, ToDoubleCubic(in).points, piece);
    point2d2ZGIPOINT<4>(out, piece);
}

void Subsection(double t0, double t1, const POINT* in, POINT* out) noexcept
{
    point2d piece[4];
    Subsection(t0, t1, ToDoubleCubic(in).points, piece);
    point2d2ZGIPOINT<4>(out, piece);
}

} // namespace ZarnMath::CubicBezier
