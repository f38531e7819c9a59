#include "module/texts.h"

#include <algorithm>
#include <string_view>

namespace {

ZORString Character(char c) { return {ZORChar(c), 1}; }

}  // namespace

std::optional<ZORString> zor::Successor(const ZORString& text) {
  const std::string_view characters = text.View();
  if (characters.size() < kLengthLimit) {
    ZORString next(text);
    next.Append(Character(kLeastCharacter));
    return next;
  }
  const std::size_t last = characters.find_last_not_of(kGreatestCharacter);
  if (last == std::string_view::npos) return std::nullopt;
  ZORString next = text.SubString(0, last);
  next.Append(Character(static_cast<char>(characters[last] + 1)));
  return next;
}

ZORString zor::Predecessor(const ZORString& text) {
  const int last = text.GetLengthInChar() - 1;
  const char end = text[last];
  ZORString previous = text.SubString(0, last);
  if (end != kLeastCharacter) previous.Append(Character(static_cast<char>(end - 1)));
  previous.Append(ZORString(kGreatestCharacter, std::max(0, kLengthLimit - previous.GetLengthInChar())));
  return previous;
}
