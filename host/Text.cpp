#include "host/ZORText.h"

#include <algorithm>
#include <array>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <utility>

namespace {

constexpr char kRunCharacter = 'z';
constexpr std::size_t kLongestRun = 256;

// The longest run of z with its terminating zero; each shorter run is a tail of it.
constexpr std::array<char, kLongestRun + 1> MakeRun() {
  std::array<char, kLongestRun + 1> run{};
  for (std::size_t i = 0; i < kLongestRun; ++i) run[i] = kRunCharacter;
  return run;
}
constexpr std::array<char, kLongestRun + 1> kRun = MakeRun();

std::string_view ViewOf(const char* text) { return text != nullptr ? std::string_view(text) : std::string_view(); }

}  // namespace

void ZOR_STANDARD_LIBRARY() {}

ZORChar::ZORChar(const ZORChar& other) = default;
ZORChar& ZORChar::operator=(const ZORChar& other) = default;
ZORChar::~ZORChar() = default;

bool operator==(const ZORChar& a, const ZORChar& b) { return static_cast<char>(a) == static_cast<char>(b); }

ZORString::ZORString(const char* text) : ZORString() { Extend(ViewOf(text)); }

ZORString::ZORString(const char* text, std::size_t length) : ZORString() { Extend(std::string_view(text, length)); }

ZORString::ZORString(const ZORChar& c, std::size_t count) : ZORString() {
  if (static_cast<char>(c) == kRunCharacter && count > kInline && count <= kLongestRun) {
    mOutside = const_cast<char*>(kRun.data() + (kLongestRun - count));  // never written through
    mLength = static_cast<std::uint32_t>(count);
    mCapacity = kShared;
  } else {
    std::memset(Reserve(count), static_cast<unsigned char>(static_cast<char>(c)), count);
    SetLength(count);
  }
}

// Reuses an owned block that is large enough.
ZORString& ZORString::operator=(const ZORString& other) {
  if (this == &other) return *this;
  if (!IsOwner() || other.mCapacity == kShared || other.mLength >= mCapacity) return *this = ZORString(other);
  std::memcpy(mOutside, other.CastToCharPtr(), other.mLength + std::size_t{1});
  mLength = other.mLength;
  return *this;
}

ZORString& ZORString::operator=(ZORString&& other) noexcept {
  if (this == &other) return *this;
  Release();
  Take(other);
  return *this;
}

void ZORString::DieOutOfMemory() {
  std::fputs("ZORString: out of memory\n", stderr);
  std::abort();
}

bool ZORString::operator==(const char* text) const { return View() == ViewOf(text); }

const ZORChar ZORString::operator[](int position) const {
  return position >= 0 && position < GetLengthInChar() ? CastToCharPtr()[position] : '\0';
}

ZORString& ZORString::Append(const ZORString& tail) {
  if (tail.mLength == 0) return *this;
  Reserve(mLength + std::size_t{tail.mLength});  // before the view is taken: tail may be *this
  Extend(tail.View());
  return *this;
}

ZORString ZORString::SubString(std::size_t start, std::size_t length) const {
  if (start >= mLength || static_cast<std::ptrdiff_t>(length) < 0) return ZORString();
  return ZORString(CastToCharPtr() + start, std::min(length, mLength - start));
}

int ZORString::FindPosition(const ZORString& pattern, int start) const {
  if (start < 0) return -1;
  const std::size_t position = View().find(pattern.View(), static_cast<std::size_t>(start));
  return position == std::string_view::npos ? -1 : static_cast<int>(position);
}

void ZORString::ReplaceSubString(int start, int length, const ZORString& text) {
  if (start < 0 || start > GetLengthInChar() || length < 0) return;
  const auto head = static_cast<std::size_t>(start);
  const std::size_t end = std::min(head + static_cast<std::size_t>(length), std::size_t{mLength});
  ZORString result;
  result.Reserve(head + text.mLength + (mLength - end));
  result.Extend(View().substr(0, head));
  result.Extend(text.View());
  result.Extend(View().substr(end));
  *this = std::move(result);
}

void ZORString::ToLower() { FlipCase('A', 'Z'); }
void ZORString::ToUpper() { FlipCase('a', 'z'); }

void ZORString::FlipCase(char first, char last) {
  constexpr char kCaseBit = 'a' ^ 'A';
  if (mCapacity == kShared && last != kRunCharacter) return;
  const auto flip = [&](char* text, std::size_t length) {
    for (std::size_t i = 0; i < length; ++i)
      text[i] = static_cast<char>(text[i] ^ (text[i] >= first && text[i] <= last ? kCaseBit : 0));
  };
  mCapacity == kInside ? flip(mInside, kRoom) : flip(Reserve(mLength), mLength);  // the zeros that pad a room stay
}

// Ensures owned storage for length characters and the terminating zero.
char* ZORString::Reserve(std::size_t length) {
  if (mCapacity == kInside && length <= kInline) return mInside;
  if (IsOwner() && length < mCapacity) return mOutside;
  if (length >= INT_MAX) DieOutOfMemory();
  const std::size_t doubled = IsOwner() ? std::min<std::size_t>(std::size_t{mCapacity} * 2, INT_MAX) : 0;
  const std::size_t size = std::max({length, std::size_t{mLength}, doubled}) + 1;
  char* block = static_cast<char*>(Allocate(size));
  std::memcpy(block, CastToCharPtr(), mLength + std::size_t{1});
  Release();
  mOutside = block;
  mCapacity = static_cast<std::uint32_t>(size);  // NOLINT(clang-analyzer-cplusplus.NewDeleteLeaks): held by the union
  return block;
}

void ZORString::CopyBlock(const ZORString& other) {
  std::memset(mInside, 0, kRoom);
  Extend(other.View());
}

void ZORString::Join(std::string_view head, std::string_view tail) {
  if (!IsOwner()) *this = ZORString();
  mLength = 0;
  Reserve(head.size() + tail.size());
  Extend(head);
  Extend(tail);
}

// text must not be in storage that Reserve frees.
void ZORString::Extend(std::string_view text) {
  const std::size_t length = mLength + text.size();
  char* room = Reserve(length);
  if (!text.empty()) std::memcpy(room + mLength, text.data(), text.size());
  SetLength(length);
}

void ZORString::SetLength(std::size_t length) {
  if (mCapacity != kInside) mOutside[length] = '\0';
  mLength = static_cast<std::uint32_t>(length);
}
