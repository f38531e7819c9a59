// Marks what a library exports; everything else is hidden. A class is exported with all its members, but for templates
// and classes of its own that are marked as internal.
#pragma once

#if __cplusplus <= 201703L
#error "ZORVadStrings needs C++20"
#endif

#define ZOR_EXPORT __attribute__((visibility("default")))
#define ZOR_INTERNAL __attribute__((visibility("hidden")))
