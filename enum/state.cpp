// Statics, construction, copies and states of sets of texts.
#include <utility>

#include "enum/entries.h"
#include "module/characters.h"
#include "module/classdefinition.h"
#include "module/readiness.h"
#include "module/valuetypes.h"

ZOR_DEFINE_STRING_CLASS(ZORVadEnumString, ZORVaDoString, "enum string", ZORVaDoString::sDescriptor, 1);

const ZORVaDoObjectDescriptor* zor::MakeEnumDescriptor() { return ZORVadEnumString::MakeDescriptor(); }

ZORVadEnumString* ZORVadEnumString::Build(ZORStreamable* object) {
  return static_cast<ZORVadEnumString*>(zor::BuildForRead<ZORVadEnumString>(object));
}

ZORVadEnumString::ZORVadEnumString(ZORStringStateTag state) {
  zor::CheckReadiness();
  mState = state;
}

ZORVadEnumString::ZORVadEnumString() : ZORVadEnumString(ZorStringAny) {}
ZORVadEnumString::ZORVadEnumString(const ZORVadEnumString& other) : ZORVadEnumString(other.mState) { Append(other); }
ZORVadEnumString::ZORVadEnumString(const ZORVadSingleString& other) : ZORVadEnumString() { Copy(other); }
ZORVadEnumString::ZORVadEnumString(const ZORString& text) : ZORVadEnumString(ZorStringExact) {
  mTexts.Insert(ZORString(text));
}
ZORVadEnumString::ZORVadEnumString(const void* text) : ZORVadEnumString(ZORString(static_cast<const char*>(text))) {}
ZORVadEnumString::ZORVadEnumString(ZORStreamableInit) : ZORVaDoString(ZorStreamableInit) {}

ZORVadEnumString::~ZORVadEnumString() = default;

ZORVadEnumString& ZORVadEnumString::operator=(const ZORVadEnumString& other) {
  Copy(other);
  return *this;
}

int ZORVadEnumString::Assign(const ZORVadEnumString& other) { return Copy(other), 1; }
int ZORVadEnumString::Assign(const ZORVadSingleString& other) { return Copy(other); }

int ZORVadEnumString::Copy(const ZORVadEnumString& other) {
  if (&other == this) return Count() > 0 ? 1 : 0;
  Become(other.mState);
  return Append(other);
}

int ZORVadEnumString::Copy(const ZORVadSingleString& other) {
  if (other.GetState() != ZorStringExact) return Become(other.GetState());
  return Become(ZorStringExact, other.GetLowerBound());
}

int ZORVadEnumString::Become(ZORStringStateTag state) {
  mTexts.Clear();
  mState = state;
  return 1;
}

int ZORVadEnumString::Become(ZORStringStateTag state, const ZORString& text) {
  ZORString own(text);  // text may be one of those that are deleted
  Become(state);
  mTexts.Insert(std::move(own));
  return 1;
}

int ZORVadEnumString::Become(ZORStringStateTag state, Texts&& texts) {
  mTexts.Swap(texts);
  mState = state;
  return 1;
}

void ZORVadEnumString::SetNilValue() { Become(ZorStringNil); }
void ZORVadEnumString::SetUndefinedValue() { Become(ZorStringAny); }

int ZORVadEnumString::IsEmpty() const {
  return mState == ZorStringExact && mTexts.Count() == 1 && mTexts.First() == "";
}
int ZORVadEnumString::IsFull() const { return mState == ZorStringMax && mTexts.Count() == 0; }

unsigned long ZORVadEnumString::GetCardinality() const {
  if (IsNil()) return 0;
  if (IsUndefined()) return zor::kSetLimit;
  return mTexts.Count();
}

void ZORVadEnumString::Assign(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Enum, Single>(*this, other, [&](auto& string) { return Copy(string); });
}
