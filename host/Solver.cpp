#include "host/ZORSolver.h"

#include <memory>
#include <new>

#include "host/Descriptors.h"

const char* const ZORVaDoBase::sIdent = "ZORVaDoBase";
const char* const ZORVaDoObject::sIdent = "ZORVaDoObject";
const char* const ZORVaDoAny::sIdent = "ZORVaDoAny";
const char* const ZORVaDoScalar::sIdent = "ZORVaDoScalar";
const char* const ZORVaDoObjectDescriptor::sIdent = "ZORVaDoObjectDescriptor";

void* ZORVaDoBase::operator new(std::size_t size) noexcept { return ::operator new(size, std::nothrow); }
void ZORVaDoBase::operator delete(void* memory) noexcept { ::operator delete(memory); }

// Only the record tells whether a class derives from ZORVaDoBase.
ZORVaDoBase* ZORVaDoBase::FromStream(ZORStreamable* object) {
  if (object == nullptr) return nullptr;
  const ZORStreamableClass* const record = ZORStreamableClass::Find(object->CastableID());
  if (record == nullptr || record->Kind() != ZORStreamableClass::kSolverClass) return nullptr;
  return static_cast<ZORVaDoBase*>(object);
}

int ZORVaDoBase::IsDerivedFrom(const char* ident) const { return ident == sIdent; }
ZOR_DEFINE_DERIVATION(ZORVaDoObject, ZORVaDoBase);
ZOR_DEFINE_DERIVATION(ZORVaDoAny, ZORVaDoObject);
ZOR_DEFINE_DERIVATION(ZORVaDoScalar, ZORVaDoAny);
ZOR_DEFINE_DERIVATION(ZORVaDoObjectDescriptor, ZORVaDoBase);

ZORVaDoObject::~ZORVaDoObject() = default;
const ZORVaDoObjectDescriptor* ZORVaDoObject::GetDescriptor() const { return nullptr; }
void ZORVaDoObject::Activate(ZORVaDoNetwork*) {}
void ZORVaDoObject::ActivateByArgument(unsigned int, std::int64_t, ZORVaDoNetwork*) {}

ZORVaDoObject::FilterResult ZORVaDoObject::Filter(const ZORVaDoObjectEnvironment&, std::int64_t) {
  return ZorFilterUnchanged;
}

void ZORVaDoObject::PrintOn(ZORostrstream& out) const { out << CastableID(); }
void ZORVaDoObject::InputValue(ZORistrstream&) {}

double ZORVaDoAny::GetWidth() const { return static_cast<double>(GetCardinality()); }
double ZORVaDoAny::GetRelativeWidth(double whole) const { return whole > 0 ? GetWidth() / whole : 0; }

ZORVaDoObjectDescriptor::ZORVaDoObjectDescriptor(const ZORString& name, const ZORVaDoObjectDescriptor* parent, int flag)
    : mName(name), mParent(parent), mFlag(flag) {
  ZORVaDoModule::Adopt(*this);
}

ZORVaDoObjectDescriptor::ZORVaDoObjectDescriptor(ZORStreamableInit) {}

ZORVaDoObjectDescriptor::~ZORVaDoObjectDescriptor() {
  if (mOwner != nullptr) mOwner->Forget(*this);
}

void ZORVaDoObjectDescriptor::Write(ZORopstream& out) const {
  out.WriteString(mName.CastToCharPtr());
  out << mFlag;
  out.WriteObjectPointer(mParent);
}

void ZORVaDoObjectDescriptor::Read(ZORipstream& in) {
  const std::unique_ptr<char[]> name(in.ReadString());
  mName = ZORString(name.get());
  in >> mFlag;
  ZORStreamable* const parent = in.ReadObjectPointer();
  const ZORVaDoBase* const base = FromStream(parent);
  mParent = IsKindOf(base, sIdent) ? static_cast<const ZORVaDoObjectDescriptor*>(base) : nullptr;
  if (mParent != nullptr && IsMatched(mParent) != 0) mParent = nullptr;  // a type cannot be its own ancestor
  if (mParent != parent) in.SetFail();
}

void ZORVaDoObjectDescriptor::DestroyObject(ZORVaDoObject* object) const {
  if (object != nullptr) object->~ZORVaDoObject();
}

unsigned int ZORVaDoObjectDescriptor::GetNumberOfArguments() const { return 0; }
std::int64_t ZORVaDoObjectDescriptor::GetArgumentsSize() const { return 0; }

int ZORVaDoObjectDescriptor::IsMatched(const ZORVaDoObjectDescriptor* other) const {
  while (other != nullptr && other != this) other = other->mParent;
  return other != nullptr;
}

void ZORVaDoObjectDescriptor::PrintOn(ZORostrstream& out) const { out << mName.CastToCharPtr(); }

namespace {

constexpr char kScalarDescriptorIdent[] = "ZORVaDoScalar_Descriptor";
using ScalarDescriptor = zorhost::HostDescriptor<ZORVaDoScalar, kScalarDescriptorIdent>;

const ScalarDescriptor kScalar(ZORString("scalar"), nullptr, 1);
const ZORStreamableClass kScalarDescriptorRecord(kScalarDescriptorIdent, zor::BuildForRead<ScalarDescriptor>,
                                                 ZORStreamableClass::kSolverClass);

}  // namespace

// Constant-initialised, since it is only an address: valid before any static object is built.
const ZORVaDoObjectDescriptor* const ZORVaDoScalar::sDescriptor = &kScalar;
