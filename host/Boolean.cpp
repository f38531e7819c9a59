// There are two truth values, so an operation tries them all and keeps those with a support in its relation.
#include "host/Guard.h"
#include "host/NumberText.h"
#include "host/ZORNumbers.h"

namespace {

constexpr char kFalseWord[] = "false";
constexpr char kTrueWord[] = "true";

template <class... Args>
int Guarded(Args&&... args) {
  return zor::Guarded<ZORVadSingleBoolean>(args...);
}

// A set of truth values: bit 0 is false, bit 1 is true.
template <class Test>
unsigned Where(Test test) {
  return (test(false) ? 1u : 0u) | (test(true) ? 2u : 0u);
}

template <class Test>
bool Some(unsigned truths, Test test) {
  return (truths & Where(test)) != 0;
}

template <class Relation>
unsigned Supported(unsigned x, Relation holds) {
  return Where([&](bool a) { return Some(x, [&](bool b) { return holds(a, b); }); });
}

template <class Relation>
unsigned Supported(unsigned x, unsigned y, Relation holds) {
  return Where(
      [&](bool a) { return Some(x, [&](bool b) { return Some(y, [&](bool c) { return holds(a, b, c); }); }); });
}

template <class Relation>
int CalcRelation(unsigned x, unsigned y, ZORVaDoBoolean& result, Relation holds) {
  const bool canBeFalse = (x & Supported(y, [&](bool a, bool b) { return !holds(a, b); })) != 0;
  const bool canBeTrue = (x & Supported(y, holds)) != 0;
  return result.CalcOutcome(canBeFalse, canBeTrue);
}

bool Equal(bool a, bool b) { return a == b; }
bool Unequal(bool a, bool b) { return a != b; }
bool Less(bool a, bool b) { return !a && b; }
bool LessOrEqual(bool a, bool b) { return !a || b; }
bool Greater(bool a, bool b) { return Less(b, a); }
bool GreaterOrEqual(bool a, bool b) { return LessOrEqual(b, a); }

}  // namespace

bool ZORVaDoBoolean::CanBe(bool truth) const {
  ZORVadSingleBoolean one;
  truth ? one.CalcTrueValue() : one.CalcFalseValue();
  return IsIntersected(one) != 0;
}

int ZORVaDoBoolean::CalcOutcome(bool canBeFalse, bool canBeTrue) {
  if (canBeFalse && canBeTrue) return 0;
  if (canBeFalse) return CalcFalseValue();
  if (canBeTrue) return CalcTrueValue();
  if (IsNil() != 0) return 0;
  SetNilValue();
  return 1;
}

int ZORVadSingleBoolean::Keep(unsigned truths) {
  const unsigned before = mTruths;
  mTruths &= truths;
  return mTruths != before;
}

void ZORVadSingleBoolean::Assign(const ZORVaDoAny& other) {
  const auto* boolean = DynamicCast(&other);
  mTruths = boolean != nullptr ? boolean->mTruths : kNone;
}

void ZORVadSingleBoolean::SetNilValue() { mTruths = kNone; }
void ZORVadSingleBoolean::SetUndefinedValue() { mTruths = kEither; }
int ZORVadSingleBoolean::IsNil() const { return mTruths == kNone; }
int ZORVadSingleBoolean::IsUndefined() const { return mTruths == kEither; }

int ZORVadSingleBoolean::IsIntersected(const ZORVaDoAny& other) const {
  return Guarded(other, [&](auto& y) { return (mTruths & y.mTruths) != 0; });
}

void ZORVadSingleBoolean::Intersect(const ZORVaDoAny& other) {
  const auto* boolean = DynamicCast(&other);
  Keep(boolean != nullptr ? boolean->mTruths : kNone);
}

void ZORVadSingleBoolean::Unite(const ZORVaDoAny& other) {
  const auto* boolean = DynamicCast(&other);
  mTruths = boolean != nullptr ? mTruths | boolean->mTruths : kNone;
}

unsigned long ZORVadSingleBoolean::GetCardinality() const { return mTruths == kEither ? 2 : mTruths != kNone; }

void ZORVadSingleBoolean::Bisect(ZORVaDoObject& other, ValueSelection selection) {
  auto* rest = DynamicCast(&other);
  if (rest == nullptr || rest == this || selection < ZorSelectLeast || selection > ZorSelectUpperHalf) return;
  if (mTruths != kEither) return rest->SetNilValue();
  mTruths = selection == ZorSelectLeast || selection == ZorSelectLowerHalf ? kFalse : kTrue;
  rest->mTruths = kEither & ~mTruths;
}

int ZORVadSingleBoolean::CalcFalseValue() { return Keep(kFalse); }
int ZORVadSingleBoolean::CalcTrueValue() { return Keep(kTrue); }
int ZORVadSingleBoolean::CalcMinValue() { return CalcFalseValue(); }
int ZORVadSingleBoolean::CalcMaxValue() { return CalcTrueValue(); }

int ZORVadSingleBoolean::CalcMinValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return Guarded(x, y, [&](auto& p, auto& q) {
    return Keep(Supported(p.mTruths, q.mTruths, [](bool a, bool b, bool c) { return a == (b && c); }));
  });
}

int ZORVadSingleBoolean::CalcMaxValue(const ZORVaDoAny& x, const ZORVaDoAny& y) {
  return Guarded(x, y, [&](auto& p, auto& q) {
    return Keep(Supported(p.mTruths, q.mTruths, [](bool a, bool b, bool c) { return a == (b || c); }));
  });
}

int ZORVadSingleBoolean::CalcFirstInverseMinValue(ZORVaDoAny& target, const ZORVaDoAny& second) const {
  return Guarded(target, second, [&](auto& p, auto& q) {
    return p.Keep(Supported(mTruths, q.mTruths, [](bool a, bool b, bool c) { return b == (a && c); }));
  });
}

int ZORVadSingleBoolean::CalcFirstInverseMaxValue(ZORVaDoAny& target, const ZORVaDoAny& second) const {
  return Guarded(target, second, [&](auto& p, auto& q) {
    return p.Keep(Supported(mTruths, q.mTruths, [](bool a, bool b, bool c) { return b == (a || c); }));
  });
}

int ZORVadSingleBoolean::CalcEqualValue(const ZORVaDoAny& other) {
  return Guarded(other, [&](auto& y) { return Keep(Supported(y.mTruths, Equal)); });
}

int ZORVadSingleBoolean::CalcInverseEqualValue(ZORVaDoAny& target) const {
  return Guarded(target, [&](auto& y) { return y.Keep(Supported(mTruths, Equal)); });
}

int ZORVadSingleBoolean::CalcUnequalValue(const ZORVaDoAny& other) {
  return Guarded(other, [&](auto& y) { return Keep(Supported(y.mTruths, Unequal)); });
}

int ZORVadSingleBoolean::CalcInverseUnequalValue(ZORVaDoAny& target) const {
  return Guarded(target, [&](auto& y) { return y.Keep(Supported(mTruths, Unequal)); });
}

int ZORVadSingleBoolean::CalcLessOrEqualValue(const ZORVaDoAny& other) {
  return Guarded(other, [&](auto& y) { return Keep(Supported(y.mTruths, LessOrEqual)); });
}

int ZORVadSingleBoolean::CalcInverseLessOrEqualValue(ZORVaDoAny& target) const {
  return Guarded(target, [&](auto& y) { return y.Keep(Supported(mTruths, GreaterOrEqual)); });
}

int ZORVadSingleBoolean::CalcNotLessAndUnequalValue(const ZORVaDoAny& other) {
  return Guarded(other, [&](auto& y) { return Keep(Supported(y.mTruths, Greater)); });
}

int ZORVadSingleBoolean::CalcInverseNotLessAndUnequalValue(ZORVaDoAny& target) const {
  return Guarded(target, [&](auto& y) { return y.Keep(Supported(mTruths, Less)); });
}

int ZORVadSingleBoolean::CalcIsEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const {
  return Guarded(other, [&](auto& y) { return CalcRelation(mTruths, y.mTruths, result, Equal); });
}

int ZORVadSingleBoolean::CalcIsLessOrEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const {
  return Guarded(other, [&](auto& y) { return CalcRelation(mTruths, y.mTruths, result, LessOrEqual); });
}

void ZORVadSingleBoolean::PrintOn(ZORostrstream& out) const {
  const char* const words[] = {zorhost::kNilWord, kFalseWord, kTrueWord, zorhost::kAnyWord};
  out << words[mTruths];
}

void ZORVadSingleBoolean::InputValue(ZORistrstream& in) {
  const std::string word = zorhost::ReadWord(in);
  mTruths = word == kFalseWord ? kFalse : word == kTrueWord ? kTrue : word == zorhost::kAnyWord ? kEither : kNone;
}

void ZORVadSingleBoolean::Write(ZORopstream& out) const { out << static_cast<ZORLong>(mTruths); }

void ZORVadSingleBoolean::Read(ZORipstream& in) {
  ZORLong truths;
  in >> truths;
  if ((static_cast<unsigned>(truths) & ~kEither) != 0) in.SetFail();
  mTruths = in.Fail() ? kNone : static_cast<unsigned>(truths);
}
