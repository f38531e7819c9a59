// Characters, strings, the registry of streamable classes, binary streams for storage and text streams for people.
// Nothing here throws. Lengths and positions count characters of one byte, positions from 0.
#pragma once

#include <bit>
#include <compare>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <new>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "host/ZORExport.h"

// The solver's integer: 32 bits, signed, on every machine.
using ZORLong = std::int32_t;

// One character.
class ZOR_EXPORT ZORChar {
 public:
  ZORChar(char code) : mCode(code) {}  // NOLINT(google-explicit-constructor): a character is its code
  ZORChar(const ZORChar& other);
  ZORChar& operator=(const ZORChar& other);
  virtual ~ZORChar();

  operator char() const { return mCode; }  // NOLINT(google-explicit-constructor)

 private:
  char mCode;
};

ZOR_EXPORT bool operator==(const ZORChar& a, const ZORChar& b);

// A string with value semantics, ordered lexicographically by unsigned character code, a prefix before its extensions.
// Up to kInline characters are stored in the object. Longer strings are on the heap, except runs of up to 256 'z':
// those stand for "greatest" and "unknown" in every network and share one constant block. Running out of memory ends
// the process with a message: a lost string would be a wrong answer.
class ZOR_EXPORT ZORString {
 public:
  ZORString() noexcept : mInside{} {}
  ZORString(const ZORString& other) { other.IsOwner() ? CopyBlock(other) : Mirror(other); }
  ZORString(ZORString&& other) noexcept { Take(other); }  // other is empty afterwards
  ZORString(const char* text);  // NOLINT(google-explicit-constructor): zero-terminated, copied; null is empty
  ZORString(const ZORChar& c, std::size_t count);
  ZORString(std::string_view text) : ZORString(text.data(), text.size()) {}    // NOLINT(google-explicit-constructor)
  ZORString(const std::string& text) : ZORString(text.data(), text.size()) {}  // NOLINT(google-explicit-constructor)
  ZORString(const char* text, std::size_t length);
  ~ZORString() { Release(); }
  ZORString& operator=(const ZORString& other);
  ZORString& operator=(ZORString&& other) noexcept;

  // Never null. What a thread deletes serves its next strings, and those of other threads when there is much of it.
  static void* operator new(std::size_t size);
  static void* operator new(std::size_t, void* place) noexcept { return place; }
  static void operator delete(void* memory, std::size_t size) noexcept;
  static void DeleteAll(ZORString* const* strings, std::size_t count) noexcept;  // some may be null
  // For programs that count or refuse allocations: without keep, new strings of the calling thread, and of threads that
  // have had none yet, are blocks of the global operator new. Answers whether memory is kept: never with sanitizers,
  // nor where the process may have only so many addresses.
  static bool KeepFreed(bool keep);

  bool operator==(const ZORString& other) const;
  bool operator==(const char* text) const;
  std::strong_ordering operator<=>(const ZORString& other) const;

  const ZORChar operator[](int position) const;  // zero outside the string
  int GetLengthInChar() const { return static_cast<int>(mLength); }
  const char* CastToCharPtr() const { return mCapacity == kInside ? mInside : mOutside; }  // zero-terminated
  std::string_view View() const { return {CastToCharPtr(), mLength}; }  // valid until the string changes
  explicit operator std::string_view() const { return View(); }

  static ZORString Concatenation(const ZORString& head, const ZORString& tail);  // at most one allocation
  void Concatenate(const ZORString& head, const ZORString& tail);  // makes *this, which is neither, the concatenation
  bool IsConcatenation(const ZORString& head, const ZORString& tail) const;  // no allocation
  ZORString& Append(const ZORString& tail);                                  // tail may be *this
  // Ends at the end of the string at the latest. Empty when start is outside the string or length is a converted
  // negative number.
  ZORString SubString(std::size_t start, std::size_t length) const;
  // First position of pattern at or after start, -1 when there is none. The empty pattern is found at start.
  int FindPosition(const ZORString& pattern, int start) const;
  // Puts text in place of length characters from start, or of those up to the end. A negative length, or a start
  // outside the string, changes nothing.
  void ReplaceSubString(int start, int length, const ZORString& text);
  void ToLower();  // ASCII letters only, in any locale
  void ToUpper();

 private:
  static constexpr std::size_t kRoom = 32;
  static constexpr int kInline = kRoom - 1;
  static constexpr std::uint32_t kInside = 0, kShared = UINT32_MAX;  // else mCapacity is the size of an owned block

  static void* Allocate(std::size_t size);
  [[noreturn]] static void DieOutOfMemory();
  static int OrderRooms(const char* a, const char* b);
  static void JoinRooms(const ZORString& head, const ZORString& tail, char* joined);
  static bool AreInside(const ZORString& a, const ZORString& b) { return (a.mCapacity | b.mCapacity) == kInside; }
  bool IsOwner() const { return mCapacity != kInside && mCapacity != kShared; }
  void CopyBlock(const ZORString& other);
  void Extend(std::string_view text);
  void Join(std::string_view head, std::string_view tail);
  void FlipCase(char first, char last);
  char* Reserve(std::size_t length);
  void SetLength(std::size_t length);
  void Mirror(const ZORString& other) noexcept;
  void Take(ZORString& other) noexcept;
  void Release() noexcept;

  std::uint32_t mLength = 0;  // first, in one cache line with the start of the text
  std::uint32_t mCapacity = kInside;
  union {
    char mInside[kRoom];  // padded with zeros
    char* mOutside;
  };
};

inline void* ZORString::Allocate(std::size_t size) {
  void* const memory = ::operator new(size, std::nothrow);
  if (memory == nullptr) DieOutOfMemory();
  return memory;
}

inline void ZORString::Mirror(const ZORString& other) noexcept {
  std::memcpy(mInside, other.mInside, kRoom);
  mLength = other.mLength;
  mCapacity = other.mCapacity;
}

inline void ZORString::Take(ZORString& other) noexcept {
  Mirror(other);
  std::memset(other.mInside, 0, kRoom);
  other.mLength = 0;
  other.mCapacity = kInside;
}

inline void ZORString::Release() noexcept {
  if (IsOwner()) ::operator delete(mOutside);  // NOLINT(clang-analyzer-cplusplus.NewDelete): no other text holds it
}

// Word by word, the first character in the highest byte. Strings mostly differ in the first two words, where calling
// memcmp costs more than comparing.
inline int ZORString::OrderRooms(const char* a, const char* b) {
  for (std::size_t i = 0; i < kRoom; i += sizeof(std::uint64_t)) {
    std::uint64_t x, y;
    std::memcpy(&x, a + i, sizeof x);
    std::memcpy(&y, b + i, sizeof y);
    if (x == y) continue;
    if constexpr (std::endian::native == std::endian::little) {
      x = __builtin_bswap64(x);
      y = __builtin_bswap64(y);
    }
    return x < y ? -1 : 1;
  }
  return 0;
}

// Strings stored inside compare with their padding: the cost does not depend on their length.
inline bool ZORString::operator==(const ZORString& other) const {
  if (mLength != other.mLength) return false;
  if (AreInside(*this, other)) return std::memcmp(mInside, other.mInside, kRoom) == 0;
  return View() == other.View();
}

inline std::strong_ordering ZORString::operator<=>(const ZORString& other) const {
  if (!AreInside(*this, other)) return View() <=> other.View();
  const int order = OrderRooms(mInside, other.mInside);
  return order != 0 ? order <=> 0 : mLength <=> other.mLength;
}

// Two copies of fixed size; joined has two rooms. The zeros that pad head are overwritten by tail.
inline void ZORString::JoinRooms(const ZORString& head, const ZORString& tail, char* joined) {
  std::memcpy(joined, head.mInside, kRoom);
  std::memcpy(joined + head.mLength, tail.mInside, kRoom);
}

inline void ZORString::Concatenate(const ZORString& head, const ZORString& tail) {
  const std::size_t length = std::size_t{head.mLength} + tail.mLength;
  if (mCapacity != kInside || length > kInline || !AreInside(head, tail)) return Join(head.View(), tail.View());
  char joined[2 * kRoom];
  JoinRooms(head, tail, joined);
  std::memcpy(mInside, joined, kRoom);
  mLength = static_cast<std::uint32_t>(length);
}

inline ZORString ZORString::Concatenation(const ZORString& head, const ZORString& tail) {
  ZORString text;
  text.Concatenate(head, tail);
  return text;
}

inline bool ZORString::IsConcatenation(const ZORString& head, const ZORString& tail) const {
  if (std::uint64_t{head.mLength} + tail.mLength != mLength) return false;
  const char* const text = CastToCharPtr();
  return std::memcmp(text, head.CastToCharPtr(), head.mLength) == 0 &&
         std::memcmp(text + head.mLength, tail.CastToCharPtr(), tail.mLength) == 0;
}

class ZORipstream;
class ZORopstream;

// Selects the constructor of an object that Read will fill.
enum ZORStreamableInit { ZorStreamableInit = 0 };

// An object that can be stored. Write and Read handle its content; here they do nothing.
class ZOR_EXPORT ZORStreamable {
 public:
  virtual ~ZORStreamable();
  virtual const char* CastableID() const = 0;  // the name under which the class is registered
  virtual void Write(ZORopstream& out) const;
  virtual void Read(ZORipstream& in);
};

// The record that registers a streamable class under a name: a static object of the library that defines the class. Of
// two live records with one name the later is found.
class ZOR_EXPORT ZORStreamableClass {
 public:
  using Factory = ZORStreamable* (*)(ZORStreamable* object);  // makes a new object when given null
  using Watcher = void (*)(const ZORStreamableClass& record, bool added);
  static constexpr int kSolverClass = 1;  // kind of the classes derived from ZORVaDoBase

  ZORStreamableClass(const char* text, Factory factory, int kind);  // text must outlive the record
  ~ZORStreamableClass();
  ZORStreamableClass(const ZORStreamableClass&) = delete;
  ZORStreamableClass& operator=(const ZORStreamableClass&) = delete;

  const char* Text() const { return mText; }
  int Kind() const { return mKind; }
  ZORStreamable* Build() const { return mFactory(nullptr); }

  static const ZORStreamableClass* Find(const char* text);  // null when no such class is loaded
  static void Watch(Watcher watcher);                       // called as records come and go; null stops that

 private:
  const char* mText;
  Factory mFactory;
  int mKind;
  ZORStreamableClass* mNext;
};

// Binary output to memory: little-endian integers, strings preceded by their length.
class ZOR_EXPORT ZORopstream {
 public:
  ZORopstream();
  ~ZORopstream();

  ZORopstream& operator<<(ZORLong value);
  void WriteString(const char* text);                    // zero-terminated; null is empty
  void WriteObject(const ZORStreamable* object);         // class name and content
  void WriteObjectPointer(const ZORStreamable* object);  // null, a new object, or a reference to one written before
  const std::string& Bytes() const { return mBytes; }

 private:
  std::string mBytes;
  std::unordered_map<const ZORStreamable*, ZORLong> mObjects;
};

// Binary input from untrusted bytes. Missing or malformed data reads as 0 or null and sets Fail(); later reads fail
// too. Nothing is read or allocated beyond what the bytes hold.
class ZOR_EXPORT ZORipstream {
 public:
  explicit ZORipstream(std::string bytes);
  ~ZORipstream();

  ZORipstream& operator>>(ZORLong& value);
  char* ReadString();                       // zero-terminated; the caller frees it with delete[]
  void ReadObject(ZORStreamable*& object);  // fills object, or makes one for the caller when it is null
  ZORStreamable* ReadObjectPointer();       // the caller owns a new object; null for an unknown class
  bool Fail() const { return mFail; }
  void SetFail() { mFail = true; }                                // for a Read that rejects its content
  std::size_t Left() const { return mBytes.size() - mPosition; }  // in bytes
  // Every object made by ReadObjectPointer, null where that failed: what to delete when reading is abandoned.
  const std::vector<ZORStreamable*>& Objects() const { return mObjects; }

 private:
  ZORStreamable* Build(const char* text);
  void ReadContent(ZORStreamable& object);

  std::string mBytes;
  std::size_t mPosition = 0;
  bool mFail = false;
  int mNesting = 0;
  std::vector<ZORStreamable*> mObjects;
};

// The buffer of a text output stream.
class ZOR_EXPORT ZORpstream {
 public:
  char* Str(int);      // the buffer, owned by the stream; zero-terminated only if a zero was written last
  void Freeze(int) {}  // does nothing: the stream keeps its buffer
  std::string_view View() const { return mBuffer; }
  void Reserve(std::size_t size) { mBuffer.reserve(size); }
  std::string Take() { return std::move(mBuffer); }  // the stream is empty afterwards

 protected:
  std::string mBuffer;
};

// Text output to a growing buffer.
class ZOR_EXPORT ZORostrstream : public ZORpstream {
 public:
  ZORostrstream();
  ~ZORostrstream();
  ZORostrstream& operator<<(const char* text);
  ZORostrstream& operator<<(char c);
};

// Text input from characters that must stay alive and unchanged while it is used.
class ZOR_EXPORT ZORistrstream {
 public:
  static constexpr int kNoCharacter = -1;

  ZORistrstream(const char* text, int size);  // size characters; with size 0, up to the terminating zero

  ZORistrstream& operator>>(ZORistrstream& (*manipulator)(ZORistrstream&)) { return manipulator(*this); }
  ZORistrstream& operator>>(char& c);  // zero at the end
  int Peek() const;                    // the next character as 0 to 255, or kNoCharacter at the end
  void Ignore();
  // Stores at most limit characters and a terminating zero: line has room for limit + 1. Stores nothing for limit 0.
  // Stops at the delimiter and consumes it, also right after the last character stored.
  void GetLine(char* line, unsigned int limit, char delimiter);
  std::size_t Left() const { return static_cast<std::size_t>(mEnd - mNext); }

 private:
  const char* mNext;
  const char* mEnd;
};

ZOR_EXPORT ZORistrstream& ws(ZORistrstream& in);  // skips spaces and the codes 9 to 13
