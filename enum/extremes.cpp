// Minimum, maximum and successor of sets of texts.
#include <algorithm>

#include "enum/entries.h"
#include "module/alphabet.h"

int ZORVadEnumString::CalcMaxValue(const ZORVadEnumString& x, const ZORVadEnumString& y) {
  if (IsNil() || x.IsNil() || y.IsNil()) return Nil();
  if (x.IsFull() || y.IsFull()) return CalcMaxValue();
  if (x.IsUndefined() || y.IsUndefined()) return Any();
  const ZORString bound = std::max(x.GetLowerBound(), y.GetLowerBound());
  mState = ZorStringExact;  // what is listed stays
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
  mState = ZorStringExact;  // what is listed stays, and a full operand adds nothing
  Append(x);
  Append(y);
  if (cuts) CutUpper(bound);
  return 1;
}

// The inverse of either extreme: bound is the end that decides, beyond tells on which side of y no extreme of x and y
// can lie. Where all three share the bound nothing can be told.
int ZORVadEnumString::TestChoice(Enum& x, const Enum& y, Bound bound,
                                 bool (*beyond)(const ZORString&, const ZORString&)) const {
  if (IsNil() || x.IsNil() || y.IsNil()) return x.Nil();
  if (IsUndefined()) return x.Any();
  const bool attained = y.IsUndefined() || (y.*bound)() == (this->*bound)();
  if (x.IsUndefined()) return attained ? (x.Copy(*this), 1) : 0;
  if (!attained && beyond((x.*bound)(), (y.*bound)())) return x.Nil();
  return 0;
}

int ZORVadEnumString::CalcFirstInverseMaxValue(ZORVadEnumString& x, const ZORVadEnumString& y) const {
  return TestChoice(x, y, &ZORVaDoString::GetLowerBound, [](const ZORString& a, const ZORString& b) { return a < b; });
}

int ZORVadEnumString::CalcFirstInverseMinValue(ZORVadEnumString& x, const ZORVadEnumString& y) const {
  return TestChoice(x, y, &ZORVaDoString::GetUpperBound, [](const ZORString& a, const ZORString& b) { return a > b; });
}

// The target is replaced, not narrowed. A text without a successor stands for itself.
int ZORVadEnumString::CalcNextValue(const ZORVadEnumString& x) {
  if (x.IsUndefined()) return 0;
  if (x.IsFull()) return CalcMaxValue();
  if (IsNil() || x.IsNil()) return Nil();
  ZORVadEnumString next(ZorStringExact);
  for (ZORISVectorIteratorImp_String text(x.mVector); text; ++text) {
    next.Insert(zor::Successor(*text.Current()).value_or(*text.Current()));
  }
  return Take(next);
}

// The greatest text has two predecessors, the text below it and itself. The empty text has none.
int ZORVadEnumString::CalcInverseNextValue(ZORVadEnumString& x) const {
  if (IsUndefined()) return x.Any();
  if (IsNil()) return x.Nil();
  if (IsEmpty()) return x.CalcMinValue();
  ZORVadEnumString previous(ZorStringExact);
  for (ZORISVectorIteratorImp_String it(mVector); it; ++it) {
    const ZORString& text = *it.Current();
    if (!(text == "")) previous.Insert(text == ZorVaDoStringMin ? ZORString() : zor::Predecessor(text));
  }
  if (IsFull()) {
    previous.Insert(zor::Predecessor(ZorVaDoStringMax));
    previous.mState = ZorStringMax;
  }
  return previous.Count() > 0 ? x.Take(previous) : x.Nil();
}

int ZORVadEnumString::CalcMaxValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcMaxValue(a, b); });
}

int ZORVadEnumString::CalcMinValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return zor::Narrowed<Enum>(*this, x, y, [&](auto& a, auto& b) { return CalcMinValue(a, b); });
}

// A second operand of which nothing is known does not keep the result from telling something.
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
