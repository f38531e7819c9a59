// The one table of constraint kinds: what a constraint is called, what it takes and what it means.
#pragma once

#include <array>
#include <span>
#include <string_view>

namespace zornet {

// What a constraint says. Relations are told by a truth value where the constraint has one as its last argument;
// a function gives its last argument.
enum class Meaning {
  Equal,
  Unequal,
  NotAbove,  // first <= second
  Below,     // first < second
  Concatenation,
  Slice,  // characters from one position to another, both in
  Length,
  Lower,
  Upper,
  Minimum,
  Maximum,
  Successor,
  TextForm,
};

enum class Takes { Text, Integer, Boolean, Anything };

struct Kind {
  std::string_view name;
  Meaning meaning;
  bool mirrored;  // the relation with first and second exchanged
  bool truth;     // the last argument tells whether the relation holds
  int arity;
  std::array<Takes, 4> takes;
  std::array<std::string_view, 4> roles;

  bool IsRelation() const { return meaning <= Meaning::Below; }
  int Inputs() const { return arity - 1; }  // of a function: its result comes last
};

inline constexpr int kMostArguments = 4;

std::span<const Kind> Kinds();
const Kind* FindKind(std::string_view name);  // null when there is none
std::string_view Describe(Takes takes);

}  // namespace zornet
