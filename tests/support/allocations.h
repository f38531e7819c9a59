// Counts what is allocated and freed, by texts and by operator new alike. For one source file of a program. Where the
// address sanitizer has a malloc of its own, nothing is counted. Hidden from the libraries, which the build makes the
// default, it would see nothing of theirs.
#pragma once

#include <cstdlib>

#include "host/ZORText.h"

#if defined(__SANITIZE_ADDRESS__)
#define ZOR_HAS_OWN_MALLOC
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define ZOR_HAS_OWN_MALLOC
#endif
#endif

namespace zor::test {
inline int sAllocations = 0, sFreed = 0;
inline const bool sKeepsFreed = ZORString::KeepFreed(false);  // or texts would not be seen
}  // namespace zor::test

#ifndef ZOR_HAS_OWN_MALLOC
extern "C" {
void* __libc_malloc(std::size_t size);
void __libc_free(void* memory);
[[gnu::visibility("default")]] void* malloc(std::size_t size) {
  ++zor::test::sAllocations;
  return __libc_malloc(size);
}
[[gnu::visibility("default")]] void free(void* memory) {
  if (memory != nullptr) ++zor::test::sFreed;
  __libc_free(memory);
}
}
#endif
