/* The plain-C family from C, through the shared library. */
#include "ZarnMath/PlainC.h"

#include <stdio.h>
#include <string.h>

static int failures = 0;

static void Expect(int holds, const char* what)
{
    if (!holds) {
        fprintf(stderr, "failed: %s\n", what);
        ++failures;
    }
}

static int IsMatrix(const MATRIX* m, double m11, double m12, double dx, double m21, double m22, double dy)
{
    return m->m11 == m11 && m->m12 == m12 && m->dx == dx && m->m21 == m21 && m->m22 == m22 && m->dy == dy;
}

static void TestSteps(void)
{
    MATRIX m;
    MATRIX before;
    UTLGetIdentityMatrix(&m);
    Expect(IsMatrix(&m, 1, 0, 0, 0, 1, 0), "the identity");
    UTLTranslateMatrix(&m, 3, -4);
    Expect(IsMatrix(&m, 1, 0, 3, 0, 1, -4), "a translation");
    UTLStretchMatrix(&m, 1, 2, 2.0, 3.0);
    Expect(IsMatrix(&m, 2, 0, 5, 0, 3, -16), "a stretch about (1, 2)");
    UTLRotateMatrixAround(&m, 90000000, 5, 0);
    Expect(IsMatrix(&m, 0, -3, 21, 2, 0, 0), "an exact quarter turn about (5, 0)");
    before = m;
    UTLRotateMatrix(&m, -360000000);
    Expect(memcmp(&m, &before, sizeof m) == 0, "a full turn");
    UTLGetIdentityMatrix(&m);
    UTLRotateMatrix(&m, 90000000);
    Expect(m.m11 > 2.63e-14 && m.m11 < 2.69e-14, "a quarter turn by the short constant");
    UTLGetIdentityMatrix(&m);
    UTLSkewMatrix(&m, 45000000, 0, 0, 0);
    Expect(m.m12 < -0.999999 && m.m12 > -1.000001 && m.m21 == 0, "a shear of x");
}

static void TestPoints(void)
{
    const MATRIX m = {1.0, 0.0, 0.5, 0.0, 1.0, 0.5};
    POINT points[3] = {{2, -3}, {0, 0}, {7, 7}};
    UTLTransformPoint(points, &m, 2);
    Expect(points[0].x == 3 && points[0].y == -3, "halves are rounded away from 0");
    Expect(points[1].x == 1 && points[1].y == 1, "the second point");
    Expect(points[2].x == 7 && points[2].y == 7, "the point behind the last one");
    UTLTransformPoint(points, &m, -1);
    Expect(points[0].x == 3, "a negative count");
}

int main(void)
{
    Expect(sizeof(MATRIX) == 48 && sizeof(POINT) == 8, "the sizes");
    TestSteps();
    TestPoints();
    return failures == 0 ? 0 : 1;
}
