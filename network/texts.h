// The texts of the domain: at most 255 characters from the space to z, ordered by character code with a prefix before
// its extensions. The empty text is the least of them and 255 times z the greatest.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include "host/ZORText.h"
#include "module/texts.h"

namespace zornet {

inline constexpr std::size_t kTextLimit = zor::kLengthLimit;

inline ZORString ToZor(std::string_view text) { return {text.data(), text.size()}; }
inline std::string_view ToView(const ZORString& text) { return text.View(); }

const ZORString& GreatestText();

// As models write it.
inline std::string Quoted(std::string_view text) {
  std::string quoted = "\"";
  for (const char c : text) {
    if (c == '"' || c == '\\') quoted += '\\';
    quoted += c;
  }
  return quoted += '"';
}

// One space is the least value of a single string, the empty text that of a set. The module recognises these values by
// their state before it looks at their text, so its answers on them are not always about the text.
inline bool IsLeastSomewhere(const ZORString& text) {
  return text.GetLengthInChar() == 0 || (text.GetLengthInChar() == 1 && *text.CastToCharPtr() == ' ');
}

}  // namespace zornet
