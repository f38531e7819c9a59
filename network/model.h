// A model: variables, the constraints between them, and which variables a user wants to see.
#pragma once

#include <array>
#include <string>
#include <vector>

#include "host/ZORText.h"
#include "network/kinds.h"

namespace zornet {

// The value types that a variable can have.
enum class Sort { Text, TextSet, Integer, Interval, IntegerSet, Boolean };
inline constexpr int kSorts = 6;

constexpr bool IsText(Sort sort) { return sort == Sort::Text || sort == Sort::TextSet; }
constexpr bool IsInteger(Sort sort) { return !IsText(sort) && sort != Sort::Boolean; }

// A declared variable, or a constant, which has no name. What it starts with: nothing known when both lists are
// empty; else the texts, or the numbers (of an interval its two ends, of a truth value 0 or 1).
struct Variable {
  std::string name;
  Sort sort = Sort::Text;
  std::vector<std::string> texts;
  std::vector<ZORLong> numbers;

  bool IsConstant() const { return name.empty(); }
};

struct Constraint {
  const Kind* kind = nullptr;
  std::array<int, kMostArguments> arguments{};  // variables by number

  int Result() const { return arguments[static_cast<std::size_t>(kind->Inputs())]; }
};

struct Model {
  std::vector<Variable> variables;
  std::vector<Constraint> constraints;
  std::vector<int> outputs;
};

}  // namespace zornet
