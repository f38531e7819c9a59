// Operations beside their models: a row is one form of an operation and a slow account of it on plain values.
#pragma once

#include <array>
#include <functional>
#include <utility>

#include "module/operations.h"
#include "tests/support/values.h"

namespace zor::test {

constexpr std::size_t kMostOperands = 4;

struct Row {
  const char* name;
  bool typed;
  std::vector<std::size_t> kinds;  // of the operands, *this first: their index in Value
  std::size_t target;
  std::function<int(Object* const* objects)> call;
  std::function<int(Value* values)> model;

  bool Is(auto... names) const { return ((std::string_view(name) == names) || ...); }
};

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

template <bool kTyped, class Held>
auto& FormOf(Held& held) {
  if constexpr (kTyped) {
    return held.Typed();
  } else {
    return held.Abstract();
  }
}

template <bool kTyped, class... Plain, class Call, class Model>
Row MakeRow(const char* name, std::size_t target, Call call, Model model) {
  return [&]<std::size_t... kAt>(std::index_sequence<kAt...>) {
    const std::vector<std::size_t> kinds = {Value(Plain()).index()...};
    return Row{name,
               kTyped,
               kinds,
               target,
               [=](Object* const* o) {
                 return AnswerOf([&] { return call(FormOf<kTyped>(std::get<typename Plain::Held>(*o[kAt]))...); });
               },
               [=](Value* v) { return AnswerOf([&] { return model(std::get<Plain>(v[kAt])...); }); }};
  }
  (std::index_sequence_for<Plain...>());
}

// What a relation tells, by what it makes of each Boolean and answers; 0 when that is none of these.
constexpr int kOpen = 'o', kUndefined = 'u', kContradiction = 'n', kTrue = 't', kFalse = 'f';
template <class Call>
int TellOf(Call call) {
  std::string told;
  for (const char before : {'u', 'n', 't', 'f'}) {
    ZORVadSingleBoolean truth;
    if (before == 'n') truth.SetNilValue();
    if (before == 't') truth.CalcTrueValue();
    if (before == 'f') truth.CalcFalseValue();
    const int answer = call(truth);
    told += truth.IsNil() != 0 ? 'n' : truth.IsUndefined() != 0 ? 'u' : truth.CanBe(true) ? 't' : 'f';
    told += static_cast<char>('0' + answer);
  }
  const std::pair<std::string_view, int> outcomes[] = {{"u0n0t0f0", kOpen},
                                                       {"u0u1u1u1", kUndefined},
                                                       {"n1n0n1n1", kContradiction},
                                                       {"t1n0t0n1", kTrue},
                                                       {"f1n0n1f0", kFalse}};
  for (const auto& [form, outcome] : outcomes)
    if (form == told) return outcome;
  return 0;
}

// A row of each form of an operation: ROWS(Name, target, answer of the entry's model, operands...).
#define ZOR_MODEL(Name) [](auto&... v) { return model::Name(v...); }
#define ZOR_CALL(Name) [](auto& z, auto&... x) { return z.Name(x...); }
#define ZOR_TELL(Name) [](auto& z, auto& x) { return TellOf([&](auto& truth) { return z.Name(x, truth); }); }
#define ZOR_TYPED(Name, target, ...) MakeRow<true, __VA_ARGS__>(#Name, target, ZOR_CALL(Name), ZOR_MODEL(Name)),
#define ZOR_ENTRY(Name, target, model, ...) MakeRow<false, __VA_ARGS__>(#Name, target, ZOR_CALL(Name), model),
#define ZOR_RELATION(Name, ...)                                                  \
  MakeRow<true, __VA_ARGS__>(#Name, kNoTarget, ZOR_TELL(Name), ZOR_MODEL(Name)), \
      MakeRow<false, __VA_ARGS__>(#Name, kNoTarget, ZOR_TELL(Name), ZOR_MODEL(Name)),

// Calls a row on objects that may coincide, and its model on what they are expected to hold. Tells what is wrong.
// An unchanged target keeps its very texts.
inline std::string Call(const Row& row, Object* const* objects, Value* const* expected) {
  const std::size_t count = row.kinds.size();
  std::array<Value, kMostOperands> values;
  for (std::size_t i = 0; i < count; ++i) values[i] = *expected[i];
  const int answer = row.model(values.data());
  const bool narrows = row.target != kNoTarget;
  const bool stays = !narrows || (answer == 0 && *expected[row.target] == values[row.target] &&
                                  std::string_view(row.name).starts_with("Calc"));
  if (narrows) *expected[row.target] = values[row.target];
  const auto texts = ObjectsOf(*objects[narrows ? row.target : 0]);
  const int told = row.call(objects);
  std::string fault;
  if (told != answer) fault += "answers " + std::to_string(told) + ", not " + std::to_string(answer) + '\n';
  for (std::size_t i = 0; i < count; ++i) {
    const Value now = NowOf(*objects[i]);
    if (!(now == *expected[i])) fault += "operand " + ShownAs(now) + ", not " + ShownAs(*expected[i]) + '\n';
  }
  if (stays && texts != ObjectsOf(*objects[narrows ? row.target : 0])) fault += "other texts than before\n";
  return fault;
}

// Two calls; same[i] is the first operand that is the same object as operand i. A word may be a text that *this lists.
inline std::string CallTwice(const Row& row, const std::vector<Value>& values, const std::vector<std::size_t>& same,
                             int listed = -1) {
  Objects held(values);
  std::vector<Value> expected = values;
  std::array<Object*, kMostOperands> objects;
  std::array<Value*, kMostOperands> expectations;
  for (std::size_t i = 0; i < values.size(); ++i) objects[i] = &held[same[i]], expectations[i] = &expected[same[i]];
  if (listed >= 0) std::get<HeldWord>(held[1]).listed = &std::get<HeldSet>(held[0]).value.GetValue(listed);
  for (int call = 1; call <= 2; ++call) {
    std::string fault = Call(row, objects.data(), expectations.data());
    if (held.ShareTexts()) fault += "two values share a text\n";
    if (listed >= 0) std::get<HeldWord>(held[1]).listed = nullptr;
    if (fault.empty()) continue;
    fault = (row.typed ? "typed " : "") + std::string(row.name) + ", call " + std::to_string(call) + ": " + fault;
    for (std::size_t i = 0; i < values.size(); ++i)
      fault += ShownAs(values[i]) + " as " + std::to_string(same[i]) + ' ';
    return fault;
  }
  return "";
}

// The ways in which operands of the same kind can be one object.
inline std::vector<std::vector<std::size_t>> SamenessOf(const std::vector<std::size_t>& kinds) {
  std::vector<std::vector<std::size_t>> ways = {{}};
  for (std::size_t i = 0; i < kinds.size(); ++i) {
    std::vector<std::vector<std::size_t>> longer;
    for (const auto& way : ways) {
      for (std::size_t first = 0; first <= i; ++first) {
        if (kinds[first] != kinds[i] || (first < i && way[first] != first)) continue;
        longer.push_back(way);
        longer.back().push_back(first);
      }
    }
    ways = std::move(longer);
  }
  return ways;
}

// Every combination of values, the lists of the operands in their order. Tells the first fault.
inline std::string CompareAll(const Row& row, const std::vector<std::vector<Value>>& lists) {
  const auto ways = SamenessOf(row.kinds);
  std::vector<std::size_t> at(lists.size());
  std::vector<Value> values(lists.size());
  while (true) {
    for (std::size_t i = 0; i < lists.size(); ++i) values[i] = lists[i][at[i]];
    for (const auto& same : ways) {
      bool repeats = false;  // what an operand that is no object of its own would hold
      for (std::size_t i = 0; i < lists.size(); ++i) repeats |= same[i] != i && at[i] != 0;
      // To itself a value is assigned without going through a list.
      const Set* const set = std::get_if<Set>(&values[0]);
      const bool toItself = row.Is("Assign", "Copy") && same[1] == 0 && set != nullptr && set->HasEquals();
      if (repeats || toItself) continue;
      if (std::string fault = CallTwice(row, values, same); !fault.empty()) return fault;
    }
    std::size_t i = 0;
    while (i < lists.size() && ++at[i] == lists[i].size()) at[i++] = 0;
    if (i == lists.size()) return "";
  }
}

inline const Operation* FindOperation(std::string_view name, std::size_t operands) {
  const auto* const found = std::find_if(std::begin(kOperations), std::end(kOperations),
                                         [&](const Operation& o) { return o.name == name && o.operands == operands; });
  return found != std::end(kOperations) ? found : nullptr;
}

// An operand that is missing or of another class makes Nil of the target of Assign, Intersect and Unite, and tells the
// other operations nothing, those with the fewest operands named and more. beside stands for the operands that are
// right.
inline std::string CheckWrongOperand(const Value& z, const Value& beside, ZORVaDoAny* wrong, bool isString,
                                     std::size_t fewest) {
  for (const Operation& operation : kOperations) {
    using Shape = Operation::Shape;
    if (operation.operands < fewest) continue;
    const bool takesOthers = operation.shape == Shape::Truth || operation.shape == Shape::Form;
    if (takesOthers || operation.shape == Shape::Length || operation.shape == Shape::Slice) continue;
    for (std::size_t at = 1; at < operation.operands; ++at) {
      if (wrong != nullptr && !isString && operation.kinds[at] == Operation::Kind::String) continue;
      Objects held({z, beside, beside});
      std::array<ZORVaDoAny*, kMostOperands> operands{};
      for (std::size_t i = 0; i < operation.operands; ++i) operands[i] = OperandOf(held[i]);
      operands[at] = wrong;
      const bool any = operation.shape == Shape::Test && operands[0]->IsUndefined() != 0;
      const int answer = operation.call(operands.data());
      const bool stays = operation.shape == Shape::Algebra ? operands[0]->IsNil() != 0 : NowOf(held[0]) == z;
      if (answer != (any ? 1 : 0) || !stays || !(NowOf(held[1]) == beside) || !(NowOf(held[2]) == beside))
        return std::string(operation.name) + " with a wrong operand";
    }
  }
  return "";
}

}  // namespace zor::test
