// Asks every question of every library that is linked here, and prints a line of JSON for each answer's time and error.
//
//   zarnmath_peers [--corpus FOLDER]
//
// With a folder, the corpus is written there instead, for the programs in other languages.

#include "benchmarks/peers/CorpusFiles.h"
#include "benchmarks/peers/Questions.h"

#include <cstring>
#include <iostream>

int main(int argc, char** argv)
{
    using namespace ZarnMath;
    using namespace ZarnMath::Peers;
    const Benchmarks::Corpus& corpus = Benchmarks::SharedCorpus();
    if (argc == 3 && std::strcmp(argv[1], "--corpus") == 0) {
        WriteCorpus(corpus, argv[2]);
        return 0;
    }
    if (argc != 1) {
        std::cerr << "usage: " << argv[0] << " [--corpus FOLDER]\n";
        return 2;
    }
    AskForNearest(corpus);
    AskForRoots();
    AskForCrossings(corpus);
    AskForCrossingsWithLine(corpus);
    AskForLength(corpus);
    AskForBox(corpus);
    AskForPolyline(corpus);
    AskForOffset(corpus);
    AskForFit(corpus);
    AskForField();
    AskForPointBatches();
    AskForTridiagonalSolve();
}
