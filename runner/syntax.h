// The items of a model as they are written, before names are looked up.
#pragma once

#include <vector>

#include "runner/diagnostics.h"
#include "runner/lexer.h"
#include "runner/model.h"

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
  std::vector<Word> arguments;
  Extent extent;
};

struct Syntax {
  std::vector<DeclarationSyntax> declarations;
  std::vector<ConstraintSyntax> constraints;
  std::vector<Token> outputs;
  std::vector<Token> broken;  // names whose declaration could not be read
};

Syntax Parse(const Source& source, Diagnostics& diagnostics);

}  // namespace zornet
