// What each string class has of its own: descriptor, record, identity.
#include <cstddef>
#include <memory>

#include "enum/ZORVadEnumString.h"
#include "tests/support/values.h"

using namespace zor::test;
using Single = ZORVadSingleString;
using Sets = ZORVadEnumString;

struct Type {
  const ZORVaDoObjectDescriptor* descriptor;
  std::string ident, name;
  const ZORVaDoObjectDescriptor* parent;
  int flag;
  std::size_t size;
  std::string undefined;  // upper bound
  std::string casts;      // what single, set and integer are taken for: yes or no
  ZORVaDoBase* (*cast)(ZORVaDoBase* object);
};

template <class Class>
ZORVaDoBase* Cast(ZORVaDoBase* object) {
  const ZORVaDoBase* const constant = object;
  EXPECT_EQ(Class::DynamicCast(constant), Class::DynamicCast(object));
  EXPECT_EQ(ZORVaDoBase::IsKindOf(object, Class::CastableIdent), Class::DynamicCast(object) != nullptr);
  const std::string copy = Class::CastableIdent;
  EXPECT_FALSE(ZORVaDoBase::IsKindOf(object, copy.c_str())) << "an equal text elsewhere";
  return Class::DynamicCast(object);
}

// clang-format off
static std::vector<Type> Types() {
  const ZORVaDoObjectDescriptor *scalar = ZORVaDoScalar::sDescriptor, *string = ZORVaDoString::sDescriptor;
  return {
    {string,              "ZORVaDoString",      "string",        scalar, 1, sizeof(ZORVaDoString), "",        "yyn", Cast<ZORVaDoString>},
    {Single::sDescriptor, "ZORVadSingleString", "single string", string, 0, sizeof(Single),        kAny.text, "ynn", Cast<Single>},
    {Sets::sDescriptor,   "ZORVadEnumString",   "enum string",   string, 1, sizeof(Sets),          kMax.text, "nyn", Cast<Sets>},
  };
}
// clang-format on

TEST(Types, TellWhatTheyAre) {
  Single single;
  Sets set;
  ZORVadSingleInteger integer;
  ZORVaDoBase* const objects[] = {&single, &set, &integer};
  for (const Type& type : Types()) {
    SCOPED_TRACE(type.ident);
    EXPECT_EQ(type.descriptor->CastableID(), type.ident + "_Descriptor");
    EXPECT_EQ(Plain(type.descriptor->GetName()), type.name);
    EXPECT_EQ(type.descriptor->GetParent(), type.parent);
    EXPECT_EQ(type.descriptor->GetFlag(), type.flag);
    EXPECT_EQ(type.descriptor->GetObjectSize(), type.size);
    for (int i = 0; i < 3; ++i) EXPECT_EQ(type.cast(objects[i]), type.casts[i] == 'y' ? objects[i] : nullptr) << i;
    EXPECT_EQ(type.cast(nullptr), nullptr);
    const std::unique_ptr<ZORStreamable> descriptor(
        ZORStreamableClass::Find((type.ident + "_Descriptor").c_str())->Build());
    EXPECT_EQ(descriptor->CastableID(), type.ident + "_Descriptor");
  }
  EXPECT_TRUE(ZORVaDoBase::IsKindOf(&set, ZORVaDoScalar::sIdent));
  EXPECT_EQ(ZORVaDoString::sDescriptor->IsMatched(Sets::sDescriptor), 1);
  EXPECT_EQ(Single::sDescriptor->IsMatched(Sets::sDescriptor), 0);
}

// By their descriptor at a place, or by their record for Read. The abstract class makes none.
TEST(Types, MakeAndEndValues) {
  alignas(std::max_align_t) std::byte place[256];
  for (const Type& type : Types()) {
    SCOPED_TRACE(type.ident);
    const bool isAbstract = type.descriptor == ZORVaDoString::sDescriptor;
    ASSERT_LE(type.size, sizeof place);
    EXPECT_EQ(type.descriptor->CreateObject(nullptr), nullptr);
    EXPECT_EQ(type.descriptor->CreateObject(nullptr, "ab"), nullptr);
    for (const char* text : {static_cast<const char*>(nullptr), "ab"}) {
      ZORVaDoObject* const made =
          text != nullptr ? type.descriptor->CreateObject(place, text) : type.descriptor->CreateObject(place);
      EXPECT_EQ(made == nullptr, isAbstract);
      if (made == nullptr) continue;
      ZORVaDoString* const value = ZORVaDoString::DynamicCast(made);
      EXPECT_EQ(static_cast<void*>(value), place);
      EXPECT_EQ(value->GetDescriptor(), type.descriptor);
      EXPECT_EQ(value->CastableID(), type.ident);
      EXPECT_EQ(value->GetState(), text != nullptr ? kExact : kAnyTag);
      EXPECT_EQ(Plain(value->GetUpperBound()), text != nullptr ? text : type.undefined);
      type.descriptor->DestroyObject(value);
    }
    const std::unique_ptr<ZORStreamable> read(ZORStreamableClass::Find(type.ident.c_str())->Build());
    EXPECT_EQ(read != nullptr ? read->CastableID() : "", isAbstract ? "" : type.ident);
  }
  Single single;
  EXPECT_EQ(Single::Build(&single), &single);
}

TEST(Types, MakeTheirDescriptorAnewInEachCall) {
  const auto* const first = Single::sDescriptor;
  const std::unique_ptr<const Single::Descriptor> second(Single::MakeDescriptor());
  EXPECT_NE(second.get(), first);
  EXPECT_EQ(std::exchange(Single::sDescriptor, first), second.get());
}

// What is no single string is null and fails the stream; it stays the reader's to delete.
TEST(Types, PointersToOthersFailTheStream) {
  const Single single("a");
  const Sets set("a");
  for (const ZORStreamable* stored : std::initializer_list<const ZORStreamable*>{nullptr, &single, &set}) {
    ZORopstream out;
    out.WriteObjectPointer(stored);
    ZORipstream in(out.Bytes());
    Single* read = nullptr;
    Single::readPtr(in, read);
    EXPECT_EQ(read != nullptr, stored == &single);
    EXPECT_EQ(in.Fail(), stored == &set);
    for (const ZORStreamable* object : in.Objects()) delete object;
  }
}
