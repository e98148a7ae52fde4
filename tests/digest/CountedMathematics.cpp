#include "tests/digest/CountedMathematics.h"

namespace {

std::uint64_t calls = 0;

} // namespace

// A call of f is linked to __wrap_f, and __real_f is f: these names are the linker's. Each function needs two names that
// are made of its own, which only a macro can make. The list stands in CMakeLists.txt too.
#define ZARNMATH_COUNT_UNARY(function, type)                                                                           \
    type __real_##function(type);                                                                                      \
    type __wrap_##function(type x)                                                                                     \
    {                                                                                                                  \
        ++calls;                                                                                                       \
        return __real_##function(x);                                                                                   \
    }

#define ZARNMATH_COUNT_BINARY(function, type)                                                                          \
    type __real_##function(type, type);                                                                                \
    type __wrap_##function(type x, type y)                                                                             \
    {                                                                                                                  \
        ++calls;                                                                                                       \
        return __real_##function(x, y);                                                                                \
    }

#define ZARNMATH_COUNT_PAIR(function, type)                                                                            \
    void __real_##function(type, type*, type*);                                                                        \
    void __wrap_##function(type x, type* sine, type* cosine)                                                           \
    {                                                                                                                  \
        ++calls;                                                                                                       \
        __real_##function(x, sine, cosine);                                                                            \
    }

extern "C" {
ZARNMATH_COUNT_UNARY(sin, double)
ZARNMATH_COUNT_UNARY(sinf, float)
ZARNMATH_COUNT_UNARY(cos, double)
ZARNMATH_COUNT_UNARY(cosf, float)
ZARNMATH_COUNT_UNARY(tan, double)
ZARNMATH_COUNT_UNARY(tanf, float)
ZARNMATH_COUNT_UNARY(asin, double)
ZARNMATH_COUNT_UNARY(asinf, float)
ZARNMATH_COUNT_UNARY(acos, double)
ZARNMATH_COUNT_UNARY(acosf, float)
ZARNMATH_COUNT_UNARY(atan, double)
ZARNMATH_COUNT_UNARY(atanf, float)
ZARNMATH_COUNT_UNARY(sinh, double)
ZARNMATH_COUNT_UNARY(sinhf, float)
ZARNMATH_COUNT_UNARY(cosh, double)
ZARNMATH_COUNT_UNARY(coshf, float)
ZARNMATH_COUNT_UNARY(tanh, double)
ZARNMATH_COUNT_UNARY(tanhf, float)
ZARNMATH_COUNT_UNARY(asinh, double)
ZARNMATH_COUNT_UNARY(asinhf, float)
ZARNMATH_COUNT_UNARY(acosh, double)
ZARNMATH_COUNT_UNARY(acoshf, float)
ZARNMATH_COUNT_UNARY(atanh, double)
ZARNMATH_COUNT_UNARY(atanhf, float)
ZARNMATH_COUNT_UNARY(exp, double)
ZARNMATH_COUNT_UNARY(expf, float)
ZARNMATH_COUNT_UNARY(exp2, double)
ZARNMATH_COUNT_UNARY(exp2f, float)
ZARNMATH_COUNT_UNARY(expm1, double)
ZARNMATH_COUNT_UNARY(expm1f, float)
ZARNMATH_COUNT_UNARY(log, double)
ZARNMATH_COUNT_UNARY(logf, float)
ZARNMATH_COUNT_UNARY(log2, double)
ZARNMATH_COUNT_UNARY(log2f, float)
ZARNMATH_COUNT_UNARY(log10, double)
ZARNMATH_COUNT_UNARY(log10f, float)
ZARNMATH_COUNT_UNARY(log1p, double)
ZARNMATH_COUNT_UNARY(log1pf, float)
ZARNMATH_COUNT_UNARY(cbrt, double)
ZARNMATH_COUNT_UNARY(cbrtf, float)
ZARNMATH_COUNT_UNARY(erf, double)
ZARNMATH_COUNT_UNARY(erff, float)
ZARNMATH_COUNT_UNARY(erfc, double)
ZARNMATH_COUNT_UNARY(erfcf, float)
ZARNMATH_COUNT_UNARY(tgamma, double)
ZARNMATH_COUNT_UNARY(tgammaf, float)
ZARNMATH_COUNT_UNARY(lgamma, double)
ZARNMATH_COUNT_UNARY(lgammaf, float)
ZARNMATH_COUNT_BINARY(atan2, double)
ZARNMATH_COUNT_BINARY(atan2f, float)
ZARNMATH_COUNT_BINARY(pow, double)
ZARNMATH_COUNT_BINARY(powf, float)
ZARNMATH_COUNT_BINARY(hypot, double)
ZARNMATH_COUNT_BINARY(hypotf, float)
ZARNMATH_COUNT_PAIR(sincos, double)
ZARNMATH_COUNT_PAIR(sincosf, float)
}

namespace ZarnMath::Digest {

std::uint64_t CallsOfMathematics() noexcept
{
    return calls;
}

} // namespace ZarnMath::Digest
