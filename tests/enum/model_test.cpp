// Every operation on every combination of values, beside the model.
#include "tests/enum/model.h"

#include <iterator>

#include "tests/support/beside.h"

namespace zor::test {
namespace {

// The outcome of a relation, however the Boolean stood before.
template <class Call>
int TellOf(Call call) {
  HeldBoolean any({"Any"}), nil({"Nil"});
  call(any.value);
  call(nil.value);
  if (nil.Now().form != "Nil") return model::kUndefined;
  const std::string form = any.Now().form;
  return form == "Any" ? model::kOpen : form == "Nil" ? model::kContradiction : form[0];
}

struct SingleOperation {  // on a set and a single string
  const char* name;
  int (*typed)(ZORVadEnumString& z, ZORVadSingleString& x);  // null when there is no such form
  int (*entry)(ZORVaDoString& z, ZORVaDoString& x);
  int (*model)(Set& z, Str& x);
  int (*modelOfEntry)(Set& z, Str& x);
};

// clang-format off
// Behind the tests of states that the entries of sets share. The sources of an inverse are the value it is called on.
template <std::size_t kTarget, class Body>
int EntryOf(Set* v, int operands, Body body) {
  if (kTarget != 0) return model::Entry(v[kTarget], body, v[0]);
  return operands == 2 ? model::Entry(v[0], body, v[1]) : model::Entry(v[0], body, v[1], v[2]);
}

#define PAIR(Name, target, ofEntry) ZOR_BESIDE(Name, 2, target, (*v[1]), (v[0], v[1]), ofEntry),
#define TYPED_ALONE(Name) \
  {#Name, 2, 0, [](ZORVadEnumString* const* v) { return v[0]->Name(*v[1]); }, nullptr, \
   [](Set* v) { return model::Name(v[0], v[1]); }, nullptr}
#define ZOR_Algebra(Name, ...)  PAIR(Name, 0, (model::Name(v[0], v[1]), 0))
#define ZOR_Test(Name, ...)     PAIR(Name, 0, (model::Name(v[0], v[1])))
#define ZOR_Equality(Name, ...) PAIR(Name, (zor::TargetOf<__VA_ARGS__>()), (model::Name(v[0], v[1])))
#define ZOR_Pair(Name, ...) \
  PAIR(Name, (zor::TargetOf<__VA_ARGS__>()), (EntryOf<zor::TargetOf<__VA_ARGS__>()>(v, 2, [&] { return model::Name(v[0], v[1]); })))
#define ZOR_Triple(Name, ...) \
  ZOR_BESIDE(Name, 3, (zor::TargetOf<__VA_ARGS__>()), (*v[1], *v[2]), (v[0], v[1], v[2]), \
      (EntryOf<zor::TargetOf<__VA_ARGS__>()>(v, 3, [&] { return model::Name(v[0], v[1], v[2]); }))),
#define ZOR_Truth(Name, ...) \
  {#Name, 2, 0, [](ZORVadEnumString* const* v) { return TellOf([&](auto& b) { v[0]->Name(*v[1], b); }); }, \
   [](ZORVaDoString* const* v) { return TellOf([&](auto& b) { v[0]->Name(*v[1], b); }); }, \
   [](Set* v) { return model::Name(v[0], v[1]); }, [](Set* v) { return model::Name(v[0], v[1]); }},
#define ZOR_Alone(...)
#define ZOR_Length(...)
#define ZOR_Form(...)
#define ZOR_Slice(...)
#define ROW(Shape, ...) ZOR_##Shape(__VA_ARGS__)

const Beside<Set> kBeside[] = {ZOR_STRING_OPERATIONS(ROW) TYPED_ALONE(Copy), TYPED_ALONE(Append)};

#define SINGLE(Name, ofEntry) \
  {#Name, [](ZORVadEnumString& z, ZORVadSingleString& x) { return AnswerOf([&] { return z.Name(x); }); }, \
   [](ZORVaDoString& z, ZORVaDoString& x) { return AnswerOf([&] { return z.Name(x); }); }, \
   [](Set& z, Str& x) { return model::Name(z, x); }, [](Set& z, Str& x) -> int { return ofEntry; }}
#define SINGLE_ALIKE(Name)    SINGLE(Name, (model::Name(z, x)))
#define SINGLE_WORDLESS(Name) SINGLE(Name, (model::Name(z, x), 0))
#define SINGLE_FORWARD(Name)  SINGLE(Name, (model::Entry(z, [&] { return model::Name(z, x); }, x)))
#define SINGLE_INVERSE(Name)  SINGLE(Name, (model::Entry(x, [&] { return model::Name(z, x); }, z)))
#define SINGLE_NONE(Name) \
  {#Name, nullptr, [](ZORVaDoString& z, ZORVaDoString& x) { return z.Name(x); }, nullptr, [](Set&, Str&) { return 0; }}
#define SINGLE_RELATION(Name) \
  {#Name, nullptr, [](ZORVaDoString& z, ZORVaDoString& x) { return TellOf([&](auto& b) { z.Name(x, b); }); }, nullptr, \
   [](Set& z, Str& x) { return model::Name(z, x); }}
#define SINGLE_TYPED(Name) \
  {#Name, [](ZORVadEnumString& z, ZORVadSingleString& x) { return z.Name(x); }, nullptr, \
   [](Set& z, Str& x) { return model::Name(z, x); }, nullptr}

const SingleOperation kSingleOperations[] = {
  SINGLE_WORDLESS(Assign), SINGLE_WORDLESS(Intersect), SINGLE_WORDLESS(Unite), SINGLE_ALIKE(IsIntersected),
  SINGLE_ALIKE(CalcEqualValue), SINGLE_ALIKE(CalcInverseEqualValue),
  SINGLE_ALIKE(CalcUnequalValue), SINGLE_ALIKE(CalcInverseUnequalValue),
  SINGLE_RELATION(CalcIsEqual), SINGLE_RELATION(CalcIsLessOrEqual), SINGLE_RELATION(CalcIsLess),
  SINGLE_NONE(CalcLessValue), SINGLE_NONE(CalcInverseLessValue), SINGLE_NONE(CalcNotLessValue),
  SINGLE_NONE(CalcNotLessAndUnequalValue), SINGLE_NONE(CalcNextValue), SINGLE_NONE(CalcInverseNextValue),
  SINGLE_FORWARD(CalcLessOrEqualValue), SINGLE_INVERSE(CalcInverseLessOrEqualValue),
  SINGLE_INVERSE(CalcInverseNotLessValue), SINGLE_INVERSE(CalcInverseNotLessAndUnequalValue),
  SINGLE_FORWARD(CalcLowerValue), SINGLE_INVERSE(CalcInverseLowerValue),
  SINGLE_FORWARD(CalcUpperValue), SINGLE_INVERSE(CalcInverseUpperValue),
  SINGLE_TYPED(Copy), SINGLE_TYPED(IntersectInverse),
};

const Set kSets[] = {
  "Nil", "Any", "Max", "Min", "{ }", "{a}", "{b}", "{a,b}", "{,a}", "{a,Max}", "{,Max}", "{b,Max}",
  "{z*255}", "{z*255,Max}", "{z*256}", "{a,a}", "Any{a}", "{aa,ab}",  // in triples
  "{a,b,c}", "{A,b}", "{a*255}", "{c,d}", "Nil{b}", "{,}", "{A}", "{B,a}", "{A,B}", "{A,a}", "{A,a,b,Max}", "{ab ,ac}",
  "{z*254}", "{z*254,z*255}", "{a*254}", "{a*256}", "{a*253zz}", "{z*256,Max}", "{a,a,b}", "{m,z}", "{ ,!}", "Any{a,b}",
};
constexpr std::size_t kTripled = 18;
const Str kSingles[] = {kNil, {kNilTag, "a"}, kAny, {kAnyTag, "b"}, kMax, kMin, Text(""), Text("a"), Text("A"), Text("b"),
                        Text("c"), Times(255, 'z'), Times(256, 'z'), Times(254, 'z', "y"), Times(255, 'a')};
// clang-format on

TEST(EnumModel, EveryCombination) {
  for (const auto& operation : kBeside) ASSERT_NO_FATAL_FAILURE(CompareAll(operation, kSets, kTripled));
}

template <class Form, class Model>
void CompareSingle(const SingleOperation& operation, Set z, Str x, Form form, Model slow) {
  if (operation.*form == nullptr) return;
  HeldSet set(z);
  HeldSingle single(x);
  for (int call = 1; call <= 2; ++call) {
    const int answer = (operation.*slow)(z, x);
    ASSERT_EQ((operation.*form)(set.value, single.value), answer) << "call " << call;
    ASSERT_EQ(set.Now(), z) << "after call " << call;
    ASSERT_EQ(single.Now(), x) << "after call " << call;
  }
}

TEST(EnumModel, SingleOperands) {
  for (const SingleOperation& operation : kSingleOperations) {
    for (const Set& z : kSets) {
      for (const Str& x : kSingles) {
        CompareSingle(operation, z, x, &SingleOperation::typed, &SingleOperation::model);
        CompareSingle(operation, z, x, &SingleOperation::entry, &SingleOperation::modelOfEntry);
        ASSERT_FALSE(HasFatalFailure()) << z << '.' << operation.name << ' ' << x;
      }
    }
  }
}

TEST(EnumModel, WrongOperands) {
  HeldSingle single(Text("b"));
  for (const Set& z : {Set("{a,b}"), Set("Nil"), Set("Any"), Set("Min"), Set("{b,Max}")}) {
    for (const auto& operation : kBeside) {
      if (operation.entry == nullptr || operation.Is("CalcIsEqual", "CalcIsLessOrEqual", "CalcIsLess")) continue;
      CheckWrongOperands(operation, z, Set("{b}"), nullptr);
      if (operation.operands == 3) CheckWrongOperands(operation, z, Set("{b}"), &single.value);
    }
    CheckIntegers(z);
  }
  EXPECT_EQ(single.Now(), Text("b"));
}

// Operations on a text, which may be one that the value lists.
struct TextOperation {
  const char* name;
  int (*call)(ZORVadEnumString& z, const ZORString& text);
  int (*model)(Set& z, std::string text);
};
// clang-format off
#define ON_TEXT(Name, Class) \
  {#Name, \
   [](ZORVadEnumString& z, const ZORString& t) { return AnswerOf([&] { return Class::StaticCast(&z)->Name(t); }); }, \
   [](Set& z, std::string t) { return model::Name(z, t); }}
const TextOperation kTextOperations[] = {
  ON_TEXT(SetExactValue, ZORVaDoString), ON_TEXT(InsertExactValue, ZORVaDoString), ON_TEXT(RemoveExactValue, ZORVaDoString),
  ON_TEXT(SetLowerBound, ZORVadEnumString), ON_TEXT(SetUpperBound, ZORVadEnumString), ON_TEXT(CutLower, ZORVadEnumString),
  ON_TEXT(CutUpper, ZORVadEnumString), ON_TEXT(Insert, ZORVadEnumString),
};
// clang-format on

void CompareText(const TextOperation& operation, Set z, const std::string& text, int own) {
  HeldSet held(z);
  const ZORString given = Packed(text);
  for (int call = 1; call <= 2; ++call, own = -1) {
    const int answer = operation.model(z, text);
    ASSERT_EQ(operation.call(held.value, own < 0 ? given : held.value.GetValue(own)), answer) << "call " << call;
    ASSERT_EQ(held.Now(), z) << "after call " << call;
  }
}

void CompareReaders(const Set& z, const std::string& text) {
  const HeldSet held(z);
  const ZORVaDoString& value = held.value;
  const ZORString given = Packed(text);
  ASSERT_EQ(Plain(value.GetNextExactValue(given)), model::NextExactValue(z, text));
  ASSERT_EQ(Plain(value.GetPrevExactValue(given)), model::PrevExactValue(z, text));
  const int position = held.value.Contains(given), first = model::Contains(z, text);
  ASSERT_EQ(position > 0 ? 1 : position, first > 0 ? 1 : first);  // of equal texts it may be any
  ASSERT_TRUE(position <= 0 || z.texts[position - 1] == text);
  ASSERT_EQ(held.value.Contains(&given), position);
}

TEST(EnumModel, Texts) {
  const char* const given[] = {"",  " ",  "!", "A", "a",     "aa",    "ab",    "b",
                               "c", "bb", "z", "~", "z*254", "z*255", "z*256", "a*255"};
  for (const Set& z : kSets) {
    for (const char* notation : given) {
      const std::string text = Unpacked(notation);
      CompareReaders(z, text);
      for (const TextOperation& operation : kTextOperations) CompareText(operation, z, text, -1);
      ASSERT_FALSE(HasFatalFailure()) << z << ' ' << text;
    }
    for (std::size_t own = 0; own < z.texts.size(); ++own) {
      for (const TextOperation& operation : kTextOperations)
        CompareText(operation, z, z.texts[own], static_cast<int>(own));
      ASSERT_FALSE(HasFatalFailure()) << z << ' ' << own;
    }
  }
}

// The states and bounds that a value tells, and the operations that look at nothing else.
TEST(EnumModel, States) {
  for (const Set& z : kSets) {
    const auto check = [&](const char* name, int answer, const Set& after, auto call) {
      HeldSet held(z);
      EXPECT_EQ(AnswerOf([&] { return call(held.Abstract()); }), answer) << z << '.' << name;
      EXPECT_EQ(held.Now(), after) << z << '.' << name;
    };
    const bool nil = model::IsNil(z), any = model::IsAny(z), min = model::IsMin(z), max = model::IsMax(z);
    const int count = static_cast<int>(z.texts.size());
    check("IsNil", nil, z, ZOR_OPERATION(IsNil));
    check("IsUndefined", any, z, ZOR_OPERATION(IsUndefined));
    check("IsEmpty", min, z, ZOR_OPERATION(IsEmpty));
    check("IsFull", max, z, ZOR_OPERATION(IsFull));
    check("GetCardinality", nil ? 0 : any ? 256 : count, z, ZOR_OPERATION(GetCardinality));
    check("CalcMinValue", !min, "Min", ZOR_OPERATION(CalcMinValue));
    check("CalcEmptyValue", !min, "Min", ZOR_OPERATION(CalcEmptyValue));
    check("CalcMaxValue", !max, "Max", ZOR_OPERATION(CalcMaxValue));
    check("CalcFullValue", !max, "Max", ZOR_OPERATION(CalcFullValue));
    check("SetNilValue", 0, "Nil", ZOR_OPERATION(SetNilValue));
    check("SetUndefinedValue", 0, "Any", ZOR_OPERATION(SetUndefinedValue));
    check("Nil", !nil, nil ? z : "Nil", ZOR_OPERATION(Nil));
    check("Any", !any, any ? z : "Any", ZOR_OPERATION(Any));
    const HeldSet held(z);
    const ZORVaDoString& value = held.value;
    EXPECT_EQ(Plain(value.GetLowerBound()), model::Lower(z)) << z;
    EXPECT_EQ(Plain(value.GetUpperBound()), model::Upper(z)) << z;
    EXPECT_TRUE(held.value.CheckNil() == nil && held.value.CheckAny() == any) << z;
  }
}

// A bare vector, whose texts are copied.
TEST(EnumModel, Vectors) {
  for (const Set& z : kSets) {
    for (const Set& x : kSets) {
      ZORISVectorImp_String texts(20, 20u);
      for (const std::string& text : x.texts) texts.Add(new ZORString(Packed(text)));
      for (const bool intersects : {false, true}) {
        HeldSet held(z);
        Set expected = z;
        for (int call = 1; call <= 2; ++call) {
          const int answer =
              intersects ? model::IntersectTexts(expected, x.texts) : model::AppendTexts(expected, x.texts);
          ASSERT_EQ(intersects ? held.value.Intersect(texts) : held.value.Append(texts), answer) << z << ' ' << x;
          ASSERT_EQ(held.Now(), expected) << z << ' ' << x;
        }
      }
      ASSERT_EQ(texts.Count(), x.texts.size());
      texts.Flush(1);
    }
  }
}

}  // namespace
}  // namespace zor::test
