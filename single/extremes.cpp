// Minimum, maximum and successor of single strings.
#include "host/Guard.h"
#include "module/texts.h"
#include "single/ZORVadSingleString.h"

namespace {

const ZORString& Earlier(const ZORString& a, const ZORString& b) { return a <= b ? a : b; }
const ZORString& Later(const ZORString& a, const ZORString& b) { return a <= b ? b : a; }

}  // namespace

int ZORVadSingleString::CalcMinValue() {
  if (IsEmpty()) return 0;
  return Become(ZorStringExact, ZorVaDoStringMin);
}

int ZORVadSingleString::CalcMaxValue() {
  if (IsFull()) return 0;
  return Become(ZorStringMax, ZorVaDoStringMax);
}

int ZORVadSingleString::CalcMaxValue(const ZORVadSingleString& x, const ZORVadSingleString& y) {
  if (x.IsNil() || y.IsNil()) return Nil();
  if (x.IsUndefined() || y.IsUndefined()) return Any();
  if (x.IsFull() || y.IsFull()) return MeetGreatest();
  return Settle(Later(x.mText, y.mText));
}

int ZORVadSingleString::CalcMinValue(const ZORVadSingleString& x, const ZORVadSingleString& y) {
  if (x.IsNil() || y.IsNil()) return Nil();
  if (x.IsUndefined() || y.IsUndefined()) return Any();
  if (x.IsEmpty() || y.IsEmpty()) return MeetLeast();
  if (x.IsFull() && y.IsFull()) return CalcMaxValue();  // replaces the target, unlike the maximum
  if (x.IsFull()) return Intersect(y);
  if (y.IsFull()) return Intersect(x);
  return Settle(Earlier(x.mText, y.mText));
}

// Tests a known x: chosen, the lesser or greater text of x and y, must be the text of the result.
int ZORVadSingleString::TestChoice(Single& x, const Single& y, const ZORString& chosen) const {
  if (x.IsNil()) return 0;
  if (IsNil() || y.IsNil()) return x.Nil();
  if (IsUndefined()) return x.Any();
  return mText == chosen ? 0 : x.Nil();
}

int ZORVadSingleString::CalcFirstInverseMaxValue(ZORVadSingleString& x, const ZORVadSingleString& y) const {
  if (IsUndefined() && x.IsUndefined()) return 0;
  if (y.IsUndefined()) return 0;
  if (!x.IsUndefined()) return TestChoice(x, y, Later(x.mText, y.mText));
  if (IsNil() || y.IsNil()) return x.Nil();
  if (IsFull()) return x.CalcMaxValue();
  if (IsEmpty()) return x.Nil();
  if (mText < y.mText) return x.Nil();
  if (mText == y.mText) return 0;
  return x.Copy(*this);
}

int ZORVadSingleString::CalcFirstInverseMinValue(ZORVadSingleString& x, const ZORVadSingleString& y) const {
  if (IsUndefined() && x.IsUndefined()) return 0;
  if (y.IsUndefined()) return 0;
  if (!x.IsUndefined()) return TestChoice(x, y, Earlier(x.mText, y.mText));
  if (IsNil() || y.IsNil()) return x.Nil();
  if (IsFull() || mText > y.mText) return x.Nil();
  return x.Copy(*this);  // for equal texts too, unlike the maximum
}

int ZORVadSingleString::CalcNextValue(const ZORVadSingleString& x) {
  if (x.IsUndefined()) return 0;
  if (x.IsFull()) return Nil();
  if (x.IsNil()) return Nil();
  if (auto next = zor::Successor(x.mText)) return Settle(*std::move(next));
  if (IsUndefined()) return CalcMaxValue();
  if (mText == x.mText) return 0;
  return Nil();
}

int ZORVadSingleString::CalcInverseNextValue(ZORVadSingleString& x) const {
  if (IsUndefined()) return 0;
  if (IsEmpty()) return x.Nil();
  if (IsNil()) return x.Nil();
  if (mText == "") return x.Nil();
  return x.Settle(zor::Predecessor(mText));
}

int ZORVadSingleString::CalcMaxValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcMaxValue(a, b); });
}

int ZORVadSingleString::CalcMinValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcMinValue(a, b); });
}

int ZORVadSingleString::CalcFirstInverseMaxValue(ZORVaDoAny& x, const ZORVaDoAny& y) const {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcFirstInverseMaxValue(a, b); });
}

int ZORVadSingleString::CalcFirstInverseMinValue(ZORVaDoAny& x, const ZORVaDoAny& y) const {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcFirstInverseMinValue(a, b); });
}

int ZORVadSingleString::CalcNextValue(const ZORVaDoScalar& x) {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcNextValue(a); });
}

int ZORVadSingleString::CalcInverseNextValue(ZORVaDoScalar& x) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcInverseNextValue(a); });
}
