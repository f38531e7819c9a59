// Substrings of single strings.
#include <cstdint>

#include "host/Guard.h"
#include "single/ZORVadSingleString.h"

namespace {

// Positions and counts have 32 bits and wrap around.
ZORLong Wrapped(std::int64_t sum) { return static_cast<ZORLong>(static_cast<std::uint32_t>(sum)); }

// A negative position or count becomes a huge one, which gives the empty text.
ZORString Cut(const ZORString& text, ZORLong start, ZORLong count) {
  return text.SubString(static_cast<std::size_t>(start), static_cast<std::size_t>(count));
}

ZORString Slice(const ZORString& text, const ZORVaDoInteger& start, const ZORVaDoInteger& end) {
  const ZORLong first = start.GetExactValue();
  return Cut(text, first, Wrapped(std::int64_t{end.GetExactValue()} + 1 - first));
}

int SetTo(ZORVaDoInteger& target, ZORLong value) { return target.SetExactValue(value), 1; }
int SetNil(ZORVaDoInteger& target) { return target.SetNilValue(), 1; }

}  // namespace

int ZORVadSingleString::CalcSubString(const ZORVadSingleString& x, const ZORVaDoInteger& start,
                                      const ZORVaDoInteger& end) {
  if (x.IsNil()) return Nil();
  if (x.IsUndefined()) return Any();
  if (x.IsEmpty()) return CalcMinValue();  // whatever the positions are, and even if *this is Nil
  if (start.IsNil() || end.IsNil()) return Nil();
  if (start.IsUndefined() || end.IsUndefined()) return Any();
  return Settle(Slice(x.mText, start, end));
}

int ZORVadSingleString::CalcFirstInverseSubString(ZORVadSingleString& x, const ZORVaDoInteger& start,
                                                  const ZORVaDoInteger& end) const {
  if (x.IsNil()) return 0;
  if (IsNil()) return x.Nil();
  if (IsUndefined() || start.IsUndefined() || end.IsUndefined()) return x.Any();
  if (x.IsUndefined()) return 0;
  if (start.IsNil() || end.IsNil()) return x.Nil();
  if (mText == Slice(x.mText, start, end)) return 0;
  return x.Nil();
}

// Narrows either position by the slice of x that has the length of this text: the one at the known position, or the
// first occurrence when neither is known.
int ZORVadSingleString::NarrowPosition(const Single& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end,
                                       ZORVaDoInteger& target, bool targetIsStart) const {
  const ZORVaDoInteger& known = targetIsStart ? end : start;
  const int length = mText.GetLengthInChar();
  const auto sought = [&](ZORLong at) { return targetIsStart ? at : Wrapped(std::int64_t{at} + length - 1); };

  if (IsNil() || x.IsNil() || start.IsNil() || end.IsNil()) return target.IsNil() ? 0 : SetNil(target);
  if (IsUndefined() || x.IsUndefined()) return target.IsUndefined() ? 0 : (target.SetUndefinedValue(), 1);
  if (!start.IsUndefined() && !end.IsUndefined()) return mText == Slice(x.mText, start, end) ? 0 : SetNil(target);
  if (!known.IsUndefined()) {
    const ZORLong position = known.GetExactValue();
    const ZORLong at = targetIsStart ? Wrapped(std::int64_t{position} + 1 - length) : position;
    return mText == Cut(x.mText, at, length) ? SetTo(target, sought(at)) : SetNil(target);
  }
  if (!target.IsUndefined()) return 0;
  const int at = x.mText.FindPosition(mText, 0);
  return at < 0 ? SetNil(target) : SetTo(target, sought(at));
}

int ZORVadSingleString::CalcSecondInverseSubString(const ZORVadSingleString& x, ZORVaDoInteger& start,
                                                   const ZORVaDoInteger& end) const {
  return NarrowPosition(x, start, end, start, true);
}

int ZORVadSingleString::CalcThirdInverseSubString(const ZORVadSingleString& x, const ZORVaDoInteger& start,
                                                  ZORVaDoInteger& end) const {
  return NarrowPosition(x, start, end, end, false);
}

int ZORVadSingleString::CalcSubString(const ZORVaDoString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcSubString(a, start, end); });
}

int ZORVadSingleString::CalcFirstInverseSubString(ZORVaDoString& x, const ZORVaDoInteger& start,
                                                  const ZORVaDoInteger& end) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcFirstInverseSubString(a, start, end); });
}

int ZORVadSingleString::CalcSecondInverseSubString(const ZORVaDoString& x, ZORVaDoInteger& start,
                                                   const ZORVaDoInteger& end) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcSecondInverseSubString(a, start, end); });
}

int ZORVadSingleString::CalcThirdInverseSubString(const ZORVaDoString& x, const ZORVaDoInteger& start,
                                                  ZORVaDoInteger& end) const {
  return zor::Guarded<Single>(x, [&](auto& a) { return CalcThirdInverseSubString(a, start, end); });
}
