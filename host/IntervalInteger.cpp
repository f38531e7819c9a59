#include <algorithm>

#include "host/IntegerSet.h"
#include "host/NumberText.h"
#include "host/ZORNumbers.h"

namespace {

constexpr auto kLeast = ZORIntegerSet::kLeast;
constexpr auto kGreatest = ZORIntegerSet::kGreatest;

}  // namespace

ZORVadIntervalInteger::ZORVadIntervalInteger() = default;
ZORVadIntervalInteger::ZORVadIntervalInteger(ZORStreamableInit) {}
ZORVadIntervalInteger::ZORVadIntervalInteger(ZORLong lower, ZORLong upper) { Become(lower, upper); }

// Every empty interval is stored alike.
void ZORVadIntervalInteger::Become(std::int64_t lower, std::int64_t upper) {
  mLower = lower <= upper ? static_cast<ZORLong>(lower) : 1;
  mUpper = lower <= upper ? static_cast<ZORLong>(upper) : 0;
}

void ZORVadIntervalInteger::SetNilValue() { Become(1, 0); }
void ZORVadIntervalInteger::SetUndefinedValue() { Become(kLeast, kGreatest); }
int ZORVadIntervalInteger::IsNil() const { return mLower > mUpper; }
int ZORVadIntervalInteger::IsUndefined() const { return mLower == kLeast && mUpper == kGreatest; }

unsigned long ZORVadIntervalInteger::GetCardinality() const {
  return IsUndefined() != 0 ? zorhost::kAllNumbers : static_cast<unsigned long>(std::int64_t{mUpper} - mLower + 1);
}

std::int64_t ZORVadIntervalInteger::FindAtLeast(std::int64_t value) const {
  return zorhost::Range(mLower, mUpper).FindAtLeast(value);
}

std::int64_t ZORVadIntervalInteger::FindAtMost(std::int64_t value) const {
  return zorhost::Range(mLower, mUpper).FindAtMost(value);
}

int ZORVadIntervalInteger::Keep(const ZORIntegerSet& allowed) {
  if (IsNil() != 0) return 0;
  const std::int64_t lower = allowed.FindAtLeast(mLower), upper = allowed.FindAtMost(mUpper);
  if (lower == mLower && upper == mUpper) return 0;
  Become(lower, upper);
  return 1;
}

void ZORVadIntervalInteger::Join(const ZORVaDoInteger& other) {
  Become(std::min<std::int64_t>(mLower, zorhost::Lower(other)), std::max<std::int64_t>(mUpper, zorhost::Upper(other)));
}

void ZORVadIntervalInteger::PrintKnown(ZORostrstream& out) const {
  zorhost::PrintNumber(out, mLower);
  if (mLower == mUpper) return;
  out << "..";
  zorhost::PrintNumber(out, mUpper);
}

void ZORVadIntervalInteger::InputKnown(ZORistrstream& in) {
  const auto lower = zorhost::ReadNumber(in);
  if (!lower) return;
  if (in.Peek() != '.') return Become(*lower, *lower);
  in.Ignore();
  if (in.Peek() != '.') return;
  in.Ignore();
  if (const auto upper = zorhost::ReadNumber(in)) Become(*lower, *upper);
}

void ZORVadIntervalInteger::WriteKnown(ZORopstream& out) const { out << mLower << mUpper; }

void ZORVadIntervalInteger::ReadKnown(ZORipstream& in) {
  ZORLong lower, upper;
  in >> lower >> upper;
  Become(lower, upper);
}
