// Rows of cases, and what each of them is put through.
#pragma once

#include <gtest/gtest.h>

#include <tuple>
#include <type_traits>
#include <vector>

#include "tests/support/values.h"

namespace zor::test {

// An operation by its name: the typed form when it is called with values of a class, the entry of the solver's table
// when it is called with abstract ones.
#define ZOR_OPERATION(Name) [](auto& target, auto&... operands) { return target.Name(operands...); }

// Operands, *this first; the one with the number kTarget is narrowed. again is the answer to the same call after it.
template <std::size_t kTarget, class... Operands>
struct Row {
  const char* why;
  std::tuple<Operands...> operands;
  int answer;
  std::tuple_element_t<kTarget, std::tuple<Operands...>> after;
  int again = 0;
};

// Calls one form on fresh operands, twice; operands that are no target must stay as they were. It takes any call of
// such operands, so that compilers meet it once and not for every operation.
template <std::size_t kTarget, class... Operands>
void CheckForm(const Row<kTarget, Operands...>& row, const char* form,
               std::type_identity_t<int (*)(typename Operands::Held&...)> call) {
  SCOPED_TRACE(form);
  std::tuple<Operands...> expected = row.operands;
  std::get<kTarget>(expected) = row.after;
  auto held = std::apply([](auto&... v) { return std::tuple<typename Operands::Held...>(v...); }, row.operands);
  for (const int answer : {row.answer, row.again}) {
    EXPECT_EQ(std::apply(call, held), answer);
    EXPECT_EQ(std::apply([](auto&... v) { return std::tuple<Operands...>(v.Now()...); }, held), expected);
  }
}

template <std::size_t kTarget, class... Operands, class Operation>
void Check(const Row<kTarget, Operands...>& row, Operation) {
  SCOPED_TRACE(row.why);
  CheckForm(row, "typed form", [](typename Operands::Held&... held) -> int { return Operation()(held.Typed()...); });
  CheckForm(row, "entry", [](typename Operands::Held&... held) -> int { return Operation()(held.Abstract()...); });
}

// A row of any operation: its operands and what becomes of the target as notations.
struct Example {
  const char *why, *name;
  void (*check)(const Example& example);
  std::vector<const char*> operands;
  int answer;
  const char* after;
  int again = 0;
};

template <std::size_t kTarget, class... Operands, class Operation>
void CheckExample(const Example& example, Operation operation) {
  SCOPED_TRACE(example.name);
  auto next = example.operands.begin();
  const std::tuple<Operands...> operands{Operands::Parse(*next++)...};
  const auto after = std::tuple_element_t<kTarget, std::tuple<Operands...>>::Parse(example.after);
  Check<kTarget, Operands...>({example.why, operands, example.answer, after, example.again}, operation);
}

// The name of an operation and its check, for operands of these kinds.
#define ZOR_EXAMPLE(Name, target, ...) ZOR_EXAMPLE_OF(Name, ZOR_OPERATION(Name), target, __VA_ARGS__)
#define ZOR_EXAMPLE_OF(Name, operation, target, ...) \
#Name, [](const Example& example) { CheckExample<target, __VA_ARGS__>(example, operation); }

}  // namespace zor::test
