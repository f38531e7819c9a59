// What calls cost: an entry of the solver's table by its name, the allocations it may make at most, and its answer.
// Where that is 0 the target keeps its very texts and nothing that was allocated stays.
#pragma once

#include <gtest/gtest.h>

#include "tests/support/allocations.h"
#include "tests/support/beside.h"

namespace zor::test {

inline void ExpectCost(const char* name, const std::vector<Value>& values, int atMost, int answer) {
  Objects held(values);
  ZORVaDoAny* operands[kMostOperands];
  for (std::size_t i = 0; i < values.size(); ++i) operands[i] = OperandOf(held[i]);
  const Operation* const operation = FindOperation(name, values.size());
  ASSERT_NE(operation, nullptr) << name;
  const auto texts = ObjectsOf(held[0]);
  const int allocated = sAllocations, freed = sFreed;
  const int told = operation->call(operands);
  const int made = sAllocations - allocated, gone = sFreed - freed;
  EXPECT_EQ(told, answer) << name;
  EXPECT_LE(made, atMost) << name;
  if (answer != 0) return;
  EXPECT_EQ(made, gone) << name;
  EXPECT_EQ(texts, ObjectsOf(held[0])) << name;
}

}  // namespace zor::test
