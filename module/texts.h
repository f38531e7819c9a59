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

// Not exported. The successor is the least greater text: a shorter text gets a space appended; one of kLengthLimit
// loses its trailing z, and the character before them is incremented. There is none when all characters are z.
// The predecessor of a text that is not empty has its last character decremented, a space dropped, and is padded with
// z.
std::optional<ZORString> Successor(const ZORString& text);
ZORString Predecessor(const ZORString& text);

}  // namespace zor
