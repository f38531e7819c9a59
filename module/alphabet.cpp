#include "module/alphabet.h"

#include <algorithm>

#include "module/InitModule.h"
#include "module/ZORVaDoString.h"
#include "module/characters.h"

namespace {

ZORString Stepped(const ZORString& text, int position, int step) {
  return {ZORChar(static_cast<char>(text[position] + step)), 1};
}

}  // namespace

std::optional<ZORString> zor::Successor(const ZORString& text) {
  const int length = text.GetLengthInChar();
  if (length < kLengthLimit) {
    ZORString next(text);
    next.Append(ZORString(ZorVaDoCharMin, 1));
    return next;
  }
  int last = length - 1;
  while (last >= 0 && text[last] == ZorVaDoCharMax) --last;
  if (last < 0) return std::nullopt;
  ZORString next = text.SubString(0, last);
  next.Append(Stepped(text, last, +1));
  return next;
}

ZORString zor::Predecessor(const ZORString& text) {
  const int last = text.GetLengthInChar() - 1;
  ZORString previous = text.SubString(0, last);
  if (!(text[last] == ZorVaDoCharMin)) previous.Append(Stepped(text, last, -1));
  previous.Append(ZORString(ZorVaDoCharMax, std::max(0, kLengthLimit - previous.GetLengthInChar())));
  return previous;
}

void InitStrings() {
  ZORVaDoString::ZorVaDoStringMin = ZORString(ZorVaDoCharMin, 1);
  ZORVaDoString::ZorVaDoStringMax = ZORString(ZorVaDoCharMax, zor::kLengthLimit);
  ZORVaDoString::ZorVaDoStringAny = ZORString(ZorVaDoCharMax, zor::kLengthLimit + 1);
}
