// From a generator with a drawn seed, where the caller's would be seeded by the system.
#include "tests/catalogue/Draws.h"

#include "ZarnMath/RandomInternal.h"

#include <algorithm>

namespace ZarnMath::Catalogue {

void AddRandom(std::vector<Function>& list)
{
    Family family(list, "Random");
    family.AddWith<double(double, double)>("Random::Generate", Random::Generate, [](auto call, Source& in, Sink& out) {
        const double low = in.Number();
        const double high = in.Number();
        GetEngine().seed(static_cast<std::uint32_t>(in.Integer()));
        out.Put(call(low, high));
    });
    family.AddWith<int(int, int)>("Random::Generate", Random::Generate, [](auto call, Source& in, Sink& out) {
        const auto [low, high] = std::minmax({in.Integer(), in.Integer()});
        GetEngine().seed(static_cast<std::uint32_t>(in.Integer()));
        out.Put(call(low, high));
    });
}

} // namespace ZarnMath::Catalogue
