// Marks what a library exports; everything else is hidden. A class is exported with all its members, except templates
// and nested classes marked ZOR_INTERNAL.
#pragma once

#if __cplusplus <= 201703L
#error "ZORVadStrings needs C++20"
#endif

#include <version>

#define ZOR_EXPORT __attribute__((visibility("default")))
#define ZOR_INTERNAL __attribute__((visibility("hidden")))

// Public classes have strings and vectors of the standard library as members, and a program must lay these out as the
// libraries do. One that does not fails to link: the libraries lack the function that it refers to, whose name says
// why.
#if defined(_LIBCPP_VERSION)
ZOR_EXPORT void ZorIsNotBuiltForLibcxx();
#define ZOR_STANDARD_LIBRARY ZorIsNotBuiltForLibcxx
#elif defined(_GLIBCXX_DEBUG)
ZOR_EXPORT void ZorIsNotBuiltForDebugModeOfLibstdcxx();
#define ZOR_STANDARD_LIBRARY ZorIsNotBuiltForDebugModeOfLibstdcxx
#else
ZOR_EXPORT void ZorIsBuiltForLibstdcxx();
#define ZOR_STANDARD_LIBRARY ZorIsBuiltForLibstdcxx
#endif
[[gnu::used]] static void (*const kZorStandardLibrary)() = &ZOR_STANDARD_LIBRARY;
