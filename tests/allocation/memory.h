// The memory of a test program: any allocation that asks for an answer can be refused, and what is deleted is told. For
// one source file of a program.
#pragma once

#include <atomic>
#include <cstddef>
#include <cstdlib>
#include <new>
#include <vector>

#include "host/ZORText.h"

namespace zor::test {

constexpr int kNone = -1;
constexpr std::size_t kTooMuch = std::size_t{1} << 30;        // no test may ask the machine for that
inline const bool sKeepsFreed = ZORString::KeepFreed(false);  // or texts would not be seen
inline int sRefused = kNone;                                  // how many can be had before one is refused
inline bool sWasRefused = false;
inline std::atomic<std::ptrdiff_t> sLive = 0;
inline std::vector<void*>* sDeletions = nullptr;  // of single objects, while set and as many as it has places for

template <class Run>
auto RunRefused(int number, Run run) {
  struct Refusal {
    ~Refusal() { sRefused = kNone; }
  } const refusal;
  sRefused = number;
  sWasRefused = false;
  return run();
}

inline void* Allocate(std::size_t size) {
  void* const memory = std::malloc(size);
  if (memory == nullptr) std::abort();
  ++sLive;
  return memory;
}

// Only what asks for an answer is refused; the rest could not tell.
inline void* AllocateOrRefuse(std::size_t size) {
  const bool refused = size >= kTooMuch || (sRefused != kNone && sRefused-- == 0);
  sWasRefused |= refused;
  return refused ? nullptr : Allocate(size);
}

inline void Free(void* memory) {
  if (memory != nullptr) --sLive;
  std::free(memory);
}

inline void Delete(void* memory) {
  if (sDeletions != nullptr && memory != nullptr && sDeletions->size() < sDeletions->capacity())
    sDeletions->push_back(memory);
  Free(memory);
}

}  // namespace zor::test

// clang-format off
void* operator new(std::size_t size) { return zor::test::Allocate(size); }
void* operator new[](std::size_t size) { return zor::test::Allocate(size); }
void* operator new(std::size_t size, const std::nothrow_t&) noexcept { return zor::test::AllocateOrRefuse(size); }
void* operator new[](std::size_t size, const std::nothrow_t&) noexcept { return zor::test::AllocateOrRefuse(size); }
void operator delete(void* memory) noexcept { zor::test::Delete(memory); }
void operator delete[](void* memory) noexcept { zor::test::Free(memory); }
void operator delete(void* memory, std::size_t) noexcept { zor::test::Delete(memory); }
void operator delete[](void* memory, std::size_t) noexcept { zor::test::Free(memory); }
// clang-format on
