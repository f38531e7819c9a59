// The variables, sets and arrays of a model.
#include <fmt/core.h>

#include <algorithm>
#include <iterator>
#include <utility>

#include "host/ZORNumbers.h"
#include "language/resolver.h"
#include "language/spelling.h"

namespace zornet {

namespace {

constexpr std::size_t kMostValues = 1 << 24;  // that named sets, files and arrays may multiply to

Word::Type MemberType(Sort sort) {
  if (IsText(sort)) return Word::Text;
  return sort == Sort::Boolean ? Word::Truth : Word::Number;
}

}  // namespace

Named* Resolver::Introduce(const DeclarationSyntax& declaration) {
  const Token& name = declaration.name;
  const auto [known, isNew] = mNames.try_emplace(name.text, Named{declaration.what, name.extent});
  mHasArrays = mHasArrays || known->second.IsArray();
  if (isNew) return &known->second;
  mDiagnostics.Error(name.extent, fmt::format("'{}' is declared already", name.text));
  mDiagnostics.Note(known->second.place, "here");
  return nullptr;
}

// No: the name is of no use.
bool Resolver::Declare(DeclarationSyntax& declaration, Named& named) {
  switch (declaration.what) {
    case DeclarationSyntax::Variable:
      DeclareVariable(declaration, named);
      return true;
    case DeclarationSyntax::Variables:
      return DeclareArray(declaration, named);
    case DeclarationSyntax::Constants:
      return DeclareConstants(declaration, named);
    case DeclarationSyntax::Set:
      return true;
  }
  return false;
}

void Resolver::DeclareSet(DeclarationSyntax& declaration, Named& named) {
  named.index = static_cast<int>(mSets.size());
  Variable variable{"", declaration.type.sort, {}, {}};
  SetType(declaration.type, variable);
  mSets.push_back(std::move(variable));
}

void Resolver::DeclareVariable(DeclarationSyntax& declaration, Named& named) {
  Variable variable{std::string(declaration.name.text), declaration.type.sort, {}, {}};
  if (SetType(declaration.type, variable)) SetValue(declaration, variable);
  named.index = AddVariable(std::move(variable), declaration.name.extent);
}

bool Resolver::DeclareArray(DeclarationSyntax& declaration, Named& named) {
  Variable variable{"", declaration.type.sort, {}, {}};
  if (!SetIndices(declaration, named) || !SetType(declaration.type, variable)) return false;
  const auto size = static_cast<std::size_t>(named.Size());
  if (!Spend(size * (1 + variable.texts.size() + variable.numbers.size()), declaration.name.extent)) return false;
  named.index = static_cast<int>(mModel.Variables().size());
  for (std::int64_t index = named.first; index <= named.last; ++index) {
    variable.name = fmt::format("{}[{}]", declaration.name.text, index);
    AddVariable(variable, declaration.name.extent);
  }
  return true;
}

bool Resolver::DeclareConstants(const DeclarationSyntax& declaration, Named& named) {
  if (!SetIndices(declaration, named)) return false;
  Variable all;
  const DetailSyntax& details = *declaration.details;
  named.constants = details.value;
  if (!Collect(details.value.Words(), MemberType(declaration.type.sort), all)) return false;
  if (static_cast<std::uint64_t>(named.Size()) == details.value.count) return true;
  mDiagnostics.Error(details.valueExtent,
                     fmt::format("the array has {} elements, not {}", named.Size(), details.value.count));
  return false;
}

bool Resolver::SetIndices(const DeclarationSyntax& declaration, Named& named) {
  const std::span<const Word> ends = declaration.details->indices.Words();
  named.first = ends[0].token.number;
  named.last = ends[1].token.number;
  if (named.first <= named.last) return true;
  mDiagnostics.Error({ends[0].token.extent.begin, ends[1].token.extent.End() - ends[0].token.extent.begin},
                     "the last index is below the first");
  return false;
}

bool Resolver::SetType(TypeSyntax& type, Variable& variable) {
  if (type.HasName()) return SetNamedType(type.members.Words().front().token, variable);
  variable.texts = std::move(type.texts);
  if (type.members.count == 0) return true;
  const std::span<const Word> members = type.members.Words();
  if (members.front().token.type == Token::Line && !Spend(members.size(), type.extent)) return false;
  if (!Collect(members, MemberType(type.sort), variable)) return false;
  if (type.sort == Sort::Interval && members[0].token.number > members[1].token.number) {
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

bool Resolver::SetNamedType(const Token& name, Variable& variable) {
  const auto found = mNames.find(name.text);
  if (found != mNames.end() && found->second.what == DeclarationSyntax::Set) {
    const Variable& set = mSets[static_cast<std::size_t>(found->second.index)];
    variable.sort = set.sort;
    if (!Spend(set.texts.size() + set.numbers.size(), name.extent)) return false;
    variable.texts = set.texts;
    variable.numbers = set.numbers;
    return true;
  }
  if (mBroken.contains(name.text)) return false;
  std::vector<std::string_view> types(std::begin(kTypes), std::end(kTypes));
  for (const auto& [known, named] : mNames) {
    if (named.what == DeclarationSyntax::Set) types.push_back(known);
  }
  std::sort(types.begin(), types.end());
  mDiagnostics.Error(name.extent, fmt::format("expected {}{}", kAnyType, Suggestion(name.text, types)));
  return false;
}

// The words as the variable's texts or numbers, in order and each once.
bool Resolver::Collect(std::span<const Word> words, Word::Type expected, Variable& variable) {
  variable.texts.clear();
  variable.numbers.clear();
  expected == Word::Text ? variable.texts.reserve(words.size()) : variable.numbers.reserve(words.size());
  for (const Word& word : words) {
    if (!IsOf(word, expected)) return false;
    if (expected == Word::Text) variable.texts.push_back(Unescaped(word.token));
    if (expected == Word::Number) variable.numbers.push_back(static_cast<std::int32_t>(word.token.number));
    if (expected == Word::Truth) variable.numbers.push_back(word.token.Is("true") ? 1 : 0);
  }
  SortUnique(variable.texts);
  SortUnique(variable.numbers);
  return true;
}

bool Resolver::IsOf(const Word& word, Word::Type expected) {
  if (word.type == expected) return true;
  mDiagnostics.Error(word.token.extent,
                     fmt::format("expected {}, this is {}", Describe(expected), Describe(word.type)));
  return false;
}

// A few words of a model could ask for more than any memory holds.
bool Resolver::Spend(std::size_t values, Extent place) {
  const bool within = mValues <= kMostValues;
  mValues += std::min(values, kMostValues + 1);
  if (mValues <= kMostValues) return true;
  if (within)
    mDiagnostics.Error(place, fmt::format("the sets and arrays up to here hold more than {} values", kMostValues));
  return false;
}

bool Resolver::SetValue(const DeclarationSyntax& declaration, Variable& variable) {
  if (declaration.details == nullptr) return true;
  const DetailSyntax& details = *declaration.details;
  const Sort sort = variable.sort;
  if (details.setValue && sort != Sort::TextSet && sort != Sort::IntegerSet) {
    mDiagnostics.Error(details.valueExtent, fmt::format("a set is no value for {}", NamesOf(sort).described));
    mDiagnostics.Note(declaration.type.extent, "the type is declared here");
    return false;
  }
  const std::span<const Word> value = details.value.Words();
  Variable given = variable;
  if (!Collect(value, MemberType(sort), given)) return false;
  for (const Word& word : value) {
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
  if (word.type == Word::Text)
    return std::binary_search(variable.texts.begin(), variable.texts.end(), Unescaped(word.token));
  return std::binary_search(variable.numbers.begin(), variable.numbers.end(), number);
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

}  // namespace zornet
