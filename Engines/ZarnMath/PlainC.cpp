// What C and C++ pass to each other by address is laid out alike.
#include "ZarnMath/PlainC.h"

#include <cstddef>
#include <type_traits>

namespace ZarnMath {

namespace {

/// Same size, same alignment, and both as C would lay them out.
template <typename C, typename Cpp>
constexpr bool
    areLaidOutAlike = sizeof(C) == sizeof(Cpp) &&
                      alignof(C) == alignof(Cpp) && std::is_standard_layout_v<Cpp>&& std::is_trivially_copyable_v<Cpp>;

static_assert(areLaidOutAlike<PlainC::POINT, POINT>);
static_assert(std::is_same_v<decltype(PlainC::POINT::x), decltype(POINT::x)>);
static_assert(offsetof(PlainC::POINT, x) == offsetof(POINT, x));
static_assert(offsetof(PlainC::POINT, y) == offsetof(POINT, y));

static_assert(areLaidOutAlike<PlainC::MATRIX, MATRIX>);
static_assert(sizeof(MATRIX) == 6 * sizeof(double));
static_assert(std::is_same_v<decltype(PlainC::MATRIX::m11), decltype(MATRIX::m11)>);
static_assert(offsetof(PlainC::MATRIX, m11) == offsetof(MATRIX, m11));
static_assert(offsetof(PlainC::MATRIX, m12) == offsetof(MATRIX, m12));
static_assert(offsetof(PlainC::MATRIX, dx) == offsetof(MATRIX, dx));
static_assert(offsetof(PlainC::MATRIX, m21) == offsetof(MATRIX, m21));
static_assert(offsetof(PlainC::MATRIX, m22) == offsetof(MATRIX, m22));
static_assert(offsetof(PlainC::MATRIX, dy) == offsetof(MATRIX, dy));

static_assert(areLaidOutAlike<PlainC::POINT3D, POINT3D>);
static_assert(sizeof(POINT3D) == 3 * sizeof(std::int32_t));
static_assert(std::is_same_v<decltype(PlainC::POINT3D::x), decltype(POINT3D::x)>);
static_assert(offsetof(PlainC::POINT3D, y) == offsetof(POINT3D, y));
static_assert(offsetof(PlainC::POINT3D, z) == offsetof(POINT3D, z));

static_assert(areLaidOutAlike<PlainC::MATRIX3D, MATRIX3D>);
static_assert(std::is_same_v<decltype(PlainC::MATRIX3D::m), decltype(MATRIX3D::m)>);

static_assert(areLaidOutAlike<PlainC::Quaternion, Quaternion>);
static_assert(std::is_same_v<decltype(PlainC::Quaternion::x), decltype(Quaternion::x)>);
static_assert(offsetof(PlainC::Quaternion, y) == offsetof(Quaternion, y));
static_assert(offsetof(PlainC::Quaternion, z) == offsetof(Quaternion, z));
static_assert(offsetof(PlainC::Quaternion, w) == offsetof(Quaternion, w));

} // namespace

} // namespace ZarnMath
