// What a set of texts is: its statics, construction, copies and states.
#include <algorithm>

#include "enum/entries.h"
#include "module/characters.h"
#include "module/classdefinition.h"

ZOR_DEFINE_STRING_CLASS(ZORVadEnumString, ZORVaDoString, "enum string", ZORVaDoString::sDescriptor, 1);

namespace {

constexpr unsigned int kPlaces = 20;  // places of a new value, and the step in which its vector grows by itself

}  // namespace

ZORVadEnumString* ZORVadEnumString::Build(ZORStreamable* object) {
  return static_cast<ZORVadEnumString*>(zor::BuildForRead<ZORVadEnumString>(object));
}

ZORVadEnumString::ZORVadEnumString(ZORStringStateTag state) : mVector(kPlaces, kPlaces) { mState = state; }

// A set to be filled, with places for as many candidates as it can hold.
ZORVadEnumString::ZORVadEnumString(std::size_t candidates)
    : mVector(static_cast<unsigned int>(std::min(candidates, zor::kSetLimit)), kPlaces) {
  mState = ZorStringNil;
}

ZORVadEnumString::ZORVadEnumString() : ZORVadEnumString(ZorStringAny) {}
ZORVadEnumString::ZORVadEnumString(const ZORVadEnumString& other) : ZORVadEnumString(other.mState) { Append(other); }
ZORVadEnumString::ZORVadEnumString(const ZORVadSingleString& other) : ZORVadEnumString() { Copy(other); }
ZORVadEnumString::ZORVadEnumString(const ZORString& text) : ZORVadEnumString(ZorStringExact) { StoreLast(text); }
ZORVadEnumString::ZORVadEnumString(const void* text) : ZORVadEnumString(ZORString(static_cast<const char*>(text))) {}

ZORVadEnumString::ZORVadEnumString(ZORStreamableInit) : ZORVaDoString(ZorStreamableInit), mVector(kPlaces, kPlaces) {}

ZORVadEnumString::~ZORVadEnumString() { Flush(); }

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

void ZORVadEnumString::Flush() {
  if (mVector.Count() > 0) mVector.Flush(1);
}

int ZORVadEnumString::Become(ZORStringStateTag state) {
  Flush();
  mState = state;
  return 1;
}

int ZORVadEnumString::Become(ZORStringStateTag state, const ZORString& text) {
  auto* const copy = new ZORString(text);  // before the flush: text may be one of ours
  Become(state);
  Store(copy, 0);
  return 1;
}

// Takes over the state and the texts, which leaves from with those that were here.
int ZORVadEnumString::Take(ZORVadEnumString& from) {
  mVector.Swap(from.mVector);
  mState = from.mState;
  return 1;
}

void ZORVadEnumString::SetNilValue() { Become(ZorStringNil); }
void ZORVadEnumString::SetUndefinedValue() { Become(ZorStringAny); }

int ZORVadEnumString::IsEmpty() const { return mState == ZorStringExact && mVector.Count() == 1 && First() == ""; }
int ZORVadEnumString::IsFull() const { return mState == ZorStringMax && mVector.Count() == 0; }

unsigned long ZORVadEnumString::GetCardinality() const {
  if (IsNil()) return 0;
  if (IsUndefined()) return 256;
  return mVector.Count();
}

void ZORVadEnumString::Assign(const ZORVaDoAny& other) {
  zor::GuardedOrNil<Enum, Single>(*this, other, [&](auto& string) { return Copy(string); });
}
