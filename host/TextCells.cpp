// The memory of texts on the heap. A thread carves cells from chunks of its own, one after another, and what it frees
// goes back to its chunk, so that texts that are made together lie together. Cells of other threads' chunks serve the
// thread that freed them, too. What a thread has too many of, or leaves when it ends, serves others. Where no cells are
// to be had, texts are blocks of operator new.
#include <pthread.h>

#include <atomic>
#include <new>
#include <span>
#include <utility>

#include "host/TextRange.h"

#ifndef __has_feature
#define __has_feature(feature) 0
#endif

namespace {

using zor::Cell;
using zor::Chunk;
using zor::TextRange;

// A sanitizer would not see that a freed text is used.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__) || __has_feature(address_sanitizer) || \
    __has_feature(memory_sanitizer) || __has_feature(thread_sanitizer)
constexpr bool kCanKeep = false;
#else
constexpr bool kCanKeep = true;
#endif

constexpr std::size_t kMostForeign = 65536;  // cells of others' chunks that a thread keeps
constexpr std::size_t kMostEmpty = 128;      // chunks

std::atomic<bool> sKeeps{kCanKeep};
std::atomic<std::uint64_t> sThreads{0};
constinit Chunk sNone;  // has no cells

void Push(void* memory, Cell*& first) {
  Cell* const cell = new (memory) Cell;
  cell->next = std::exchange(first, cell);
}

Cell* Pop(Cell*& first) { return std::exchange(first, first->next); }

// Of one thread. Plain data at a fixed distance from the thread's own: no call is needed to reach it.
class Cells {
 public:
  void* Take();  // null when there is none
  void Free(void* memory);
  void Keep(bool keeps);  // whether it takes cells
  void Close();

 private:
  void Open();
  void* TakeElsewhere();
  bool FindChunk();
  void FreeForeign(void* memory);
  void Spare(Chunk& chunk);
  void List(Chunk& chunk);
  void Unlist(Chunk& chunk);

  Chunk* mCurrent = &sNone;
  Chunk* mListed = nullptr;   // other own ones that have cells
  std::size_t mEmpty = 0;     // of the listed ones
  Cell* mForeign = nullptr;   // freed cells of others' chunks
  std::size_t mRoom = 0;      // for so many more of them
  std::uint64_t mNumber = 0;  // while the thread is open
  bool mWasOpened = false, mKeeps = false;
};
[[gnu::tls_model("initial-exec")]] thread_local constinit Cells tCells;

inline void* Cells::Take() {
  Chunk& chunk = *mCurrent;
  if (!chunk.HasCells()) return TakeElsewhere();
  ++chunk.used;
  if (chunk.first != nullptr) return Pop(chunk.first);
  return std::exchange(chunk.fresh, chunk.fresh + sizeof(ZORString));
}

inline void Cells::Free(void* memory) {
  Chunk& chunk = Chunk::Of(memory);
  if (chunk.owner.load(std::memory_order_relaxed) != mNumber) return FreeForeign(memory);
  if (!chunk.HasCells() && &chunk != mCurrent) List(chunk);
  Push(memory, chunk.first);
  if (--chunk.used == 0) Spare(chunk);
}

[[gnu::noinline]] void* Cells::TakeElsewhere() {
  Open();
  if (!mKeeps) return nullptr;
  if (mListed == nullptr && mForeign == nullptr && (mForeign = TextRange::TakeList()) != nullptr)
    mRoom = kMostForeign - mForeign->count;
  if (mListed == nullptr && mForeign != nullptr) return ++mRoom, Pop(mForeign);
  return FindChunk() ? Take() : nullptr;
}

bool Cells::FindChunk() {
  Chunk* const chunk = mListed != nullptr ? mListed : TextRange::TakeChunk();
  if (chunk == nullptr) return false;
  if (chunk == mListed) Unlist(*chunk);
  chunk->owner = mNumber;
  mCurrent = chunk;
  return true;
}

// A full list goes to others; so does a single cell when the thread has ended.
[[gnu::noinline]] void Cells::FreeForeign(void* memory) {
  Open();
  if (mRoom == 0 && mForeign != nullptr) {
    TextRange::HandOn(std::exchange(mForeign, nullptr), kMostForeign);
    mRoom = kMostForeign;
  }
  Push(memory, mForeign);
  mRoom == 0 ? TextRange::HandOn(std::exchange(mForeign, nullptr), 1) : static_cast<void>(--mRoom);
}

// The cells of an empty chunk are taken in their order again. Of many such chunks most give their memory back.
[[gnu::noinline]] void Cells::Spare(Chunk& chunk) {
  chunk.Empty();
  if (&chunk == mCurrent) return;
  if (mEmpty++ < kMostEmpty) return;
  Unlist(chunk);
  TextRange::Release(chunk);
  TextRange::HandOn(chunk);
}

void Cells::List(Chunk& chunk) {
  chunk.previous = nullptr;
  chunk.next = std::exchange(mListed, &chunk);
  if (chunk.next != nullptr) chunk.next->previous = &chunk;
  if (chunk.used == 0) ++mEmpty;
}

void Cells::Unlist(Chunk& chunk) {
  (chunk.previous != nullptr ? chunk.previous->next : mListed) = chunk.next;
  if (chunk.next != nullptr) chunk.next->previous = chunk.previous;
  if (chunk.used == 0) --mEmpty;
}

// A thread whose end would not be told gets no cells. A thread_local object would end the process instead, where there
// is no memory to register its destructor.
void Cells::Open() {
  static pthread_key_t key;
  static const bool kHasKey = pthread_key_create(&key, [](void* cells) { static_cast<Cells*>(cells)->Close(); }) == 0;
  if (std::exchange(mWasOpened, true) || !kHasKey || pthread_setspecific(key, this) != 0) return;
  mNumber = ++sThreads;
  mRoom = kMostForeign;
  mKeeps = sKeeps;
}

void Cells::Keep(bool keeps) {
  Open();
  mKeeps = keeps;
  if (mCurrent->HasCells()) List(*mCurrent);
  mCurrent = &sNone;
}

// All cells go to others.
void Cells::Close() {
  Keep(false);
  if (mForeign != nullptr) TextRange::HandOn(std::exchange(mForeign, nullptr), kMostForeign - mRoom);
  while (mListed != nullptr) TextRange::HandOn(*std::exchange(mListed, mListed->next));
  mEmpty = mRoom = mNumber = 0;
}

}  // namespace

void* ZORString::operator new(std::size_t size) {
  void* const cell = size == sizeof(ZORString) ? tCells.Take() : nullptr;
  return cell != nullptr ? cell : Allocate(size);
}

void ZORString::operator delete(void* memory, std::size_t) noexcept {
  TextRange::Has(memory) ? tCells.Free(memory) : ::operator delete(memory);
}

void ZORString::DeleteAll(ZORString* const* texts, std::size_t count) noexcept {
  for (ZORString* const text : std::span(texts, count)) {
    if (text == nullptr) continue;
    text->Release();
    TextRange::Has(text) ? tCells.Free(text) : ::operator delete(text);
  }
}

bool ZORString::KeepFreed(bool keep) {
  sKeeps = keep && kCanKeep;
  tCells.Keep(sKeeps);
  return sKeeps && TextRange::IsThere();
}
