// What the words of a model stand for.
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory_resource>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>
#include <utility>
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
  std::int32_t first = 0, last = 0;  // of an array
  Range constants = {};              // of an array of them

  std::int64_t Size() const { return std::int64_t{last} - first + 1; }  // of an array, else 1
  bool IsArray() const { return what == DeclarationSyntax::Variables || what == DeclarationSyntax::Constants; }
};

// Makes the model of what is written: first its names, then its constraints and outputs.
class Resolver {
 public:
  Resolver(Syntax syntax, Diagnostics& diagnostics) : mSyntax(std::move(syntax)), mDiagnostics(diagnostics) {
    for (const Token& token : mSyntax.broken) mBroken.insert(token.text);
  }

  ReadModel Resolve();

 private:
  using Members = std::vector<Argument>;

  std::size_t CountConstants() const;

  // Declarations.
  Named* Introduce(const DeclarationSyntax& declaration);
  bool Declare(DeclarationSyntax& declaration, Named& named);
  void DeclareSet(DeclarationSyntax& declaration, Named& named);
  void DeclareVariable(DeclarationSyntax& declaration, Named& named);
  bool DeclareArray(DeclarationSyntax& declaration, Named& named);
  bool DeclareConstants(const DeclarationSyntax& declaration, Named& named);
  bool SetIndices(const DeclarationSyntax& declaration, Named& named);
  bool SetType(TypeSyntax& type, Variable& variable);
  bool SetNamedType(const Token& name, Variable& variable);
  bool SetValue(const DeclarationSyntax& declaration, Variable& variable);
  bool IsAllowed(const Variable& variable, const Word& word) const;
  bool Collect(std::span<const Word> words, Word::Type expected, Variable& variable);
  bool IsOf(const Word& word, Word::Type expected);
  bool Spend(std::size_t values, Extent place);
  int AddConstant(const Word& word);
  int AddVariable(Variable variable, Extent place);

  // Constraints. What answers false or kUnknown has told an error.
  void Add(const ConstraintSyntax& syntax);
  std::span<const Word> TakeArguments(const ConstraintSyntax& syntax);
  bool AddArgument(const Kind& kind, std::size_t place, const Word& word);
  bool AddList(const Kind& kind, std::size_t place, const Word& word);
  bool AddMember(const Kind& kind, std::size_t place, const Word& word, Members& members);
  bool AddArray(const Kind& kind, std::size_t place, const Word& word, const Named& array, Members& members);
  bool AddRows(const Kind& kind, std::size_t place, const Word& word);
  void RefuseExpression(const Kind& kind, std::span<const Word> arguments, const ExpressionError& error);
  bool Refuse(const Kind& kind, std::size_t place, const Word& word, std::string_view is);
  const Kind* FindKindFor(const ConstraintSyntax& constraint, std::span<const Word> arguments);
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

  Syntax mSyntax;  // given back while the model grows
  Diagnostics& mDiagnostics;
  ReadModel mRead;
  Model& mModel = mRead.model;
  std::vector<Variable> mSets;       // those with a name: of each a variable that ranges over it
  std::size_t mTaken = 0;            // arguments of the constraints before
  std::vector<Word> mWritten;        // arguments of the constraint that is added
  std::vector<Argument> mArguments;  // of the constraint that is added
  std::size_t mListed = 0;           // in its list
  std::pmr::monotonic_buffer_resource mNamesMemory;
  std::pmr::unordered_map<std::string_view, Named> mNames{&mNamesMemory};
  bool mHasArrays = false;
  std::unordered_set<std::string_view> mBroken;  // of these it was told already that something is wrong
  std::size_t mValues = 0;                       // of the limited ones
};

}  // namespace zornet
