#include "tests/vectors/Table.h"

namespace ZarnMath::Vectors {

void AddClosestPointAdapters(Table&) {}

} // namespace ZarnMath::Vectors
