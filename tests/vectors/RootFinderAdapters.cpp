#include "tests/vectors/Table.h"

namespace ZarnMath::Vectors {

void AddRootFinderAdapters(Table&) {}

} // namespace ZarnMath::Vectors
