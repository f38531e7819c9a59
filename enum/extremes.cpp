// Minimum, maximum and successor of sets of texts.
#include <algorithm>
#include <functional>
#include <utility>

#include "enum/entries.h"
#include "module/texts.h"

namespace {

// The inverse of minimum and maximum. bound is the upper bound for the minimum, the lower for the maximum; beyond(a, b)
// is then whether a > b, a < b.
template <class Beyond>
int TestChoice(const ZORVadEnumString& z, ZORVadEnumString& x, const ZORVadEnumString& y,
               ZORString (ZORVaDoString::*bound)() const, Beyond beyond) {
  if (z.IsNil() || x.IsNil() || y.IsNil()) return x.Nil();
  if (z.IsUndefined()) return x.Any();
  const bool attained = y.IsUndefined() || (y.*bound)() == (z.*bound)();
  if (x.IsUndefined()) return attained ? (x.Copy(z), 1) : 0;
  if (!attained && beyond((x.*bound)(), (y.*bound)())) return x.Nil();
  return 0;
}

}  // namespace

int ZORVadEnumString::CalcMinValue() {
  if (IsEmpty()) return 0;
  return Become(ZorStringExact, "");
}

int ZORVadEnumString::CalcMaxValue() {
  if (IsFull()) return 0;
  return Become(ZorStringMax);
}

int ZORVadEnumString::CalcMaxValue(const ZORVadEnumString& x, const ZORVadEnumString& y) {
  if (IsNil() || x.IsNil() || y.IsNil()) return Nil();
  if (x.IsFull() || y.IsFull()) return CalcMaxValue();
  if (x.IsUndefined() || y.IsUndefined()) return Any();
  const ZORString bound = std::max(x.GetLowerBound(), y.GetLowerBound());
  mState = ZorStringExact;  // keeps the listed texts
  Append(x);
  Append(y);
  SetLowerBound(bound);
  return 1;
}

int ZORVadEnumString::CalcMinValue(const ZORVadEnumString& x, const ZORVadEnumString& y) {
  if (IsNil() || x.IsNil() || y.IsNil()) return Nil();
  if (x.IsUndefined()) return CalcLessOrEqualValue(y);
  if (y.IsUndefined()) return CalcLessOrEqualValue(x);
  if (x.IsEmpty() || y.IsEmpty()) return CalcMinValue();
  if (x.IsFull() && y.IsFull()) return CalcMaxValue();
  const bool cuts = !x.IsFull() && !y.IsFull();
  const ZORString bound = std::min(x.GetUpperBound(), y.GetUpperBound());
  mState = ZorStringExact;  // keeps the listed texts; a full operand adds none
  Append(x);
  Append(y);
  if (cuts) CutUpper(bound);
  return 1;
}

int ZORVadEnumString::CalcFirstInverseMaxValue(ZORVadEnumString& x, const ZORVadEnumString& y) const {
  return TestChoice(*this, x, y, &ZORVaDoString::GetLowerBound, std::less());
}

int ZORVadEnumString::CalcFirstInverseMinValue(ZORVadEnumString& x, const ZORVadEnumString& y) const {
  return TestChoice(*this, x, y, &ZORVaDoString::GetUpperBound, std::greater());
}

// Replaces the target instead of narrowing it. A text without a successor is its own.
int ZORVadEnumString::CalcNextValue(const ZORVadEnumString& x) {
  if (x.IsUndefined()) return 0;
  if (x.IsFull()) return CalcMaxValue();
  if (IsNil() || x.IsNil()) return Nil();
  Texts next(x.mTexts.Count());
  for (const ZORString* const text : x.mTexts.All()) next.Insert(zor::Successor(*text).value_or(*text));
  return Become(ZorStringExact, std::move(next));
}

// The greatest text has two predecessors, the text before it and itself; the empty text has none.
int ZORVadEnumString::CalcInverseNextValue(ZORVadEnumString& x) const {
  if (IsUndefined()) return x.Any();
  if (IsNil()) return x.Nil();
  if (IsEmpty()) return x.CalcMinValue();
  Texts previous(mTexts.Count());
  for (const ZORString* const text : mTexts.All()) {
    if (*text == "") continue;
    previous.Insert(*text == ZorVaDoStringMin ? ZORString() : zor::Predecessor(*text));
  }
  if (IsFull()) previous.Insert(zor::Predecessor(ZorVaDoStringMax));
  return previous.Count() > 0 ? x.Become(IsFull() ? ZorStringMax : ZorStringExact, std::move(previous)) : x.Nil();
}

int ZORVadEnumString::CalcMaxValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcMaxValue(a, b); });
}

int ZORVadEnumString::CalcMinValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcMinValue(a, b); });
}

// An Undefined second operand does not stop the inverses, which treat it as unconstrained.
int ZORVadEnumString::CalcFirstInverseMaxValue(ZORVaDoAny& x, const ZORVaDoAny& y) const {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcFirstInverseMaxValue(a, b); });
}

int ZORVadEnumString::CalcFirstInverseMinValue(ZORVaDoAny& x, const ZORVaDoAny& y) const {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcFirstInverseMinValue(a, b); });
}

int ZORVadEnumString::CalcNextValue(const ZORVaDoScalar& x) {
  return zor::Narrowed<Enum>(*this, x, [&](auto& a) { return CalcNextValue(a); });
}

int ZORVadEnumString::CalcInverseNextValue(ZORVaDoScalar& x) const {
  return zor::Narrowed<Enum>(*this, x, [&](auto& a) { return CalcInverseNextValue(a); });
}
