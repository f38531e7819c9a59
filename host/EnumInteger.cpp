#include <algorithm>
#include <utility>

#include "host/IntegerSet.h"
#include "host/NumberText.h"
#include "host/ZORNumbers.h"

std::vector<ZORLong>::const_iterator ZORSVectorImp_SubIntBase::FindLowerBound(std::int64_t value) const {
  return std::lower_bound(mValues.begin(), mValues.end(), value);
}

void ZORSVectorImp_SubIntBase::Insert(ZORLong value) {
  const auto place = FindLowerBound(value);
  if (place == mValues.end() || *place != value) mValues.insert(place, value);
}

ZORVadEnumInteger::ZORVadEnumInteger() = default;
ZORVadEnumInteger::ZORVadEnumInteger(ZORStreamableInit) {}

void ZORVadEnumInteger::SetNilValue() {
  mAny = false;
  mValues.Flush();
}

void ZORVadEnumInteger::SetUndefinedValue() {
  mAny = true;
  mValues.Flush();
}

int ZORVadEnumInteger::IsNil() const { return !mAny && mValues.Count() == 0; }
int ZORVadEnumInteger::IsUndefined() const { return mAny; }
unsigned long ZORVadEnumInteger::GetCardinality() const { return mAny ? zorhost::kAllNumbers : mValues.Count(); }

void ZORVadEnumInteger::Insert(ZORLong value) {
  if (mAny) return;
  mValues.Insert(value);
  if (mValues.Count() > kListLimit) SetUndefinedValue();
}

int ZORVadEnumInteger::Intersect(const ZORVadEnumInteger& other) { return CalcEqualValue(other); }
int ZORVadEnumInteger::IntersectInverse(ZORVadSingleInteger& target) const { return target.CalcEqualValue(*this); }
int ZORVadEnumInteger::IntersectInverse(ZORVadIntervalInteger& target) const { return target.CalcEqualValue(*this); }

std::int64_t ZORVadEnumInteger::FindAtLeast(std::int64_t value) const {
  if (mAny) return zorhost::kEveryNumber.FindAtLeast(value);
  const auto place = mValues.FindLowerBound(value);
  return place != mValues.end() ? *place : ZORIntegerSet::kAbove;
}

std::int64_t ZORVadEnumInteger::FindAtMost(std::int64_t value) const {
  if (mAny) return zorhost::kEveryNumber.FindAtMost(value);
  const auto place = mValues.FindLowerBound(value + 1);
  return place != mValues.begin() ? *(place - 1) : ZORIntegerSet::kBelow;
}

int ZORVadEnumInteger::Keep(const ZORIntegerSet& allowed) {
  if (mAny) return List(allowed);
  ZORSVectorImp_SubIntBase kept;
  for (const ZORLong value : mValues) {
    if (allowed.Holds(value)) kept.Insert(value);
  }
  const bool changed = kept.Count() != mValues.Count();
  mValues = std::move(kept);
  return changed;
}

// Undefined becomes the allowed numbers, if the list can hold them.
int ZORVadEnumInteger::List(const ZORIntegerSet& allowed) {
  ZORSVectorImp_SubIntBase listed;
  for (std::int64_t value = ZORIntegerSet::kLeast;; ++value) {
    value = allowed.FindAtLeast(value);
    if (value > ZORIntegerSet::kGreatest) break;
    if (listed.Count() == kListLimit) return 0;
    listed.Insert(static_cast<ZORLong>(value));
  }
  mAny = false;
  mValues = std::move(listed);
  return 1;
}

void ZORVadEnumInteger::Join(const ZORVaDoInteger& other) {
  ZORVadEnumInteger listed;
  listed.Assign(other);
  if (listed.mAny) return SetUndefinedValue();
  for (const ZORLong value : listed.mValues) Insert(value);
}

void ZORVadEnumInteger::PrintKnown(ZORostrstream& out) const {
  const char* before = "{ ";
  for (const ZORLong value : mValues) {
    zorhost::PrintNumber(out << before, value);
    before = ", ";
  }
  out << " }";
}

void ZORVadEnumInteger::InputKnown(ZORistrstream& in) {
  char c;
  in >> c;
  if (c != '{') return;
  do {
    const auto value = zorhost::ReadNumber(in >> ws);
    if (!value) return SetNilValue();
    Insert(*value);
    in >> ws >> c;
  } while (c == ',');
  if (c != '}') SetNilValue();
}

void ZORVadEnumInteger::WriteKnown(ZORopstream& out) const {
  out << static_cast<ZORLong>(mValues.Count());
  for (const ZORLong value : mValues) out << value;
}

void ZORVadEnumInteger::ReadKnown(ZORipstream& in) {
  ZORLong count, value;
  in >> count;
  for (; count > 0 && !in.Fail(); --count) {
    in >> value;
    Insert(value);
  }
}
