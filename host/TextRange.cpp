#include "host/TextRange.h"

#include <pthread.h>
#include <sys/mman.h>
#include <sys/resource.h>

#include <mutex>
#include <new>
#include <utility>

namespace zor {

namespace {

constinit std::mutex sMutex;  // for what follows
bool sWasTried = false;       // to reserve it
std::byte* sNext = nullptr;   // chunk
std::size_t sLeft = 0;        // chunks
Cell* sLists = nullptr;
Chunk* sChunks = nullptr;

void Lock() { sMutex.lock(); }
void Unlock() { sMutex.unlock(); }

}  // namespace

void Chunk::Empty() {
  first = nullptr;
  fresh = reinterpret_cast<std::byte*>(this + 1);
  end = fresh + (kSize - sizeof(Chunk)) / sizeof(ZORString) * sizeof(ZORString);
}

bool TextRange::IsThere() {
  const std::lock_guard lock(sMutex);
  if (!std::exchange(sWasTried, true)) Reserve();
  return sNext != nullptr;
}

void TextRange::HandOn(Cell* list, std::size_t count) {
  const std::lock_guard lock(sMutex);
  list->count = count;
  list->nextList = std::exchange(sLists, list);
}

void TextRange::HandOn(Chunk& chunk) {
  const std::lock_guard lock(sMutex);
  chunk.next = std::exchange(sChunks, &chunk);
}

Cell* TextRange::TakeList() {
  const std::lock_guard lock(sMutex);
  return sLists == nullptr ? nullptr : std::exchange(sLists, sLists->nextList);
}

// Addresses become memory chunk by chunk.
Chunk* TextRange::TakeChunk() {
  if (!IsThere()) return nullptr;
  const std::lock_guard lock(sMutex);
  if (sChunks != nullptr) return std::exchange(sChunks, sChunks->next);
  if (sLeft == 0 || mprotect(sNext, Chunk::kSize, PROT_READ | PROT_WRITE) != 0) return nullptr;
  auto* const chunk = new (sNext) Chunk;
  sNext += Chunk::kSize;
  --sLeft;
  chunk->Empty();
  return chunk;
}

// Where addresses are limited, others need them more. A process may fork at any time, and the child takes chunks, too.
void TextRange::Reserve() {
  rlimit limit;
  if (getrlimit(RLIMIT_AS, &limit) != 0 || limit.rlim_cur != RLIM_INFINITY) return;
  constexpr int kFlags = MAP_PRIVATE | MAP_ANONYMOUS | MAP_NORESERVE;
  void* const range = mmap(nullptr, kSize + Chunk::kSize, PROT_NONE, kFlags, -1, 0);
  if (range == MAP_FAILED || pthread_atfork(Lock, Unlock, Unlock) != 0) return;
  std::byte* const last = static_cast<std::byte*>(range) + Chunk::kSize - 1;
  sNext = last - reinterpret_cast<std::uintptr_t>(last) % Chunk::kSize;
  sLeft = kSize / Chunk::kSize;
  sBegin = reinterpret_cast<std::uintptr_t>(sNext);
}

// All but the page with what tells of it.
void TextRange::Release(Chunk& chunk) {
  constexpr std::size_t kPage = 4096;
  static_cast<void>(madvise(reinterpret_cast<std::byte*>(&chunk) + kPage, Chunk::kSize - kPage, MADV_DONTNEED));
}

}  // namespace zor
