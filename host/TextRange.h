// The addresses that the process reserves for the cells of texts, and what its threads hand to each other there.
#pragma once

#include <atomic>
#include <cstddef>
#include <cstdint>

#include "host/ZORText.h"

namespace zor {

// The memory of a text that has been deleted.
struct Cell {
  Cell* next;
  Cell* nextList;     // of the first cell of a list that is handed on
  std::size_t count;  // of the cells in such a list
};
static_assert(sizeof(Cell) <= sizeof(ZORString));

// Cells side by side, behind what tells of them, from an address that is a multiple of the size. The thread that owns
// a chunk takes cells from it. Those that it frees come back here; those that others free are theirs.
struct Chunk {
  static constexpr std::size_t kSize = 65536;  // bytes

  static Chunk& Of(void* cell) {
    auto* const byte = static_cast<std::byte*>(cell);
    return *reinterpret_cast<Chunk*>(byte - reinterpret_cast<std::uintptr_t>(byte) % kSize);
  }
  bool HasCells() const { return first != nullptr || fresh != end; }
  void Empty();

  Cell* first = nullptr;                       // freed ones, which are taken first
  std::byte *fresh = nullptr, *end = nullptr;  // then those in between, in their order
  std::size_t used = 0;                        // cells
  Chunk *next = nullptr, *previous = nullptr;  // in a list of its owner or of those that are handed on
  std::atomic<std::uint64_t> owner{0};         // the number of a thread
};

// One of a process.
class TextRange {
 public:
  static bool Has(const void* memory) {
    return reinterpret_cast<std::uintptr_t>(memory) - sBegin.load(std::memory_order_relaxed) < kSize;
  }
  static bool IsThere();  // not where the process may have only so many addresses
  static void HandOn(Cell* list, std::size_t count);
  static void HandOn(Chunk& chunk);
  static Cell* TakeList();            // null when there is none
  static Chunk* TakeChunk();          // one that was handed on or a new one, null when there is none
  static void Release(Chunk& chunk);  // gives the memory of an empty one back, but not its addresses

 private:
  static constexpr std::size_t kSize = (SIZE_MAX >> 32) + 1;  // 4 GB of addresses, not of memory

  static void Reserve();

  static inline std::atomic<std::uintptr_t> sBegin{~(UINTPTR_MAX >> 1)};  // at first where no object is
};

}  // namespace zor
