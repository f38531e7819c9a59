// Statics, construction, copies and states of single strings.
#include "host/Guard.h"
#include "module/characters.h"
#include "module/classdefinition.h"
#include "module/readiness.h"
#include "module/valuetypes.h"
#include "single/ZORVadSingleString.h"

ZOR_DEFINE_STRING_CLASS(ZORVadSingleString, ZORVaDoString, "single string", ZORVaDoString::sDescriptor, 0);

const ZORVaDoObjectDescriptor* zor::MakeSingleDescriptor() { return ZORVadSingleString::MakeDescriptor(); }

ZORVadSingleString* ZORVadSingleString::Build(ZORStreamable* object) {
  return static_cast<ZORVadSingleString*>(zor::BuildForRead<ZORVadSingleString>(object));
}

ZORVadSingleString::ZORVadSingleString() : mText(ZorVaDoStringAny) {
  zor::CheckReadiness();
  mState = ZorStringAny;
}

ZORVadSingleString::ZORVadSingleString(const ZORString& text) : mText(text) {
  zor::CheckReadiness();
  mState = ZorStringExact;
}

ZORVadSingleString::ZORVadSingleString(const void* text) : mText(static_cast<const char*>(text)) {
  zor::CheckReadiness();
  mState = ZorStringExact;
}

ZORVadSingleString::ZORVadSingleString(const ZORVadSingleString& other) : ZORVaDoString(other) { Copy(other); }

ZORVadSingleString::ZORVadSingleString(ZORStreamableInit) : ZORVaDoString(ZorStreamableInit) {}

ZORVadSingleString::~ZORVadSingleString() = default;

ZORVadSingleString& ZORVadSingleString::operator=(const ZORVadSingleString& other) {
  Copy(other);
  return *this;
}

ZORVadSingleString& ZORVadSingleString::operator=(const char* text) {
  Become(ZorStringExact, text);
  return *this;
}

int ZORVadSingleString::Assign(const ZORVadSingleString& other) {
  Copy(other);
  return 1;
}

int ZORVadSingleString::Copy(const ZORVadSingleString& other) {
  mState = other.mState;
  if (other.IsUndefined() || other.IsNil()) return 0;
  mText = other.mText;
  return 1;
}

int ZORVadSingleString::Copy(const ZORString& text) { return Become(ZorStringExact, text); }

int ZORVadSingleString::Become(ZORStringStateTag state, const ZORString& text) {
  mText = text;
  mState = state;
  return 1;
}

void ZORVadSingleString::SetNilValue() { Become(ZorStringNil, ZorVaDoStringNil); }
void ZORVadSingleString::SetUndefinedValue() { Become(ZorStringAny, ZorVaDoStringAny); }

int ZORVadSingleString::IsEmpty() const { return mState == ZorStringExact && mText == ZorVaDoStringMin; }

unsigned long ZORVadSingleString::GetCardinality() const {
  if (IsNil()) return 0;
  if (IsUndefined()) return zor::kLengthLimit;
  return 1;
}

void ZORVadSingleString::Assign(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Single>(*this, other, [&](auto& single) { return Copy(single); });
}
