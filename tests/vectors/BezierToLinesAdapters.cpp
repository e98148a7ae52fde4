#include "tests/vectors/Table.h"

namespace ZarnMath::Vectors {

void AddBezierToLinesAdapters(Table&) {}

} // namespace ZarnMath::Vectors
