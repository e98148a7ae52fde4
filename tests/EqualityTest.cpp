#include "ZarnMath/Quaternion.h"
#include "ZarnMath/ValueTypes.h"
#include "ZarnMath/WMath.h"
#include "ZarnMath/WMath3D.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <cstring>

namespace ZarnMath {
namespace {

/// A type that consists of equal scalars, and these.
template <typename T, typename S>
struct MadeOf
{
    using Type = T;
    using Scalar = S;
};

template <typename Case>
class Equality : public testing::Test
{};

using Cases = testing::Types<MadeOf<POINT, std::int32_t>, MadeOf<SIZE, std::int32_t>, MadeOf<RECT, std::int32_t>,
                             MadeOf<point2d, double>, MadeOf<vector2d, double>, MadeOf<vector3dT<double>, double>,
                             MadeOf<BoundsT<double>, double>, MadeOf<CubicBezier::bezier2dT<point2d>, double>,
                             MadeOf<MATRIX, double>, MadeOf<AFF_TRANSFORM, double>, MadeOf<Quaternion, double>,
                             MadeOf<POINT3D, std::int32_t>, MadeOf<MATRIX3D, std::int32_t>>;
TYPED_TEST_SUITE(Equality, Cases);

TYPED_TEST(Equality, CountsEveryField)
{
    using Type = typename TypeParam::Type;
    using Scalar = typename TypeParam::Scalar;
    std::array<Scalar, sizeof(Type) / sizeof(Scalar)> fields{};
    const auto made = [&fields] {
        Type value;
        std::memcpy(&value, fields.data(), sizeof value);
        return value;
    };
    const Type zero = made();
    EXPECT_TRUE(zero == zero);
    for (Scalar& field : fields) {
        field = 1;
        EXPECT_FALSE(made() == zero) << &field - fields.data();
        EXPECT_TRUE(made() != zero) << &field - fields.data();
        field = 0;
    }
}

} // namespace
} // namespace ZarnMath
