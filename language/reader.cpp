#include "language/reader.h"

#include <fmt/core.h>

#include <algorithm>
#include <cstdint>
#include <unordered_map>
#include <unordered_set>
#include <utility>

#include "host/ZORNumbers.h"
#include "language/spelling.h"
#include "language/syntax.h"

namespace zornet {

namespace {

std::string_view Describe(Word::Type type) {
  switch (type) {
    case Word::Text:
      return "a text";
    case Word::Number:
      return "an integer";
    case Word::Truth:
      return "a truth value";
    case Word::Name:
      return "a name";
  }
  return "";
}

std::string_view Describe(Takes takes) {
  switch (takes) {
    case Takes::Text:
      return "a text";
    case Takes::Integer:
      return "an integer";
    case Takes::Boolean:
      return "a truth value";
    case Takes::Anything:
      return "anything";
    case Takes::Expression:
      return "a regular expression";
    case Takes::Rows:
      return "the rows of a table";
    case Takes::Texts:
      return "a list of texts";
    case Takes::Integers:
      return "a list of integers";
    case Takes::Booleans:
      return "a list of truth values";
  }
  return "";
}

Word::Type MemberType(Sort sort) {
  if (IsText(sort)) return Word::Text;
  return sort == Sort::Boolean ? Word::Truth : Word::Number;
}

template <class T>
void SortUnique(std::vector<T>& values) {
  std::sort(values.begin(), values.end());
  values.erase(std::unique(values.begin(), values.end()), values.end());
}

class Resolver {
 public:
  Resolver(const Syntax& syntax, Diagnostics& diagnostics) : mSyntax(syntax), mDiagnostics(diagnostics) {
    for (const Token& token : syntax.broken) mBroken.insert(token.text);
  }

  ReadModel Resolve() {
    mNames.reserve(mSyntax.declarations.size());
    const std::size_t variables = mSyntax.declarations.size() + CountConstants();
    mModel.Reserve(variables, mSyntax.constraints.size());
    mRead.places.variables.reserve(variables);
    mRead.places.constraints.reserve(mSyntax.constraints.size());
    for (const DeclarationSyntax& declaration : mSyntax.declarations) Declare(declaration);
    for (const ConstraintSyntax& constraint : mSyntax.constraints) Add(constraint);
    for (const Token& name : mSyntax.outputs) AddOutput(name);
    return std::move(mRead);
  }

 private:
  std::size_t CountConstants() const;
  void Declare(const DeclarationSyntax& declaration);
  bool SetType(const TypeSyntax& type, Variable& variable);
  bool SetValue(const DeclarationSyntax& declaration, Variable& variable);
  bool IsAllowed(const Variable& variable, const Word& word) const;
  bool Collect(std::span<const Word> words, Word::Type expected, Variable& variable);
  void Add(const ConstraintSyntax& constraint);
  void RefuseExpression(const Kind& kind, std::span<const Word> arguments, const ExpressionError& error);
  const Kind* FindKindFor(const ConstraintSyntax& constraint);
  int AddArgument(const Word& word, Takes takes, std::string_view constraint, std::string_view role);
  int AddConstant(const Word& word);
  int Find(const Token& name);
  int AddVariable(Variable variable, Extent place);
  Extent PlaceOf(int variable) const { return mRead.places.variables[static_cast<std::size_t>(variable)]; }
  void AddOutput(const Token& name);

  const Syntax& mSyntax;
  Diagnostics& mDiagnostics;
  ReadModel mRead;
  Model& mModel = mRead.model;
  std::vector<Argument> mArguments;  // of the constraint that is added
  std::unordered_map<std::string_view, int> mNames;
  std::unordered_set<std::string_view> mBroken;  // of these it was told already that something is wrong
};

constexpr int kUnknown = -1;

std::size_t Resolver::CountConstants() const {
  const auto& words = mSyntax.arguments;
  return static_cast<std::size_t>(
      std::count_if(words.begin(), words.end(), [](const Word& word) { return word.type != Word::Name; }));
}

void Resolver::Declare(const DeclarationSyntax& declaration) {
  const auto known = mNames.find(declaration.name.text);
  if (known != mNames.end()) {
    mDiagnostics.Error(declaration.name.extent, fmt::format("'{}' is declared already", declaration.name.text));
    mDiagnostics.Note(PlaceOf(known->second), "here");
    return;
  }
  Variable variable{std::string(declaration.name.text), declaration.type.sort, {}, {}};
  if (SetType(declaration.type, variable)) SetValue(declaration, variable);
  mNames.emplace(declaration.name.text, AddVariable(std::move(variable), declaration.name.extent));
}

bool Resolver::SetType(const TypeSyntax& type, Variable& variable) {
  if (type.members.empty()) return true;
  if (!Collect(type.members, MemberType(type.sort), variable)) return false;
  if (type.sort == Sort::Interval && type.members[0].token.number > type.members[1].token.number) {
    mDiagnostics.Error(type.extent, "the upper end of the interval is below the lower");
    return false;
  }
  if (type.sort == Sort::Interval) variable.numbers.resize(2, variable.numbers.front());
  if (type.sort == Sort::IntegerSet && variable.numbers.size() > ZORVadEnumInteger::kListLimit) {
    mDiagnostics.Error(type.extent, fmt::format("a set has at most {} integers, this one has {}",
                                                ZORVadEnumInteger::kListLimit, variable.numbers.size()));
    return false;
  }
  return true;
}

// The words as the variable's texts or numbers, in order and each once.
bool Resolver::Collect(std::span<const Word> words, Word::Type expected, Variable& variable) {
  variable.texts.clear();
  variable.numbers.clear();
  for (const Word& word : words) {
    if (word.type != expected) {
      mDiagnostics.Error(word.token.extent,
                         fmt::format("expected {}, this is {}", Describe(expected), Describe(word.type)));
      return false;
    }
    if (expected == Word::Text) variable.texts.emplace_back(word.token.text);
    if (expected == Word::Number) variable.numbers.push_back(static_cast<std::int32_t>(word.token.number));
    if (expected == Word::Truth) variable.numbers.push_back(word.token.Is("true") ? 1 : 0);
  }
  SortUnique(variable.texts);
  SortUnique(variable.numbers);
  return true;
}

bool Resolver::SetValue(const DeclarationSyntax& declaration, Variable& variable) {
  if (declaration.value.empty()) return true;
  const Sort sort = variable.sort;
  if (declaration.setValue && sort != Sort::TextSet && sort != Sort::IntegerSet) {
    mDiagnostics.Error(declaration.valueExtent, fmt::format("a set is no value for {}", NamesOf(sort).described));
    mDiagnostics.Note(declaration.type.extent, "the type is declared here");
    return false;
  }
  Variable given = variable;
  if (!Collect(declaration.value, MemberType(sort), given)) return false;
  for (const Word& word : declaration.value) {
    if (IsAllowed(variable, word)) continue;
    mDiagnostics.Error(word.token.extent, "the type does not allow this value");
    mDiagnostics.Note(declaration.type.extent, "the type is declared here");
    return false;
  }
  if (sort == Sort::Interval) given.numbers.resize(2, given.numbers.front());
  variable = std::move(given);
  return true;
}

bool Resolver::IsAllowed(const Variable& variable, const Word& word) const {
  const auto number = static_cast<std::int32_t>(word.token.number);
  if (variable.sort == Sort::Interval) return variable.numbers.front() <= number && number <= variable.numbers.back();
  if (variable.texts.empty() && variable.numbers.empty()) return true;
  if (word.type == Word::Text) return std::binary_search(variable.texts.begin(), variable.texts.end(), word.token.text);
  return std::binary_search(variable.numbers.begin(), variable.numbers.end(), number);
}

void Resolver::Add(const ConstraintSyntax& syntax) {
  const Kind* kind = FindKindFor(syntax);
  if (kind == nullptr) return;
  mArguments.clear();
  bool good = true;
  const std::span<const Word> arguments = mSyntax.ArgumentsOf(syntax);
  for (std::size_t i = 0; i < arguments.size(); ++i) {
    if (kind->takes[i] == Takes::Expression && arguments[i].type == Word::Text) {
      mArguments.emplace_back(std::string(arguments[i].token.text));
      continue;
    }
    const int variable = AddArgument(arguments[i], kind->takes[i], kind->name, kind->roles[i]);
    mArguments.emplace_back(Var{variable});
    good = good && variable != kUnknown;
  }
  if (!good) return;
  try {
    mModel.Post(*kind, mArguments);
  } catch (const ExpressionError& error) {
    RefuseExpression(*kind, arguments, error);
  }
  mRead.places.constraints.push_back(syntax.extent);
}

void Resolver::RefuseExpression(const Kind& kind, std::span<const Word> arguments, const ExpressionError& error) {
  for (std::size_t i = 0; i < arguments.size(); ++i) {
    if (kind.takes[i] != Takes::Expression) continue;
    const Extent quoted = arguments[i].token.extent;
    const std::size_t begin = quoted.begin + 1 + error.offset;
    mDiagnostics.Error({begin, quoted.End() - 1 - begin}, fmt::format("no regular expression: {}", error.what()));
  }
}

// Null when there is no constraint of that name, or when it takes another number of arguments.
const Kind* Resolver::FindKindFor(const ConstraintSyntax& constraint) {
  const Kind* kind = FindKind(constraint.name.text);
  if (kind == nullptr) {
    std::vector<std::string_view> names;
    for (const Kind& other : Kinds()) names.push_back(other.name);
    mDiagnostics.Error(constraint.name.extent, fmt::format("there is no constraint '{}'{}", constraint.name.text,
                                                           Suggestion(constraint.name.text, names)));
    return nullptr;
  }
  if (static_cast<int>(constraint.arguments) == kind->arity) return kind;
  std::string roles(kind->roles[0]);
  for (int i = 1; i < kind->arity; ++i) roles += fmt::format(", {}", kind->roles[static_cast<std::size_t>(i)]);
  mDiagnostics.Error(constraint.extent, fmt::format("{}({}) takes {} arguments, not {}", kind->name, roles, kind->arity,
                                                    constraint.arguments));
  return nullptr;
}

int Resolver::AddArgument(const Word& word, Takes takes, std::string_view constraint, std::string_view role) {
  const int variable = word.type == Word::Name ? Find(word.token) : AddConstant(word);
  if (variable == kUnknown) return kUnknown;
  const Variable& found = mModel.Variables()[static_cast<std::size_t>(variable)];
  if (Fits(found.sort, takes)) return variable;
  const std::string what = word.type == Word::Name ? fmt::format("'{}'", word.token.text) : "this";
  mDiagnostics.Error(word.token.extent, fmt::format("{} takes {} for {}, and {} is {}", constraint, Describe(takes),
                                                    role, what, NamesOf(found.sort).described));
  if (word.type == Word::Name) mDiagnostics.Note(PlaceOf(variable), fmt::format("'{}' is declared here", found.name));
  return kUnknown;
}

int Resolver::AddConstant(const Word& word) {
  Variable constant;
  constant.constant = true;
  if (word.type == Word::Number) constant.sort = Sort::Integer;
  if (word.type == Word::Truth) constant.sort = Sort::Boolean;
  Collect({&word, 1}, word.type, constant);
  return AddVariable(std::move(constant), word.token.extent);
}

// After an error nobody uses the model, and its values may be none that a model can hold.
int Resolver::AddVariable(Variable variable, Extent place) {
  if (mDiagnostics.Failed()) variable = {std::move(variable.name), variable.sort, {}, {}, variable.constant};
  mRead.places.variables.push_back(place);
  return mModel.Add(std::move(variable)).index;
}

int Resolver::Find(const Token& name) {
  const auto found = mNames.find(name.text);
  if (found != mNames.end()) return found->second;
  if (mBroken.contains(name.text) || mDiagnostics.Stopped()) return kUnknown;
  std::vector<std::string_view> names;
  for (const auto& [known, variable] : mNames) names.push_back(known);
  std::sort(names.begin(), names.end());
  const std::string_view closest = Closest(name.text, names);
  mDiagnostics.Error(name.extent, fmt::format("'{}' is not declared{}", name.text, Suggestion(closest)));
  if (closest.empty()) return kUnknown;
  mDiagnostics.Note(PlaceOf(mNames.at(closest)), fmt::format("'{}' is declared here", closest));
  return kUnknown;
}

void Resolver::AddOutput(const Token& name) {
  const int variable = Find(name);
  if (variable != kUnknown) mModel.Want({variable});
}

}  // namespace

ReadModel Read(const Source& source, Diagnostics& diagnostics) {
  const Syntax syntax = Parse(source, diagnostics);
  ReadModel read = Resolver(syntax, diagnostics).Resolve();
  diagnostics.Sort();
  return read;
}

}  // namespace zornet
