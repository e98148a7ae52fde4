/*
 * The plain-C functions of the library, for a C compiler.
 *
 * In C this header declares the structures and the functions. In C++ the functions are declared with the library's own
 * types, in ZarnMath/WMath.h and ZarnMath/WMath3D.h, and the structures here stand in a namespace of their own: they
 * serve to check that both languages lay them out alike.
 */
#ifndef ZARNMATH_PLAIN_C_H
#define ZARNMATH_PLAIN_C_H

#include <stdint.h>

#ifdef __cplusplus
#include "ZarnMath/WMath.h"
#include "ZarnMath/WMath3D.h"

namespace ZarnMath::PlainC {
#endif

/* A position in whole drawing units. */
typedef struct POINT
{
    int32_t x;
    int32_t y;
} POINT;

/*
 * An affine transform of the plane, applied to column vectors:
 *
 *     x' = dx + (m11*x + m12*y)
 *     y' = dy + (m21*x + m22*y)
 */
typedef struct MATRIX
{
    double m11; /* x output per x input */
    double m12; /* x output per y input */
    double dx;  /* x translation */
    double m21; /* y output per x input */
    double m22; /* y output per y input */
    double dy;  /* y translation */
} MATRIX;

/* A position in space, in whole units. */
typedef struct POINT3D
{
    int32_t x;
    int32_t y;
    int32_t z;
} POINT3D;

/*
 * An affine transform of space, applied to column vectors. Columns 0 to 2 are fixed point, with 65536 for 1; column 3 is
 * the translation, in whole units.
 */
typedef struct MATRIX3D
{
    int32_t m[3][4]; /* m[row][column] */
} MATRIX3D;

/* x i + y j + z k + w. */
typedef struct Quaternion
{
    double x;
    double y;
    double z;
    double w; /* the scalar part */
} Quaternion;

#ifdef __cplusplus
} // namespace ZarnMath::PlainC
#else

/*
 * Steps added after what a matrix does. Angles are in millionths of a degree, counter-clockwise where y grows upward;
 * centres and points are in whole drawing units. No pointer may be null, but for an array of no points.
 */

/* Makes the matrix the identity. */
void UTLGetIdentityMatrix(MATRIX* matrix);

/* Turns about the origin. A multiple of 360000000 changes no bit; quarter turns are not exact. */
void UTLRotateMatrix(MATRIX* matrix, int angle);

/* Turns about (cx, cy). A multiple of 360000000 changes no bit, and quarter turns are exact. */
void UTLRotateMatrixAround(MATRIX* matrix, int angle, int cx, int cy);

/* Adds to the translation. */
void UTLTranslateMatrix(MATRIX* matrix, int x, int y);

/* Scales about (cx, cy). */
void UTLStretchMatrix(MATRIX* matrix, int cx, int cy, double sx, double sy);

/* Shears x by -tan(angleX) per y, then y by tan(angleY) per new x, about (cx, cy). */
void UTLSkewMatrix(MATRIX* matrix, int angleX, int angleY, int cx, int cy);

/* Transforms points in place, each coordinate rounded to the nearest unit, halves away from 0. A count below 1 does
 * nothing. */
void UTLTransformPoint(POINT* points, const MATRIX* matrix, int64_t count);

/*
 * In space. Conversions to integers truncate toward 0, saturate at 32 bits and give 0 for NaN; sums of integers wrap. No
 * pointer may be null, but with a count below 1, which does nothing.
 */

/* Makes the matrix the identity. */
void MTHGet3DIdentityMatrix(MATRIX3D* out);

/* Adds a translation after what the matrix does. */
void MTHTranslate3DMatrix(MATRIX3D* m, int x, int y, int z);

/* Transforms points in place, in single precision; the translation is added in integers. */
void MTHTransform3DPoints(POINT3D* points, const MATRIX3D* m, int count);

/* Projects points from a viewpoint onto the plane z = 0, into another array. Always 1. */
int MTHPerspective3DProjection(const POINT3D* points, POINT* out, int count, const POINT3D* viewpoint);

/* The matrix of a unit quaternion. As MTHTransform3DPoints reads it, it turns by the inverse. */
void VECT_QuaternionToMat(const Quaternion* q, MATRIX3D* out);

/* The unit quaternion of a rotation, the inverse of VECT_QuaternionToMat. */
void VECT_MatToQuaternion(const MATRIX3D* m, Quaternion* out);

#endif

#endif
