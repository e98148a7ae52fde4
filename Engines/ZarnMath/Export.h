/// @file
/// The mark of what the shared library shows to the outside.
#pragma once

/// Everything else is compiled with hidden visibility. An attribute cannot be spelled by anything but a macro.
#if defined(__GNUC__)
#define ZARNMATH_API __attribute__((visibility("default")))
#else
#define ZARNMATH_API
#endif
