/// @file
/// The mark of what the shared library shows to the outside.
#pragma once

#if __cplusplus < 202002L
#error "The headers of ZarnMath are C++20: compile with -std=c++20 or a later version."
#endif

/// Everything else is compiled with hidden visibility. An attribute cannot be spelled by anything but a macro.
#if defined(__GNUC__)
#define ZARNMATH_API __attribute__((visibility("default")))
#else
#define ZARNMATH_API
#endif
