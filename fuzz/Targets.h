/// @file
/// The fuzz targets, one for each family of functions.
#pragma once

#include "fuzz/Input.h"

namespace ZarnMath::Fuzzing {

void FuzzBatches(Input& input);
void FuzzBounds(Input& input);
void FuzzClosestPoint(Input& input);
void FuzzCurvature(Input& input);
void FuzzCutting(Input& input);
void FuzzExtents(Input& input);
void FuzzFits(Input& input);
void FuzzFlattening(Input& input);
void FuzzIntersection(Input& input);
void FuzzMatrices(Input& input);
void FuzzOffsets(Input& input);
void FuzzRootFinder(Input& input);
void FuzzSelfIntersection(Input& input);
void FuzzSpace(Input& input);
void FuzzToolkit(Input& input);
void FuzzTridiagonal(Input& input);
void FuzzVectorField(Input& input);

/// A target and the folder of its corpus.
struct Target
{
    const char* name;
    void (*run)(Input& input);
};

inline constexpr Target targets[] = {
    {"Batches", FuzzBatches},
    {"Bounds", FuzzBounds},
    {"ClosestPoint", FuzzClosestPoint},
    {"Curvature", FuzzCurvature},
    {"Cutting", FuzzCutting},
    {"Extents", FuzzExtents},
    {"Fits", FuzzFits},
    {"Flattening", FuzzFlattening},
    {"Intersection", FuzzIntersection},
    {"Matrices", FuzzMatrices},
    {"Offsets", FuzzOffsets},
    {"RootFinder", FuzzRootFinder},
    {"SelfIntersection", FuzzSelfIntersection},
    {"Space", FuzzSpace},
    {"Toolkit", FuzzToolkit},
    {"Tridiagonal", FuzzTridiagonal},
    {"VectorField", FuzzVectorField},
};

} // namespace ZarnMath::Fuzzing
