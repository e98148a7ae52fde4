#include "tests/catalogue/Catalogue.h"

namespace ZarnMath::Catalogue {

void Family::Append(std::string name, std::unique_ptr<const Call> call)
{
    list.push_back({std::move(name), family, numberClass, std::move(call)});
}

std::vector<Function> ListFunctions()
{
    std::vector<Function> list;
    for (const auto add : {AddBezier, AddBezierSearches, AddBezierOffset, AddBezierToLines, AddBounds, AddCircle,
                           AddFitBezier, AddFitLine, AddLayout, AddLine, AddNumeric, AddQuaternion, AddRandom,
                           AddTridiagonalMatrix, AddVectorField, AddWMath, AddWMathAngles, AddWMath3D})
        add(list);
    return list;
}

} // namespace ZarnMath::Catalogue
