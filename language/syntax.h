// The items of a model as they are written, before names are looked up.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <unordered_map>
#include <vector>

#include "language/diagnostics.h"
#include "language/files.h"
#include "language/inclusion.h"
#include "language/lexer.h"
#include "network/ZORModel.h"

namespace zornet {

inline constexpr std::string_view kTypes[] = {"string", "set", "int", "bool"};
inline constexpr std::string_view kAnyType =
    "a type: string, set string, {\"a\", \"b\"}, int, 1..9, {1, 3}, bool or the name of a set";

// Neighbours in Syntax::members, which are fewer than the bytes of any source. Small, since a model may have millions.
struct Range {
  Range() = default;
  Range(std::size_t from, std::size_t howMany)
      : first(static_cast<std::uint32_t>(from)), count(static_cast<std::uint32_t>(howMany)) {}

  std::uint32_t first = 0, count = 0;
};

// What stands where a value stands: a constant, a name, w[3], or in brackets a list or the rows of a table.
struct Word {
  enum Type : char { Name, Text, Number, Truth, Element, List, Rows };

  Type type = Name;
  Token token;  // of an Element the name of its array and the extent of all; of a List or Rows no more than the extent
  Range members = {};  // of an Element its index, of a List what it holds, of Rows lists
};

struct TypeSyntax {
  Sort sort = Sort::Text;
  Range members = {};  // of a set; of an interval its two ends
  Token name = {};     // of a named set, else none
  Extent extent = {};
};

struct DeclarationSyntax {
  enum What { Variable, Variables, Constants, Set };  // in the plural an array

  What what = Variable;
  TypeSyntax type;
  Token name;
  Range value;
  bool setValue = false;  // written in braces or from a file
  Extent valueExtent;
  Range indices;  // of an array the first and the last
};

struct ConstraintSyntax {
  Token name;
  std::size_t firstArgument = 0, arguments = 0;
  Extent extent;
};

struct Syntax {
  std::vector<DeclarationSyntax> declarations;
  std::vector<ConstraintSyntax> constraints;
  std::vector<Word> arguments;  // of all constraints, one after another
  std::vector<Word> members;
  std::vector<Word> outputs;
  std::vector<Token> broken;                     // names whose declaration could not be read
  std::unordered_map<std::size_t, Range> lines;  // by file
  std::vector<Embedded> embedded;

  std::span<const Word> ArgumentsOf(const ConstraintSyntax& constraint) const {
    return std::span(arguments).subspan(constraint.firstArgument, constraint.arguments);
  }
  std::span<const Word> Members(Range range) const { return std::span(members).subspan(range.first, range.count); }
};

// Adds the files that it names to the source.
Syntax Parse(Source& source, const Files& files, Diagnostics& diagnostics);

}  // namespace zornet
