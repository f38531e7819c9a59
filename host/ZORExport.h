// Marks what a library exports; everything else is hidden.
#pragma once

#if __cplusplus <= 201703L
#error "ZORVadStrings needs C++20"
#endif

#define ZOR_EXPORT __attribute__((visibility("default")))
