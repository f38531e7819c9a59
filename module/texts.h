// The texts of the domain: their limits and steps, views of them, and their folds.
#pragma once

#include <cstddef>
#include <optional>
#include <string_view>

#include "host/ZORText.h"

namespace zor {

constexpr char kLeastCharacter = ' ', kGreatestCharacter = 'z';  // the alphabet is every code between them
constexpr bool IsInAlphabet(char c) { return c >= kLeastCharacter && c <= kGreatestCharacter; }

constexpr int kLengthLimit = 255;                                // characters of the longest text
constexpr unsigned int kReadableLimit = 254;                     // characters of the longest text that reads back
constexpr std::size_t kSetLimit = 256;                           // texts of a set that grows through InsertExactValue

// Orders like the text itself; valid as long as the text stays as it is.
inline std::string_view View(const ZORString& text) {
  return {text.CastToCharPtr(), static_cast<std::size_t>(text.GetLengthInChar())};
}

// Lower case or upper case: one algorithm with the fold as its parameter.
using Fold = void (ZORString::*)();

inline ZORString Folded(ZORString text, Fold fold) {
  (text.*fold)();
  return text;
}

// A text with a letter in the other case is no fold.
inline bool IsFolded(const ZORString& text, Fold fold) { return text == Folded(text, fold); }

// The steps are the module's own and not exported.
// Successor: the least text that is greater. Below the limit that is the text and a space; at the limit the trailing z
// go and the character before them is raised. None for a text at the limit of nothing but z.
// Predecessor: the last character of a text that has one steps down, and z fill it up to the limit.
std::optional<ZORString> Successor(const ZORString& text);
ZORString Predecessor(const ZORString& text);

}  // namespace zor
