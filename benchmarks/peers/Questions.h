/// @file
/// The questions, one source each. Each of them prints lines of JSON.
#pragma once

#include "benchmarks/Corpus.h"
#include "benchmarks/peers/Question.h"

namespace ZarnMath::Peers {

void AskForNearest(const Benchmarks::Corpus& corpus);
void AskForRoots();
void AskForCrossings(const Benchmarks::Corpus& corpus);
void AskForCrossingsWithLine(const Benchmarks::Corpus& corpus);
void AskForLength(const Benchmarks::Corpus& corpus);
void AskForBox(const Benchmarks::Corpus& corpus);
void AskForPolyline(const Benchmarks::Corpus& corpus);
void AskForOffset(const Benchmarks::Corpus& corpus);
void AskForFit(const Benchmarks::Corpus& corpus);
void AskForField();
void AskForPointBatches();
void AskForTridiagonalSolve();

} // namespace ZarnMath::Peers
