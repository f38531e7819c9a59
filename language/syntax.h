// The items of a model as they are written, before names are looked up.
#pragma once

#include <cstddef>
#include <span>
#include <vector>

#include "language/diagnostics.h"
#include "language/lexer.h"
#include "network/ZORModel.h"

namespace zornet {

// A constant or a name where a value stands.
struct Word {
  enum Type { Name, Text, Number, Truth };

  Type type = Name;
  Token token;
};

struct TypeSyntax {
  Sort sort = Sort::Text;
  std::vector<Word> members;  // of a set; of an interval its two ends
  Extent extent;
};

struct DeclarationSyntax {
  TypeSyntax type;
  Token name;
  std::vector<Word> value;  // empty when there is none
  bool setValue = false;    // written in braces
  Extent valueExtent;
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
  std::vector<Token> outputs;
  std::vector<Token> broken;  // names whose declaration could not be read

  std::span<const Word> ArgumentsOf(const ConstraintSyntax& constraint) const {
    return std::span(arguments).subspan(constraint.firstArgument, constraint.arguments);
  }
};

Syntax Parse(const Source& source, Diagnostics& diagnostics);

}  // namespace zornet
