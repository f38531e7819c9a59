// Small random networks, and what their solutions are: a second, plain reading of the constraints on std::string, and
// every assignment tried.
#pragma once

#include <cstdint>
#include <functional>
#include <optional>
#include <random>
#include <string>
#include <vector>

#include "network/ZORModel.h"

namespace naive {

inline constexpr std::size_t kLongest = 255;

// A text, or a number where the variable is one. Truth values are 0 and 1.
struct Value {
  std::string text;
  std::int64_t number = 0;

  auto operator<=>(const Value&) const = default;
};

enum class Type { Text, TextSet, Integer, Interval, IntegerSet, Boolean };  // in the order of zornet::Sort
inline bool IsText(Type type) { return type == Type::Text || type == Type::TextSet; }

struct Variable {
  Type type = Type::Text;
  std::vector<Value> domain;  // empty: anything
};

struct Constraint {
  const zornet::Kind* kind;
  std::vector<int> arguments;
  std::size_t members = 0;                          // so many of the first arguments are a list
  std::string expression = {};                      // of a constraint that takes one
  std::vector<std::vector<std::string>> rows = {};  // of a table
};

struct Network {
  std::vector<Variable> variables;
  std::vector<Constraint> constraints;

  zornet::Model Build() const;  // variable 3 is called v3
};

using Assignment = std::vector<Value>;

bool Holds(const Network& network, const Constraint& constraint, const Assignment& values);

// Calls found for each assignment that satisfies every constraint. Where anything is possible, the texts of universe
// (or numbers around zero) are tried, and whatever a constraint computes for the variable.
void Solve(const Network& network, const std::vector<std::string>& universe,
           const std::function<void(const Assignment&)>& found);

// A network over the texts of a small universe.
Network Random(std::mt19937& random, std::vector<std::string>& universe);

}  // namespace naive
