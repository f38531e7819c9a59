// Concatenation and substring of single strings.
#include <cstdint>

#include "host/Guard.h"
#include "module/alphabet.h"
#include "module/textview.h"
#include "single/ZORVadSingleString.h"

namespace {

// Positions and counts are worked out in 32 bits and wrap there.
ZORLong Wrapped(std::int64_t sum) { return static_cast<ZORLong>(static_cast<std::uint32_t>(sum)); }

// A negative position or count arrives as a huge one and cuts nothing out.
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

int ZORVadSingleString::CalcConcatenation(const ZORVadSingleString& x, const ZORVadSingleString& y) {
  if (IsNil() || x.IsNil() || y.IsNil()) return Nil();
  if (x.IsUndefined() || y.IsUndefined()) return Any();  // overwrites a known value
  if (x.IsFull() || y.IsFull()) return CalcMaxValue();
  const std::size_t length = zor::View(x.mText).size() + zor::View(y.mText).size();
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
  if (mText.FindPosition(x.mText, 0) < 0) return y.Nil();  // anywhere will do: the cut is by length
  const int length = x.mText.GetLengthInChar();
  return y.Settle(mText.SubString(length, mText.GetLengthInChar() - length));
}

int ZORVadSingleString::CalcSubString(const ZORVadSingleString& x, const ZORVaDoInteger& start,
                                      const ZORVaDoInteger& end) {
  if (x.IsNil()) return Nil();
  if (x.IsUndefined()) return Any();
  if (x.IsEmpty()) return CalcMinValue();  // wherever the positions lie, and from Nil too
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

// Both positions by one list. A slice of our length is cut where the known position puts it, or at our first
// occurrence when neither is known; its start is the one position, its last character the other.
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

int ZORVadSingleString::CalcConcatenation(const ZORVaDoString& x, const ZORVaDoString& y) {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcConcatenation(a, b); });
}

int ZORVadSingleString::CalcFirstInverseConcatenation(ZORVaDoString& x, const ZORVaDoString& y) const {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcFirstInverseConcatenation(a, b); });
}

int ZORVadSingleString::CalcSecondInverseConcatenation(const ZORVaDoString& x, ZORVaDoString& y) const {
  return zor::Guarded<Single>(x, y, [&](auto& a, auto& b) { return CalcSecondInverseConcatenation(a, b); });
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
