// Bounds of single strings.
#include "single/ZORVadSingleString.h"

ZORString ZORVadSingleString::GetLowerBound() const { return mText; }
ZORString ZORVadSingleString::GetUpperBound() const { return mText; }
ZORString ZORVadSingleString::GetNextExactValue(const ZORString&) const { return mText; }
ZORString ZORVadSingleString::GetPrevExactValue(const ZORString&) const { return mText; }

void ZORVadSingleString::SetLowerBound(const ZORString& text) { SetExactValue(text); }
void ZORVadSingleString::SetUpperBound(const ZORString& text) { SetExactValue(text); }
