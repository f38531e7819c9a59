// Concatenation of single strings.
#include "host/Guard.h"
#include "module/texts.h"
#include "single/ZORVadSingleString.h"

int ZORVadSingleString::CalcConcatenation(const ZORVadSingleString& x, const ZORVadSingleString& y) {
  if (IsNil() || x.IsNil() || y.IsNil()) return Nil();
  if (x.IsUndefined() || y.IsUndefined()) return Any();  // overwrites a known value
  if (x.IsFull() || y.IsFull()) return CalcMaxValue();
  const std::size_t length = x.mText.View().size() + y.mText.View().size();
  if (length > zor::kLengthLimit) return CalcMaxValue();
  if (!IsUndefined()) return mText.IsConcatenation(x.mText, y.mText) ? 0 : Nil();
  return Settle(ZORString::Concatenation(x.mText, y.mText));
}

int ZORVadSingleString::CalcFirstInverseConcatenation(ZORVadSingleString& x, const ZORVadSingleString& y) const {
  if (x.IsNil()) return 0;
  if (IsNil() || y.IsNil()) return x.Nil();
  if (IsUndefined() || y.IsUndefined()) return x.Any();
  if (y.IsFull() || IsFull()) return x.Any();
  const int position = mText.FindPosition(y.mText, 0);
  if (position < 0) return x.Nil();
  return x.Settle(mText.SubString(0, position));
}

int ZORVadSingleString::CalcSecondInverseConcatenation(const ZORVadSingleString& x, ZORVadSingleString& y) const {
  if (y.IsNil()) return 0;
  if (IsNil() || x.IsNil()) return y.Nil();
  if (IsUndefined() || x.IsUndefined()) return y.Any();
  if (x.IsFull() || IsFull()) return y.Any();
  if (mText.FindPosition(x.mText, 0) < 0) return y.Nil();  // any occurrence will do; the cut is by length
  const int length = x.mText.GetLengthInChar();
  return y.Settle(mText.SubString(length, mText.GetLengthInChar() - length));
}

int ZORVadSingleString::CalcConcatenation(const ZORVaDoString& x, const ZORVaDoString& y) {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcConcatenation(a, b); });
}

int ZORVadSingleString::CalcFirstInverseConcatenation(ZORVaDoString& x, const ZORVaDoString& y) const {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcFirstInverseConcatenation(a, b); });
}

int ZORVadSingleString::CalcSecondInverseConcatenation(const ZORVaDoString& x, ZORVaDoString& y) const {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcSecondInverseConcatenation(a, b); });
}
