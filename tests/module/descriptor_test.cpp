// Descriptors, records and the type tests of the string classes.
#include <cstddef>
#include <initializer_list>
#include <memory>
#include <vector>

#include "enum/ZORVadEnumString.h"
#include "tests/support/values.h"

using namespace zor::test;

struct Type {
  const ZORVaDoObjectDescriptor* descriptor;
  const char *ident, *descriptorIdent, *name;
  const ZORVaDoObjectDescriptor* parent;
  int flag;
  std::size_t size;
  std::string undefined;  // upper bound
};

// clang-format off
static std::vector<Type> Types() {
  const ZORVaDoObjectDescriptor *scalar = ZORVaDoScalar::sDescriptor, *string = ZORVaDoString::sDescriptor;
  return {
    {string, "ZORVaDoString", "ZORVaDoString_Descriptor", "string", scalar, 1, sizeof(ZORVaDoString), ""},
    {ZORVadSingleString::sDescriptor, "ZORVadSingleString", "ZORVadSingleString_Descriptor", "single string", string, 0,
     sizeof(ZORVadSingleString), kAny.text},
    {ZORVadEnumString::sDescriptor, "ZORVadEnumString", "ZORVadEnumString_Descriptor", "enum string", string, 1,
     sizeof(ZORVadEnumString), kMax.text},
  };
}
// clang-format on

TEST(Descriptors, WhatTheyTell) {
  for (const Type& type : Types()) {
    EXPECT_STREQ(type.descriptor->CastableID(), type.descriptorIdent);
    EXPECT_EQ(Plain(type.descriptor->GetName()), type.name);
    EXPECT_EQ(type.descriptor->GetParent(), type.parent) << type.name;
    EXPECT_EQ(type.descriptor->GetFlag(), type.flag) << type.name;
    EXPECT_EQ(type.descriptor->GetObjectSize(), type.size) << type.name;
  }
  EXPECT_EQ(ZORVaDoString::sDescriptor->IsMatched(ZORVadEnumString::sDescriptor), 1);
  EXPECT_EQ(ZORVadSingleString::sDescriptor->IsMatched(ZORVadEnumString::sDescriptor), 0);
}

TEST(Descriptors, MakeAndEndValues) {
  alignas(std::max_align_t) std::byte place[256];
  for (const Type& type : Types()) {
    SCOPED_TRACE(type.ident);
    ASSERT_LE(type.size, sizeof place);
    EXPECT_EQ(type.descriptor->CreateObject(nullptr), nullptr);
    EXPECT_EQ(type.descriptor->CreateObject(nullptr, "ab"), nullptr);
    for (const char* text : {static_cast<const char*>(nullptr), "ab"}) {
      ZORVaDoObject* const made =
          text ? type.descriptor->CreateObject(place, text) : type.descriptor->CreateObject(place);
      if (type.descriptor == ZORVaDoString::sDescriptor) {
        EXPECT_EQ(made, nullptr);
        continue;
      }
      ZORVaDoString* const value = ZORVaDoString::DynamicCast(made);
      EXPECT_EQ(static_cast<void*>(value), place);
      EXPECT_EQ(value->GetDescriptor(), type.descriptor);
      EXPECT_STREQ(value->CastableID(), type.ident);
      EXPECT_EQ(value->GetState(), text != nullptr ? kExact : kAnyTag);
      EXPECT_EQ(Plain(value->GetUpperBound()), text != nullptr ? text : type.undefined);
      type.descriptor->DestroyObject(value);
    }
  }
}

TEST(Descriptors, RecordsMakeObjectsForRead) {
  for (const Type& type : Types()) {
    const std::unique_ptr<ZORStreamable> value(ZORStreamableClass::Find(type.ident)->Build());
    const std::unique_ptr<ZORStreamable> descriptor(ZORStreamableClass::Find(type.descriptorIdent)->Build());
    EXPECT_EQ(value == nullptr, type.descriptor == ZORVaDoString::sDescriptor) << "the abstract class makes none";
    EXPECT_STREQ(value != nullptr ? value->CastableID() : type.ident, type.ident);
    EXPECT_STREQ(descriptor->CastableID(), type.descriptorIdent);
  }
  ZORVadSingleString single;
  EXPECT_EQ(ZORVadSingleString::Build(&single), &single);
}

TEST(Descriptors, MadeAnewByEachCall) {
  const auto* const first = ZORVadSingleString::sDescriptor;
  const std::unique_ptr<const ZORVadSingleString::Descriptor> second(ZORVadSingleString::MakeDescriptor());
  EXPECT_NE(second.get(), first);
  EXPECT_EQ(ZORVadSingleString::sDescriptor, second.get());
  ZORVadSingleString::sDescriptor = first;
}

// What is no single string is null and fails the stream; it stays the reader's to delete.
TEST(Descriptors, PointersToOtherClassesFailTheStream) {
  const ZORVadSingleString single("a");
  const ZORVadEnumString set("a");
  for (const ZORStreamable* stored : std::initializer_list<const ZORStreamable*>{nullptr, &single, &set}) {
    ZORopstream out;
    out.WriteObjectPointer(stored);
    ZORipstream in(out.Bytes());
    ZORVadSingleString* read = nullptr;
    ZORVadSingleString::readPtr(in, read);
    EXPECT_EQ(read != nullptr, stored == &single);
    EXPECT_EQ(in.Fail(), stored == &set);
    for (const ZORStreamable* object : in.Objects()) delete object;
  }
}

TEST(TypeTests, ByIdentity) {
  ZORVadSingleString single;
  ZORVadEnumString set;
  ZORVadSingleInteger integer;
  EXPECT_EQ(ZORVadSingleString::DynamicCast(&single), &single);
  EXPECT_EQ(ZORVaDoString::DynamicCast(&set), &set);
  EXPECT_EQ(ZORVadSingleString::DynamicCast(&set), nullptr);
  EXPECT_EQ(ZORVadEnumString::DynamicCast(&single), nullptr);
  EXPECT_EQ(ZORVaDoString::DynamicCast(&integer), nullptr);
  EXPECT_EQ(ZORVaDoString::DynamicCast(static_cast<ZORVaDoBase*>(nullptr)), nullptr);
  EXPECT_EQ(single.CastableID(), ZORVadSingleString::CastableIdent);
  EXPECT_TRUE(ZORVaDoBase::IsKindOf(&single, ZORVadSingleString::CastableIdent));
  EXPECT_TRUE(ZORVaDoBase::IsKindOf(&set, ZORVaDoScalar::sIdent));
  const std::string copy = ZORVadSingleString::CastableIdent;
  EXPECT_FALSE(ZORVaDoBase::IsKindOf(&single, copy.c_str())) << "an equal text elsewhere";
}
