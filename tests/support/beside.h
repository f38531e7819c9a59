// Operations beside their models: every combination of values goes through both, in both forms, twice.
#pragma once

#include <algorithm>
#include <string_view>
#include <type_traits>
#include <vector>

#include "module/operations.h"
#include "tests/support/values.h"

namespace zor::test {

// What a call answers; 0 of one that answers nothing.
template <class Call>
int AnswerOf(Call call) {
  if constexpr (std::is_void_v<decltype(call())>) {
    call();
    return 0;
  } else {
    return static_cast<int>(call());
  }
}

template <class Value>
struct Beside {  // pairs leave the third operand alone
  using Class = std::remove_reference_t<decltype(std::declval<typename Value::Held>().Typed())>;
  const char* name;
  int operands, target;
  int (*typed)(Class* const* v);
  int (*entry)(ZORVaDoString* const* v);  // null when there is no such form
  int (*model)(Value* v);
  int (*modelOfEntry)(Value* v);

  bool Is(auto... names) const { return ((std::string_view(name) == names) || ...); }
};

#define ZOR_BESIDE(Name, operands, target, callArgs, modelArgs, ofEntry)                                 \
  {                                                                                                      \
#Name, operands, target, [](auto* const* v) { return AnswerOf([&] { return v[0]->Name callArgs; }); }, \
        [](ZORVaDoString* const* v) { return AnswerOf([&] { return v[0]->Name callArgs; }); },      \
        [](auto* v) { return model::Name modelArgs; }, [](auto* v) -> int { return ofEntry; } \
  }

constexpr int kPatterns[][3] = {{0, 1, 2}, {0, 0, 2}, {0, 1, 0}, {0, 1, 1}, {0, 0, 0}};  // who is the same object

template <class Held>
bool Shares(const Held (&held)[3]) {
  std::vector<const ZORString*> objects;
  for (const Held& value : held)
    for (const ZORString* object : value.Objects()) objects.push_back(object);
  std::sort(objects.begin(), objects.end());
  return std::adjacent_find(objects.begin(), objects.end()) != objects.end();
}

// Two calls in one form; pattern says which operands are one object. An unchanged target keeps its very texts.
template <class Class, class Value, class Form, class Model>
void Compare(const Beside<Value>& operation, const Value* v, const int* pattern, Form form, Model slow) {
  typename Value::Held held[] = {typename Value::Held(v[0]), typename Value::Held(v[1]), typename Value::Held(v[2])};
  const auto& target = held[pattern[operation.target]];
  Class* operands[3];
  for (int i = 0; i < 3; ++i) operands[i] = &held[pattern[i]].value;
  Value expected[] = {v[0], v[1], v[2]};
  for (int call = 1; call <= 2; ++call) {
    Value copies[3];
    for (int i = 0; i < 3; ++i) copies[i] = expected[pattern[i]];
    const int answer = (operation.*slow)(copies);
    Value& after = expected[pattern[operation.target]];
    const bool stays =
        answer == 0 && after == copies[operation.target] && std::string_view(operation.name).starts_with("Calc");
    after = copies[operation.target];
    const auto objects = target.Objects();
    ASSERT_EQ((operation.*form)(operands), answer) << "call " << call;
    for (int i = 0; i < 3; ++i) ASSERT_EQ(held[i].Now(), expected[i]) << "operand " << i << " after call " << call;
    ASSERT_TRUE(!stays || objects == target.Objects()) << "call " << call;
    ASSERT_FALSE(Shares(held)) << "call " << call;
  }
}

// nothing: what an operand that is not looked at has to be, so that it goes through once.
template <class Value>
void CompareForms(const Beside<Value>& operation, const Value* v, const Value& nothing) {
  for (const auto& pattern : kPatterns) {
    if (operation.operands == 2 && pattern[2] != 2) continue;
    // To itself a value is assigned without going through a list.
    if (operation.Is("Assign", "Copy") && pattern[1] == 0 && v[0].HasEquals()) continue;
    bool repeats = false;
    for (int i = 1; i < 3; ++i) repeats |= pattern[i] != i && !(v[i] == nothing);
    if (repeats) continue;
    using Class = typename Beside<Value>::Class;
    Compare<Class>(operation, v, pattern, &Beside<Value>::typed, &Beside<Value>::model);
    if (operation.entry)
      Compare<ZORVaDoString>(operation, v, pattern, &Beside<Value>::entry, &Beside<Value>::modelOfEntry);
    ASSERT_FALSE(testing::Test::HasFatalFailure()) << v[0] << '.' << operation.name << ' ' << v[1] << ' ' << v[2]
                                                   << ", objects " << pattern[0] << pattern[1] << pattern[2];
  }
}

// Triples take the first values alone.
template <class Value, std::size_t kCount>
void CompareAll(const Beside<Value>& operation, const Value (&values)[kCount], std::size_t tripled) {
  const bool pair = operation.operands == 2;
  const std::size_t n = pair ? kCount : tripled;
  for (std::size_t i = 0; i < (pair ? n * n : n * n * n); ++i) {
    const Value v[] = {values[i % n], values[i / n % n], values[i / n / n]};
    CompareForms(operation, v, values[0]);
    if (testing::Test::HasFatalFailure()) return;
  }
}

// An operand that is missing, or of another class, makes Nil of the target of these three and tells the others
// nothing; other are the operands beside it.
template <class Value>
void CheckWrongOperands(const Beside<Value>& operation, const Value& z, const Value& other, ZORVaDoString* wrong) {
  for (int at = 1; at < operation.operands; ++at) {
    typename Value::Held held(z), second(other), third(other);
    ZORVaDoString* operands[] = {&held.value, &second.value, &third.value};
    operands[at] = wrong;
    const Value after = operation.Is("Assign", "Intersect", "Unite") ? Value::Parse("Nil") : z;
    EXPECT_EQ(operation.entry(operands), operation.Is("IsIntersected") && z.tag == kAnyTag) << operation.name << z;
    EXPECT_EQ(held.Now(), after) << operation.name;
    EXPECT_TRUE(second.Now() == other && third.Now() == other) << operation.name;
  }
}

// An integer likewise, where the operation can be given one.
template <class Value>
void CheckIntegers(const Value& z) {
  for (const Operation& operation : kOperations) {
    const bool takesInteger =
        operation.kinds[1] == Operation::Kind::Any || operation.kinds[1] == Operation::Kind::Scalar;
    if (operation.operands != 2 || !takesInteger || operation.shape == Operation::Shape::Form) continue;
    HeldInteger n(Number(7));
    typename Value::Held held(z);
    ZORVaDoAny* const operands[] = {&held.value, &n.Abstract()};
    EXPECT_EQ(operation.call(operands), operation.shape == Operation::Shape::Test && z.tag == kAnyTag)
        << operation.name;
    const Value after = operation.shape == Operation::Shape::Algebra ? Value::Parse("Nil") : z;
    EXPECT_TRUE(held.Now() == after && n.Now() == Number(7)) << operation.name << z;
  }
}

}  // namespace zor::test
