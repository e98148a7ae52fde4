/* The plain-C families from C, through the shared library. */
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

static void TestSpace(void)
{
    MATRIX3D m;
    POINT3D points[3] = {{1, 2, 3}, {-4, 5, -6}, {7, 7, 7}};
    const POINT3D viewpoint = {0, 0, 100};
    const POINT3D halfway = {10, -4, 50};
    POINT images[2] = {{7, 7}, {7, 7}};
    MTHGet3DIdentityMatrix(&m);
    MTHTranslate3DMatrix(&m, 10, 20, 30);
    Expect(m.m[0][0] == 65536 && m.m[0][1] == 0 && m.m[1][3] == 20 && m.m[2][2] == 65536, "rows of a matrix in space");
    MTHTransform3DPoints(points, &m, 2);
    Expect(points[0].x == 11 && points[0].y == 22 && points[0].z == 33, "the first point in space");
    Expect(points[1].x == 6 && points[1].y == 25 && points[1].z == 24, "the second point in space");
    Expect(points[2].x == 7, "the point in space behind the last one");
    Expect(MTHPerspective3DProjection(&halfway, images, 1, &viewpoint) == 1, "the result of the projection");
    Expect(images[0].x == 20 && images[0].y == -8 && images[1].x == 7, "a projection");
}

static void TestQuaternions(void)
{
    const Quaternion halfTurn = {1.0, 0.0, 0.0, 0.0};
    Quaternion back = {7.0, 7.0, 7.0, 7.0};
    MATRIX3D m;
    VECT_QuaternionToMat(&halfTurn, &m);
    Expect(m.m[0][0] == 65536 && m.m[1][1] == -65536 && m.m[2][2] == -65536 && m.m[0][3] == 0, "half a turn about x");
    VECT_MatToQuaternion(&m, &back);
    Expect(back.x == 1.0 && back.y == 0.0 && back.z == 0.0 && back.w == 0.0, "its quaternion");
}

int main(void)
{
    Expect(sizeof(MATRIX) == 48 && sizeof(POINT) == 8, "the sizes");
    Expect(sizeof(MATRIX3D) == 48 && sizeof(POINT3D) == 12 && sizeof(Quaternion) == 32, "the sizes in space");
    TestSteps();
    TestPoints();
    TestSpace();
    TestQuaternions();
    return failures == 0 ? 0 : 1;
}
