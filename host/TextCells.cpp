// The memory of texts on the heap: what a thread frees serves its next texts, without the allocator. A cell is a block
// of operator new like any other, so it does not matter which thread frees it, or whether the thread keeps cells.
#include <atomic>
#include <cstddef>
#include <new>
#include <utility>

#include "host/ZORText.h"

#ifndef __has_feature
#define __has_feature(feature) 0
#endif

namespace {

// A sanitizer would not see that a freed text is used.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__) || __has_feature(address_sanitizer) || \
    __has_feature(memory_sanitizer) || __has_feature(thread_sanitizer)
constexpr bool kCanKeep = false;
#else
constexpr bool kCanKeep = true;
#endif

constexpr std::size_t kMost = 65536;  // of a thread

struct Cell {
  Cell* next;
};

// Of one thread. Plain data at a fixed distance from the thread's own: no call is needed to reach it.
struct Cells {
  Cell* first;
  std::size_t room;  // for so many more; none before the first is freed, nor when the thread ends
  bool isOpen;
};
[[gnu::tls_model("initial-exec")]] thread_local constinit Cells tCells{nullptr, 0, false};

std::atomic<bool> sKeeps{kCanKeep};

// Gives all cells back; texts that are freed later go to the allocator.
void Close() {
  tCells.room = 0;
  while (tCells.first != nullptr) ::operator delete(std::exchange(tCells.first, tCells.first->next));
}

void Open() {
  struct Closing {
    ~Closing() { Close(); }
  };
  static thread_local const Closing kClosing;
  tCells.isOpen = true;
  tCells.room = sKeeps.load(std::memory_order_relaxed) ? kMost : 0;
}

// What is freed while there is no room.
void Free(void* memory) {
  if (!tCells.isOpen) Open();
  ::operator delete(memory);
}

}  // namespace

void* ZORString::operator new(std::size_t size) {
  Cell* const cell = tCells.first;
  if (cell == nullptr || size != sizeof(ZORString)) return Allocate(size);
  tCells.first = cell->next;
  ++tCells.room;
  return cell;
}

void ZORString::operator delete(void* memory, std::size_t size) noexcept {
  if (tCells.room == 0 || memory == nullptr || size != sizeof(ZORString)) return Free(memory);
  tCells.first = new (memory) Cell{tCells.first};
  --tCells.room;
}

bool ZORString::KeepFreed(bool keep) {
  sKeeps = keep && kCanKeep;
  Close();
  Open();
  return sKeeps;
}
