// Loaded before the C library: refuses the allocation whose number is in REFUSED, counted from 1, and tells in the file
// descriptor 9 whether it came to that.
#include <unistd.h>

#include <atomic>
#include <cstddef>
#include <cstdlib>

extern "C" {
void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);
void* __libc_realloc(void* memory, std::size_t size);

static bool IsRefused() {
  static std::atomic<long> left = [] {
    const char* const number = std::getenv("REFUSED");
    return number != nullptr ? std::atol(number) : 0;
  }();
  if (--left != 0) return false;
  return write(9, "refused\n", 8) != 0;
}
void* malloc(std::size_t size) { return IsRefused() ? nullptr : __libc_malloc(size); }
void* calloc(std::size_t count, std::size_t size) { return IsRefused() ? nullptr : __libc_calloc(count, size); }
void* realloc(void* memory, std::size_t size) { return IsRefused() ? nullptr : __libc_realloc(memory, size); }
}
