// What the words of a model stand for.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "language/diagnostics.h"
#include "language/reader.h"
#include "language/syntax.h"
#include "network/ZORModel.h"

namespace zornet {

std::string_view Describe(Word::Type type);

inline constexpr int kUnknown = -1;

// What a name stands for.
struct Named {
  DeclarationSyntax::What what;
  Extent place;
  int index = kUnknown;              // of a variable, of the first one of an array, of a set
  std::int64_t first = 0, last = 0;  // of an array
  Range constants = {};              // of an array of them

  bool IsArray() const { return what == DeclarationSyntax::Variables || what == DeclarationSyntax::Constants; }
};

// Makes the model of what is written: first its names, then its constraints and outputs.
class Resolver {
 public:
  Resolver(const Syntax& syntax, Diagnostics& diagnostics) : mSyntax(syntax), mDiagnostics(diagnostics) {
    for (const Token& token : syntax.broken) mBroken.insert(token.text);
  }

  ReadModel Resolve();

 private:
  using Members = std::vector<Argument>;

  std::size_t CountConstants() const;

  // Declarations.
  Named* Introduce(const DeclarationSyntax& declaration);
  bool Declare(const DeclarationSyntax& declaration, Named& named);
  void DeclareSet(const DeclarationSyntax& declaration, Named& named);
  void DeclareVariable(const DeclarationSyntax& declaration, Named& named);
  bool DeclareArray(const DeclarationSyntax& declaration, Named& named);
  bool DeclareConstants(const DeclarationSyntax& declaration, Named& named);
  bool SetIndices(const DeclarationSyntax& declaration, Named& named);
  bool SetType(const TypeSyntax& type, Variable& variable);
  bool SetNamedType(const Token& name, Variable& variable);
  bool SetValue(const DeclarationSyntax& declaration, Variable& variable);
  bool IsAllowed(const Variable& variable, const Word& word) const;
  bool Collect(std::span<const Word> words, Word::Type expected, Variable& variable);
  bool CollectTexts(std::span<const Word> words, std::vector<std::string>& texts);
  bool IsOf(const Word& word, Word::Type expected);
  bool Spend(std::size_t values, Extent place);
  int AddConstant(const Word& word);
  int AddVariable(Variable variable, Extent place);

  // Constraints. What answers false or kUnknown has told an error.
  void Add(const ConstraintSyntax& syntax);
  bool AddArgument(const Kind& kind, std::size_t place, const Word& word);
  bool AddList(const Kind& kind, std::size_t place, const Word& word);
  bool AddMember(const Kind& kind, std::size_t place, const Word& word, Members& members);
  bool AddArray(const Kind& kind, std::size_t place, const Word& word, const Named& array, Members& members);
  bool AddRows(const Kind& kind, std::size_t place, const Word& word);
  void RefuseExpression(const Kind& kind, std::span<const Word> arguments, const ExpressionError& error);
  bool Refuse(const Kind& kind, std::size_t place, const Word& word, std::string_view is);
  const Kind* FindKindFor(const ConstraintSyntax& constraint);
  int VariableFor(const Kind& kind, std::size_t place, const Word& word);
  int VariableOf(const Kind& kind, std::size_t place, const Word& word);

  void AddOutput(const Word& word);

  // Names.
  const Named* Find(const Token& name);
  const Named* FindArray(const Word& word) const;  // null when the word is no name of one
  int ElementOf(const Word& word);
  Word Literal(const Word& word) const;
  void TellPlace(const Token& name, const Named& named);
  std::string Written(const Word& name) const;
  Sort SortOf(int variable) const { return mModel.Variables()[static_cast<std::size_t>(variable)].sort; }

  const Syntax& mSyntax;
  Diagnostics& mDiagnostics;
  ReadModel mRead;
  Model& mModel = mRead.model;
  std::vector<Variable> mSets;           // those with a name: of each a variable that ranges over it
  std::vector<std::string_view> mViews;  // of the texts that are collected
  std::vector<Argument> mArguments;      // of the constraint that is added
  std::size_t mListed = 0;               // in its list
  std::unordered_map<std::string_view, Named> mNames;
  std::unordered_set<std::string_view> mBroken;  // of these it was told already that something is wrong
  std::size_t mValues = 0;                       // of the limited ones
};

}  // namespace zornet
