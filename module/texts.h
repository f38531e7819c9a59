// The texts of the domain: limits, case folding, successors and predecessors.
#pragma once

#include <cstddef>
#include <optional>

#include "host/ZORText.h"

namespace zor {

constexpr char kLeastCharacter = ' ', kGreatestCharacter = 'z';  // the alphabet is every code between them
constexpr bool IsInAlphabet(char c) { return c >= kLeastCharacter && c <= kGreatestCharacter; }

constexpr int kLengthLimit = 255;             // characters of the longest text
constexpr unsigned int kReadableLimit = 254;  // characters of the longest text that can be read
constexpr std::size_t kSetLimit = 256;        // texts of a set that grows through InsertExactValue

// ZORString::ToLower or ZORString::ToUpper.
using Fold = void (ZORString::*)();

inline ZORString Folded(ZORString text, Fold fold) {
  (text.*fold)();
  return text;
}

// Whether folding leaves text as it is.
inline bool IsFolded(const ZORString& text, Fold fold) { return text == Folded(text, fold); }

// Not exported. The successor is the least greater text. A text shorter than kLengthLimit gets a space appended; any
// other loses its trailing z's, and the character before them is incremented. There is none when all are z.
// The predecessor of a text, which must not be empty, has its last character decremented, or dropped if it is a space,
// and is padded with z to kLengthLimit. Of a text that ends in a space it is therefore not the greatest lesser text.
std::optional<ZORString> Successor(const ZORString& text);
ZORString Predecessor(const ZORString& text);

}  // namespace zor
