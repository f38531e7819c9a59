// The order of the virtual operations, which other modules were compiled against.
#include <gtest/gtest.h>

#include <type_traits>

#include "enum/ZORVadEnumString.h"
#include "tests/support/vtable.h"

namespace {

struct Entry {
  const char* name;
  std::ptrdiff_t slot;
};

// An entry follows the other; both destructors of a class stand before all.
template <std::size_t kCount>
void ExpectInOrder(const Entry (&entries)[kCount], std::ptrdiff_t first = 2) {
  for (std::size_t i = 0; i < kCount; ++i)
    EXPECT_EQ(entries[i].slot, first + static_cast<std::ptrdiff_t>(i)) << entries[i].name;
}

struct String : ZORVaDoString {
  using ZORVaDoString::IsDerivedFrom;
};
using Base = ZORISVectorImp_String;
struct Vector : Base {
  using Base::Zero;
};
using Iterator = ZORISVectorIteratorImp_String;
struct TypeOfSingles : ZORVadSingleString::Descriptor {
  using ZORVadSingleString::Descriptor::IsDerivedFrom;
};

// clang-format off
#define S(name) {#name, Slot(&String::name)}
#define S_OF(name, Member) {#name " " #Member, Slot<Member>(&String::name)}
#define D(name) {#name, Slot(&TypeOfSingles::name)}
using Two = int (ZORVaDoAny::*)(const ZORVaDoAny&, const ZORVaDoAny&);
using None = int (ZORVaDoAny::*)();

const Entry kStrings[] = {
  S(CastableID), S(Write), S(Read), S(IsDerivedFrom),
  S(GetDescriptor), S(Activate), S(ActivateByArgument), S(Filter), S(PrintOn), S(InputValue),
  S(Assign), S(SetNilValue), S(SetUndefinedValue), S(IsNil), S(IsUndefined), S(IsIntersected), S(Intersect), S(Unite),
  S(GetCardinality), S(GetWidth), S(GetRelativeWidth), S(Bisect),
  S_OF(CalcMinValue, Two), S_OF(CalcMinValue, None), S_OF(CalcMaxValue, Two), S_OF(CalcMaxValue, None),
  S(CalcEqualValue), S(CalcInverseEqualValue), S(CalcUnequalValue), S(CalcInverseUnequalValue), S(CalcIsEqual),
  S(CalcLessOrEqualValue), S(CalcInverseLessOrEqualValue), S(CalcNotLessAndUnequalValue),
  S(CalcInverseNotLessAndUnequalValue), S(CalcIsLessOrEqual), S(CalcFirstInverseMinValue), S(CalcFirstInverseMaxValue),
  S(CalcLessValue), S(CalcInverseLessValue), S(CalcNotLessValue), S(CalcInverseNotLessValue), S(CalcIsLess),
  S(CalcNextValue), S(CalcInverseNextValue),
  S(CalcEmptyValue), S(IsEmpty), S(CalcFullValue), S(IsFull),
  S(SetExactValue), S(InsertExactValue), S(RemoveExactValue), S(GetLowerBound), S(GetUpperBound), S(GetNextExactValue),
  S(GetPrevExactValue), S(CalcLength), S(CalcInverseLength), S(CalcStringRepresentation),
  S(CalcInverseStringRepresentation), S(CalcLowerValue), S(CalcInverseLowerValue), S(CalcUpperValue),
  S(CalcInverseUpperValue), S(CalcConcatenation), S(CalcFirstInverseConcatenation), S(CalcSecondInverseConcatenation),
  S(CalcSubString), S(CalcFirstInverseSubString), S(CalcSecondInverseSubString), S(CalcThirdInverseSubString),
  {"SetLowerBound", Slot(&ZORVadSingleString::SetLowerBound)}, {"SetUpperBound", Slot(&ZORVadSingleString::SetUpperBound)},
};
using Known = ZORVaDoObject* (ZORVadSingleString::Descriptor::*)(void*, const void*) const;
using Unknown = ZORVaDoObject* (ZORVadSingleString::Descriptor::*)(void*) const;
const Entry kDescriptors[] = {
  D(CastableID), D(Write), D(Read), D(IsDerivedFrom),
  {"CreateObject of a text", Slot<Known>(&TypeOfSingles::CreateObject)},
  {"CreateObject", Slot<Unknown>(&TypeOfSingles::CreateObject)},
  D(DestroyObject), D(GetObjectSize), D(GetNumberOfArguments), D(GetArgumentsSize), D(IsMatched), D(PrintOn),
};

#define V(name) {#name, Slot(&Vector::name)}
#define V_OF(name, ...) {#name " " #__VA_ARGS__, Slot<__VA_ARGS__>(&Vector::name)}
using U = unsigned int;
using Action = Vector::Action;
using Found = Vector::Test;
const Entry kVectors[] = {
  V_OF(Good, int (Base::*)() const), V_OF(Good, int (Base::*)()), V(Add), V(AddAt), V(AddUnique), V(Detach), V(DetachAt), V(IsEmpty),
  V_OF(Flush, void (Base::*)(int, U, U)), V_OF(Flush, void (Base::*)(int)),
  V(Find), V(ClusteredFind), V(FindLowerBound), V(FindUpperBound), V(Limit), V(Top), V(Count), V(GetDelta), V(NextDelta), V(Resize),
  V_OF(ForEach, void (Base::*)(Action, void*, U, U)), V_OF(ForEach, void (Base::*)(Action, void*)),
  V_OF(FirstThat, ZORString* (Base::*)(Found, void*, U, U) const), V_OF(FirstThat, ZORString* (Base::*)(Found, void*) const),
  V_OF(LastThat, ZORString* (Base::*)(Found, void*, U, U) const), V_OF(LastThat, ZORString* (Base::*)(Found, void*) const), V(Zero),
};
const Entry kIterators[] = {
  {"Current", Slot(&Iterator::Current)}, {"Restart", Slot<void (Iterator::*)(U, U)>(&Iterator::Restart)},
  {"Restart", Slot<void (Iterator::*)()>(&Iterator::Restart)},
};
// clang-format on

TEST(Tables, Order) {
  ExpectInOrder(kStrings);
  EXPECT_EQ(Slot(&ZORVadEnumString::SetLowerBound), Slot(&ZORVadSingleString::SetLowerBound));
  EXPECT_EQ(Slot(&ZORVadEnumString::SetUpperBound), Slot(&ZORVadSingleString::SetUpperBound));
  ExpectInOrder(kDescriptors);
  ExpectInOrder(kVectors);
  ExpectInOrder(kIterators, 0);
  EXPECT_FALSE(std::has_virtual_destructor_v<Iterator>);
}

}  // namespace
