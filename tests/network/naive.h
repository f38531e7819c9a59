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

struct Network;
struct Constraint;
using Assignment = std::vector<Value>;
using Image = std::optional<Value>;

// The values of the arguments of a constraint.
struct Arguments {
  const Network& network;
  const Constraint& constraint;
  const Assignment& values;

  const Value& operator[](std::size_t i) const;
  const std::string& Text(std::size_t i) const { return (*this)[i].text; }
  Type TypeOf(std::size_t i) const;
};

// What a constraint means on exact values: the value it computes from its operands, nothing where there is none. A
// truth value makes it a relation, which holds where that is true; reified, the truth value is its last argument.
struct Meaning {
  const char* name;
  const char* takes;  // t: a text, i: an integer, b: a truth value, a: anything
  char gives;
  Image (*image)(const Arguments& operands);
};

struct Constraint {
  const Meaning* meaning;
  bool result;  // whether the last argument is the result
  std::vector<int> arguments;

  std::string Name() const { return meaning->name + std::string(result && meaning->gives == 'b' ? "_reif" : ""); }
};

struct Network {
  std::vector<Variable> variables;
  std::vector<Constraint> constraints;

  zornet::Model Build() const;  // variable 3 is called v3
};

inline const Value& Arguments::operator[](std::size_t i) const {
  return values[static_cast<std::size_t>(constraint.arguments[i])];
}
inline Type Arguments::TypeOf(std::size_t i) const {
  return network.variables[static_cast<std::size_t>(constraint.arguments[i])].type;
}

bool Holds(const Network& network, const Constraint& constraint, const Assignment& values);

// Calls found for each assignment that satisfies every constraint. Where anything is possible, the texts of universe
// (or numbers around zero) are tried, and whatever a constraint computes for the variable.
void Solve(const Network& network, const std::vector<std::string>& universe,
           const std::function<void(const Assignment&)>& found);

// A network over the texts of a small universe.
Network Random(std::mt19937& random, std::vector<std::string>& universe);

}  // namespace naive
