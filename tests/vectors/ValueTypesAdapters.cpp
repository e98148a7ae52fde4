#include "tests/vectors/Table.h"

namespace ZarnMath::Vectors {

void AddValueTypesAdapters(Table&) {}

} // namespace ZarnMath::Vectors
