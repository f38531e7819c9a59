// Worked examples: a few rows a reader learns from, which anchor the models too.
#pragma once

#include <gtest/gtest.h>

#include "tests/support/beside.h"

namespace zor::test {

// An entry of the solver's table by its name, on strings of one class; what becomes of its target, and its answer.
struct Example {
  const char *why, *name;
  std::vector<const char*> operands;
  int answer;
  const char* after;
};

template <class Plain>
void CheckExample(const Example& example) {
  std::vector<Value> values;
  for (const char* operand : example.operands) values.emplace_back(Plain(operand));
  Objects held(values);
  std::vector<ZORVaDoAny*> operands;
  for (std::size_t i = 0; i < values.size(); ++i) operands.push_back(OperandOf(held[i]));
  const Operation* const operation = FindOperation(example.name, values.size());
  ASSERT_NE(operation, nullptr) << example.name;
  EXPECT_EQ(operation->call(operands.data()), example.answer) << example.name << ": " << example.why;
  values[operation->target] = Plain(example.after);
  for (std::size_t i = 0; i < values.size(); ++i)
    EXPECT_EQ(NowOf(held[i]), values[i]) << example.name << ": " << example.why;
}

}  // namespace zor::test
