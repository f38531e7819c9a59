// Setting, adding and removing the text of single strings.
#include "single/ZORVadSingleString.h"

void ZORVadSingleString::SetExactValue(const ZORString& text) { Become(ZorStringExact, text); }

void ZORVadSingleString::InsertExactValue(const ZORString& text) {
  if (IsUndefined()) return;
  if (IsNil()) return SetExactValue(text);
  if (mText == text) return;
  SetUndefinedValue();
}

int ZORVadSingleString::RemoveExactValue(const ZORString& text) {
  if (IsUndefined() || IsNil()) return 0;
  if (!(mText == text)) return 0;
  return Nil();
}
