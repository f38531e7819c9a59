#include "module/ZORVaDoString.h"

#include <optional>

#include "host/Guard.h"
#include "module/characters.h"
#include "module/classdefinition.h"

ZORString ZORVaDoString::ZorVaDoStringMin;
ZORString ZORVaDoString::ZorVaDoStringMax;
ZORString ZORVaDoString::ZorVaDoStringNil;
ZORString ZORVaDoString::ZorVaDoStringAny;

ZOR_DEFINE_STRING_CLASS(ZORVaDoString, ZORVaDoScalar, "string", ZORVaDoScalar::sDescriptor, 1);

namespace {

int ToUndefined(ZORVaDoBoolean& result) {
  if (result.IsUndefined()) return 0;
  result.SetUndefinedValue();
  return 1;
}

int ToNil(ZORVaDoBoolean& result) {
  if (result.IsNil()) return 0;
  result.SetNilValue();
  return 1;
}

bool AreAtOneExtreme(const ZORVaDoString& a, const ZORVaDoString& b) {
  return (a.IsEmpty() && b.IsEmpty()) || (a.IsFull() && b.IsFull());
}

// Whether a < b follows from one of them being the least or the greatest value; both are not the same extreme.
std::optional<bool> IsLessByExtreme(const ZORVaDoString& a, const ZORVaDoString& b) {
  if (b.IsFull()) return true;
  if (a.IsEmpty()) return true;
  if (a.IsFull()) return false;
  if (b.IsEmpty()) return false;
  return std::nullopt;
}

int ToTruth(ZORVaDoBoolean& result, bool truth) { return truth ? result.CalcTrueValue() : result.CalcFalseValue(); }

// Whether both values are known and have the same text.
bool AreOneText(const ZORVaDoString& a, const ZORVaDoString& b) {
  const ZORString text = a.GetLowerBound();
  return text == a.GetUpperBound() && text == b.GetLowerBound() && text == b.GetUpperBound();
}

}  // namespace

ZORVaDoString::ZORVaDoString(ZORStreamableInit) : ZORVaDoScalar(ZorStreamableInit) {}
ZORVaDoString::ZORVaDoString(const ZORVaDoString& other) : ZORVaDoScalar(), mState(other.mState) {}
ZORVaDoString::~ZORVaDoString() = default;

ZORVaDoString& ZORVaDoString::operator=(const ZORVaDoString& other) {
  mState = other.mState;
  return *this;
}

int ZORVaDoString::Nil() {
  if (IsNil()) return 0;
  SetNilValue();
  return 1;
}

int ZORVaDoString::Any() {
  if (IsUndefined()) return 0;
  SetUndefinedValue();
  return 1;
}

int ZORVaDoString::MeetLeast() { return IsEmpty() || IsUndefined() ? CalcMinValue() : Nil(); }
int ZORVaDoString::MeetGreatest() { return IsFull() || IsUndefined() ? CalcMaxValue() : Nil(); }

int ZORVaDoString::CalcEmptyValue() { return CalcMinValue(); }
int ZORVaDoString::CalcFullValue() { return CalcMaxValue(); }

int ZORVaDoString::CalcUnequalValue(const ZORVaDoAny& other) {
  if (IsNil()) return 0;
  if (zor::IsUndefined(other)) return 0;
  if (zor::IsNil(other)) return Nil();
  const ZORVaDoString* const string = DynamicCast(&other);
  if (string == nullptr) return 0;
  const ZORString text = string->GetLowerBound();
  if (text == string->GetUpperBound()) return RemoveExactValue(text) != 0 ? 1 : 0;
  return 0;
}

int ZORVaDoString::CalcInverseUnequalValue(ZORVaDoAny& target) const {
  return zor::IsPresent(target) ? target.CalcUnequalValue(*this) : 0;
}

int ZORVaDoString::CalcIsEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const {
  if (IsUndefined() || zor::IsUndefined(other)) return ToUndefined(result);
  if (IsNil() || zor::IsNil(other)) return ToNil(result);
  const ZORVaDoString* const string = DynamicCast(&other);
  if (string == nullptr) return ToNil(result);
  if (AreAtOneExtreme(*this, *string)) return result.CalcTrueValue();
  if (IsEmpty() || IsFull() || string->IsEmpty() || string->IsFull()) return result.CalcFalseValue();
  if (!IsIntersected(other)) return result.CalcFalseValue();
  if (AreOneText(*this, *string)) return result.CalcTrueValue();
  return 0;
}

int ZORVaDoString::CalcIsLessOrEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const {
  if (IsUndefined() || zor::IsUndefined(other)) return ToUndefined(result);
  if (IsNil() || zor::IsNil(other)) return ToNil(result);
  const ZORVaDoString* const string = DynamicCast(&other);
  if (string == nullptr) return ToNil(result);
  if (AreAtOneExtreme(*this, *string)) return result.CalcTrueValue();
  if (const auto isLess = IsLessByExtreme(*this, *string)) return ToTruth(result, *isLess);
  if (GetUpperBound() <= string->GetLowerBound()) return result.CalcTrueValue();
  if (GetLowerBound() > string->GetUpperBound()) return result.CalcFalseValue();
  return 0;
}

int ZORVaDoString::CalcIsLess(const ZORVaDoScalar& other, ZORVaDoBoolean& result) const {
  const ZORVaDoString* const string = DynamicCast(&other);
  if (string == nullptr) return ToNil(result);
  if (IsUndefined() || string->IsUndefined()) return ToUndefined(result);
  if (IsNil() || string->IsNil()) return ToNil(result);
  if (AreAtOneExtreme(*this, *string)) return result.CalcFalseValue();
  if (const auto isLess = IsLessByExtreme(*this, *string)) return ToTruth(result, *isLess);
  if (GetUpperBound() < string->GetLowerBound()) return result.CalcTrueValue();
  if (GetLowerBound() >= string->GetUpperBound()) return result.CalcFalseValue();
  return 0;
}
