#include <limits>

#include "host/IntegerSet.h"
#include "host/NumberText.h"
#include "host/ZORNumbers.h"

const ZORLong ZORVadSingleInteger::sNC_INT_ANY = std::numeric_limits<ZORLong>::min();

ZORVadSingleInteger::ZORVadSingleInteger() = default;
ZORVadSingleInteger::ZORVadSingleInteger(ZORStreamableInit) {}
ZORVadSingleInteger::ZORVadSingleInteger(ZORLong value) : mState(kExact), mValue(value) {}

void ZORVadSingleInteger::Become(State state, ZORLong value) {
  mState = state;
  mValue = value;
}

void ZORVadSingleInteger::SetNilValue() { Become(kNil, sNC_INT_ANY); }
void ZORVadSingleInteger::SetUndefinedValue() { Become(kAny, sNC_INT_ANY); }
void ZORVadSingleInteger::SetExactValue(ZORLong value) { Become(kExact, value); }
int ZORVadSingleInteger::IsNil() const { return mState == kNil; }
int ZORVadSingleInteger::IsUndefined() const { return mState == kAny; }

unsigned long ZORVadSingleInteger::GetCardinality() const {
  return mState == kNil ? 0 : mState == kExact ? 1 : zorhost::kAllNumbers;
}

std::int64_t ZORVadSingleInteger::FindAtLeast(std::int64_t value) const {
  if (mState == kAny) return zorhost::kEveryNumber.FindAtLeast(value);
  return mState == kExact && value <= mValue ? mValue : ZORIntegerSet::kAbove;
}

std::int64_t ZORVadSingleInteger::FindAtMost(std::int64_t value) const {
  if (mState == kAny) return zorhost::kEveryNumber.FindAtMost(value);
  return mState == kExact && value >= mValue ? mValue : ZORIntegerSet::kBelow;
}

int ZORVadSingleInteger::Keep(const ZORIntegerSet& allowed) {
  const std::int64_t lower = allowed.FindAtLeast(zorhost::Lower(*this));
  const std::int64_t upper = allowed.FindAtMost(zorhost::Upper(*this));
  if (mState == kNil || (mState == kExact && lower == upper)) return 0;
  if (lower < upper) return 0;
  if (lower == upper) {
    SetExactValue(static_cast<ZORLong>(lower));
  } else {
    SetNilValue();
  }
  return 1;
}

void ZORVadSingleInteger::Join(const ZORVaDoInteger& other) {
  if (zorhost::Lower(other) != mValue || zorhost::Upper(other) != mValue) SetUndefinedValue();
}

void ZORVadSingleInteger::PrintKnown(ZORostrstream& out) const { zorhost::PrintNumber(out, mValue); }

void ZORVadSingleInteger::InputKnown(ZORistrstream& in) {
  if (const auto value = zorhost::ReadNumber(in)) SetExactValue(*value);
}

void ZORVadSingleInteger::WriteKnown(ZORopstream& out) const { out << mValue; }

void ZORVadSingleInteger::ReadKnown(ZORipstream& in) {
  ZORLong value;
  in >> value;
  SetExactValue(value);
}
