// Rows of cases, and what each of them is put through.
#pragma once

#include <gtest/gtest.h>

#include <tuple>

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

// Calls both forms on fresh operands, twice each; operands that are no target must stay as they were.
template <std::size_t kTarget, class... Operands, class Operation>
void Check(const Row<kTarget, Operands...>& row, Operation operation) {
  SCOPED_TRACE(row.why);
  std::tuple<Operands...> expected = row.operands;
  std::get<kTarget>(expected) = row.after;
  const auto check = [&](const char* form, auto call) {
    SCOPED_TRACE(form);
    auto held = std::apply([](auto&... v) { return std::tuple<typename Operands::Held...>(v...); }, row.operands);
    for (const int answer : {row.answer, row.again}) {
      EXPECT_EQ(std::apply(call, held), answer);
      EXPECT_EQ(std::apply([](auto&... v) { return std::tuple<Operands...>(v.Now()...); }, held), expected);
    }
  };
  check("typed form", [&](auto&... held) { return operation(held.Typed()...); });
  check("entry", [&](auto&... held) { return operation(held.Abstract()...); });
}

template <class Row, std::size_t kCount, class Operation>
void CheckRows(const Row (&rows)[kCount], Operation operation) {
  for (const Row& row : rows) Check(row, operation);
}

}  // namespace zor::test
