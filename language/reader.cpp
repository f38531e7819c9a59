#include "language/reader.h"

#include <fmt/core.h>

#include <algorithm>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <utility>
#include <vector>

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
    case Word::List:
      return "a list";
    case Word::Rows:
      return "a table";
    case Word::Name:
    case Word::Element:
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

constexpr int kUnknown = -1;
constexpr std::size_t kMostValues = 1 << 24;  // that named sets, files and arrays may multiply to

// What a name stands for.
struct Named {
  DeclarationSyntax::What what;
  Extent place;
  int index = kUnknown;              // of a variable, of the first one of an array, of a set
  std::int64_t first = 0, last = 0;  // of an array
  Range constants = {};              // of an array of them

  bool IsArray() const { return what == DeclarationSyntax::Variables || what == DeclarationSyntax::Constants; }
};

class Resolver {
 public:
  Resolver(const Syntax& syntax, Diagnostics& diagnostics) : mSyntax(syntax), mDiagnostics(diagnostics) {
    for (const Token& token : syntax.broken) mBroken.insert(token.text);
  }

  ReadModel Resolve();

 private:
  using Members = std::vector<Argument>;

  std::size_t CountConstants() const;
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
  bool IsOf(const Word& word, Word::Type expected);
  bool Spend(std::size_t values, Extent place);

  void Add(const ConstraintSyntax& syntax);
  bool AddArgument(const Kind& kind, std::size_t place, const Word& word);
  bool AddList(const Kind& kind, std::size_t place, const Word& word);
  bool AddMember(const Kind& kind, std::size_t place, const Word& word, Members& members);
  bool AddArray(const Kind& kind, std::size_t place, const Word& word, const Named& array, Members& members);
  bool AddRows(const Kind& kind, std::size_t place, const Word& word);
  void RefuseExpression(const Kind& kind, std::span<const Word> arguments, const ExpressionError& error);
  bool Refuse(const Kind& kind, std::size_t place, const Word& word, std::string_view is);
  void TellPlace(const Token& name, const Named& named);
  std::string Written(const Word& name) const;
  const Kind* FindKindFor(const ConstraintSyntax& constraint);
  int VariableFor(const Kind& kind, std::size_t place, const Word& word);
  int VariableOf(const Kind& kind, std::size_t place, const Word& word);
  int ElementOf(const Word& word);
  int AddConstant(const Word& word);
  int AddVariable(Variable variable, Extent place);
  void AddOutput(const Word& word);

  const Named* Find(const Token& name);
  const Named* FindArray(const Word& word) const;  // null when the word is no name of one
  Word Literal(const Word& word) const;
  Sort SortOf(int variable) const { return mModel.Variables()[static_cast<std::size_t>(variable)].sort; }

  const Syntax& mSyntax;
  Diagnostics& mDiagnostics;
  ReadModel mRead;
  Model& mModel = mRead.model;
  std::vector<Variable> mSets;       // those with a name: of each a variable that ranges over it
  std::vector<Argument> mArguments;  // of the constraint that is added
  std::size_t mListed = 0;           // in its list
  std::unordered_map<std::string_view, Named> mNames;
  std::unordered_set<std::string_view> mBroken;  // of these it was told already that something is wrong
  std::size_t mValues = 0;                       // of the limited ones
};

ReadModel Resolver::Resolve() {
  const std::vector<DeclarationSyntax>& declarations = mSyntax.declarations;
  mNames.reserve(declarations.size());
  const std::size_t variables = declarations.size() + CountConstants();
  mModel.Reserve(variables, mSyntax.constraints.size());
  mRead.places.variables.reserve(variables);
  mRead.places.constraints.reserve(mSyntax.constraints.size());
  std::vector<Named*> named;
  named.reserve(declarations.size());
  for (const DeclarationSyntax& declaration : declarations) named.push_back(Introduce(declaration));
  for (std::size_t i = 0; i < declarations.size(); ++i) {
    if (named[i] != nullptr && declarations[i].what == DeclarationSyntax::Set) DeclareSet(declarations[i], *named[i]);
  }
  for (std::size_t i = 0; i < declarations.size(); ++i) {
    if (named[i] == nullptr || Declare(declarations[i], *named[i])) continue;
    mBroken.insert(declarations[i].name.text);
    mNames.erase(declarations[i].name.text);
  }
  for (const ConstraintSyntax& constraint : mSyntax.constraints) Add(constraint);
  for (const Word& word : mSyntax.outputs) AddOutput(word);
  mRead.places.embedded = mSyntax.embedded;
  return std::move(mRead);
}

std::size_t Resolver::CountConstants() const {
  const auto& words = mSyntax.arguments;
  return static_cast<std::size_t>(
      std::count_if(words.begin(), words.end(), [](const Word& word) { return word.type != Word::Name; }));
}

Named* Resolver::Introduce(const DeclarationSyntax& declaration) {
  const Token& name = declaration.name;
  const auto [known, isNew] = mNames.try_emplace(name.text, Named{declaration.what, name.extent});
  if (isNew) return &known->second;
  mDiagnostics.Error(name.extent, fmt::format("'{}' is declared already", name.text));
  mDiagnostics.Note(known->second.place, "here");
  return nullptr;
}

// No: the name is of no use.
bool Resolver::Declare(const DeclarationSyntax& declaration, Named& named) {
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

void Resolver::DeclareSet(const DeclarationSyntax& declaration, Named& named) {
  named.index = static_cast<int>(mSets.size());
  Variable variable{"", declaration.type.sort, {}, {}};
  SetType(declaration.type, variable);
  mSets.push_back(std::move(variable));
}

void Resolver::DeclareVariable(const DeclarationSyntax& declaration, Named& named) {
  Variable variable{std::string(declaration.name.text), declaration.type.sort, {}, {}};
  if (SetType(declaration.type, variable)) SetValue(declaration, variable);
  named.index = AddVariable(std::move(variable), declaration.name.extent);
}

bool Resolver::DeclareArray(const DeclarationSyntax& declaration, Named& named) {
  Variable variable{"", declaration.type.sort, {}, {}};
  if (!SetIndices(declaration, named) || !SetType(declaration.type, variable)) return false;
  const auto size = static_cast<std::size_t>(named.last - named.first + 1);
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
  named.constants = declaration.value;
  if (!Collect(mSyntax.Members(declaration.value), MemberType(declaration.type.sort), all)) return false;
  const std::int64_t size = named.last - named.first + 1;
  if (static_cast<std::uint64_t>(size) == declaration.value.count) return true;
  mDiagnostics.Error(declaration.valueExtent,
                     fmt::format("the array has {} elements, not {}", size, declaration.value.count));
  return false;
}

bool Resolver::SetIndices(const DeclarationSyntax& declaration, Named& named) {
  const std::span<const Word> ends = mSyntax.Members(declaration.indices);
  named.first = ends[0].token.number;
  named.last = ends[1].token.number;
  if (named.first <= named.last) return true;
  mDiagnostics.Error({ends[0].token.extent.begin, ends[1].token.extent.End() - ends[0].token.extent.begin},
                     "the last index is below the first");
  return false;
}

bool Resolver::SetType(const TypeSyntax& type, Variable& variable) {
  if (type.name.type == Token::Name) return SetNamedType(type.name, variable);
  if (type.members.count == 0) return true;
  const std::span<const Word> members = mSyntax.Members(type.members);
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
  if (declaration.value.count == 0) return true;
  const Sort sort = variable.sort;
  if (declaration.setValue && sort != Sort::TextSet && sort != Sort::IntegerSet) {
    mDiagnostics.Error(declaration.valueExtent, fmt::format("a set is no value for {}", NamesOf(sort).described));
    mDiagnostics.Note(declaration.type.extent, "the type is declared here");
    return false;
  }
  const std::span<const Word> value = mSyntax.Members(declaration.value);
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

void Resolver::Add(const ConstraintSyntax& syntax) {
  const Kind* kind = FindKindFor(syntax);
  if (kind == nullptr) return;
  mArguments.clear();
  mListed = 0;
  bool good = true;
  const std::span<const Word> arguments = mSyntax.ArgumentsOf(syntax);
  for (std::size_t i = 0; i < arguments.size(); ++i) good = AddArgument(*kind, i, arguments[i]) && good;
  if (!good) return;
  try {
    mModel.Post(*kind, mArguments);
  } catch (const ExpressionError& error) {
    RefuseExpression(*kind, arguments, error);
  }
  mRead.places.constraints.push_back(syntax.extent);
}

bool Resolver::AddArgument(const Kind& kind, std::size_t place, const Word& word) {
  const Takes takes = kind.takes[place];
  if (IsList(takes)) return AddList(kind, place, word);
  if (takes == Takes::Rows) return AddRows(kind, place, word);
  const Word literal = Literal(word);
  if (takes == Takes::Expression && literal.type == Word::Text) {
    mArguments.emplace_back(Unescaped(literal.token));
    return true;
  }
  const int variable = VariableFor(kind, place, word);
  mArguments.emplace_back(Var{variable});
  return variable != kUnknown;
}

bool Resolver::AddList(const Kind& kind, std::size_t place, const Word& word) {
  Members members;
  bool good = true;
  if (word.type == Word::List) {
    for (const Word& member : mSyntax.Members(word.members)) good = AddMember(kind, place, member, members) && good;
  } else if (const Named* const array = FindArray(word)) {
    good = AddArray(kind, place, word, *array, members);
  } else {
    const int variable = VariableOf(kind, place, word);
    good = variable != kUnknown && Refuse(kind, place, word, NamesOf(SortOf(variable)).described);
  }
  if (good) mListed = members.size();
  mArguments.emplace_back(std::move(members));
  return good;
}

bool Resolver::AddMember(const Kind& kind, std::size_t place, const Word& word, Members& members) {
  if (const Named* const array = FindArray(word)) return AddArray(kind, place, word, *array, members);
  const int variable = VariableFor(kind, place, word);
  members.emplace_back(Var{variable});
  return variable != kUnknown;
}

// All its elements are of one type, so that the first tells whether they fit.
bool Resolver::AddArray(const Kind& kind, std::size_t place, const Word& word, const Named& array, Members& members) {
  const std::int64_t size = array.last - array.first + 1;
  for (std::int64_t i = 0; i < size; ++i) {
    const bool constant = array.what == DeclarationSyntax::Constants;
    const int variable = constant ? AddConstant(mSyntax.Members(array.constants)[static_cast<std::size_t>(i)])
                                  : array.index + static_cast<int>(i);
    if (!Fits(SortOf(variable), MemberOf(kind.takes[place])))
      return Refuse(kind, place, word, "an array of other values");
    members.emplace_back(Var{variable});
  }
  return true;
}

bool Resolver::AddRows(const Kind& kind, std::size_t place, const Word& word) {
  if (word.type != Word::Rows) return Refuse(kind, place, word, "none");
  Rows rows;
  bool good = true;
  for (const Word& row : mSyntax.Members(word.members)) {
    std::vector<std::string>& texts = rows.rows.emplace_back();
    for (const Word& member : mSyntax.Members(row.members)) {
      good = IsOf(member, Word::Text) && good;
      texts.push_back(Unescaped(member.token));
    }
    if (mListed == 0 || texts.size() == mListed) continue;
    mDiagnostics.Error(row.token.extent, fmt::format("a row has a text for each of the {} in the list, this one has {}",
                                                     mListed, texts.size()));
    good = false;
  }
  mArguments.emplace_back(std::move(rows));
  return good && !mDiagnostics.Failed();  // after an error they may be none that a model can hold
}

void Resolver::RefuseExpression(const Kind& kind, std::span<const Word> arguments, const ExpressionError& error) {
  for (std::size_t i = 0; i < arguments.size(); ++i) {
    if (kind.takes[i] != Takes::Expression) continue;
    const Token written = Literal(arguments[i]).token;
    const std::size_t begin = PositionOf(written, error.offset);
    mDiagnostics.Error({begin, written.extent.End() - 1 - begin},
                       fmt::format("no regular expression: {}", error.what()));
  }
}

// Answers false.
bool Resolver::Refuse(const Kind& kind, std::size_t place, const Word& word, std::string_view is) {
  const bool hasName = word.type == Word::Name || word.type == Word::Element;
  const Named* const named = hasName ? Find(word.token) : nullptr;
  if (hasName && named == nullptr) return false;
  mDiagnostics.Error(word.token.extent,
                     fmt::format("{} takes {} for {}, and {} is {}", kind.name, Describe(kind.takes[place]),
                                 kind.roles[place], hasName ? Written(word) : "this", is));
  if (hasName) TellPlace(word.token, *named);
  return false;
}

void Resolver::TellPlace(const Token& name, const Named& named) {
  mDiagnostics.Note(named.place, fmt::format("'{}' is declared here", name.text));
}

std::string Resolver::Written(const Word& name) const {
  if (name.type == Word::Name) return fmt::format("'{}'", name.token.text);
  return fmt::format("'{}[{}]'", name.token.text, mSyntax.Members(name.members).front().token.number);
}

// Null when there is no constraint of that name, or when it takes another number of arguments.
const Kind* Resolver::FindKindFor(const ConstraintSyntax& constraint) {
  const std::span<const Word> arguments = mSyntax.ArgumentsOf(constraint);
  const bool list = std::any_of(arguments.begin(), arguments.end(), [this](const Word& word) {
    return word.type == Word::List || FindArray(word) != nullptr;
  });
  const Kind* kind = FindKind(constraint.name.text, list);
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
  mDiagnostics.Error(constraint.extent, fmt::format("{}({}) takes {} argument{}, not {}", kind->name, roles,
                                                    kind->arity, kind->arity == 1 ? "" : "s", constraint.arguments));
  return nullptr;
}

// A variable that fits there, or in a list there. kUnknown after an error.
int Resolver::VariableFor(const Kind& kind, std::size_t place, const Word& word) {
  const int variable = VariableOf(kind, place, word);
  if (variable == kUnknown || Fits(SortOf(variable), MemberOf(kind.takes[place]))) return variable;
  Refuse(kind, place, word, NamesOf(SortOf(variable)).described);
  return kUnknown;
}

int Resolver::VariableOf(const Kind& kind, std::size_t place, const Word& word) {
  if (word.type == Word::Element && Literal(word).type == Word::Element) return ElementOf(word);
  if (word.type == Word::Name) {
    const Named* const named = Find(word.token);
    if (named == nullptr || named->what == DeclarationSyntax::Variable)
      return named == nullptr ? kUnknown : named->index;
    Refuse(kind, place, word, named->IsArray() ? "an array" : "a set");
    return kUnknown;
  }
  if (word.type == Word::List || word.type == Word::Rows) {
    Refuse(kind, place, word, Describe(word.type));
    return kUnknown;
  }
  if (word.type == Word::Text && !CheckText(word.token, mDiagnostics)) return kUnknown;
  return AddConstant(Literal(word));
}

// The variable w[3].
int Resolver::ElementOf(const Word& word) {
  const Named* const array = Find(word.token);
  if (array == nullptr) return kUnknown;
  const Token& index = mSyntax.Members(word.members).front().token;
  const bool within = array->first <= index.number && index.number <= array->last;
  if (array->what == DeclarationSyntax::Variables && within)
    return array->index + static_cast<int>(index.number - array->first);
  if (!array->IsArray()) {
    mDiagnostics.Error(word.token.extent, fmt::format("'{}' is no array", word.token.text));
  } else if (!within) {
    mDiagnostics.Error(index.extent,
                       fmt::format("'{}' has the elements {} to {}", word.token.text, array->first, array->last));
  } else {
    mDiagnostics.Error(word.token.extent, fmt::format("{} is a constant, no variable", Written(word)));
  }
  TellPlace(word.token, *array);
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

void Resolver::AddOutput(const Word& word) {
  if (word.type == Word::Element) {
    const int variable = ElementOf(word);
    if (variable != kUnknown) mModel.Want({variable});
    return;
  }
  const Named* const named = Find(word.token);
  if (named == nullptr) return;
  if (named->index != kUnknown && named->what != DeclarationSyntax::Set) {
    for (std::int64_t i = 0; i <= named->last - named->first; ++i) mModel.Want({named->index + static_cast<int>(i)});
    return;
  }
  const std::string_view is = named->IsArray() ? "an array of constants" : "a set";
  mDiagnostics.Error(word.token.extent, fmt::format("{} is {}, no variable", Written(word), is));
  TellPlace(word.token, *named);
}

const Named* Resolver::Find(const Token& name) {
  const auto found = mNames.find(name.text);
  if (found != mNames.end()) return &found->second;
  if (mBroken.contains(name.text) || mDiagnostics.Stopped()) return nullptr;
  std::vector<std::string_view> names;
  for (const auto& [known, named] : mNames) names.push_back(known);
  std::sort(names.begin(), names.end());
  const std::string_view closest = Closest(name.text, names);
  mDiagnostics.Error(name.extent, fmt::format("'{}' is not declared{}", name.text, Suggestion(closest)));
  if (!closest.empty()) mDiagnostics.Note(mNames.at(closest).place, fmt::format("'{}' is declared here", closest));
  return nullptr;
}

const Named* Resolver::FindArray(const Word& word) const {
  const auto found = word.type == Word::Name ? mNames.find(word.token.text) : mNames.end();
  return found != mNames.end() && found->second.IsArray() ? &found->second : nullptr;
}

// The constant that an element of an array is; else the word itself.
Word Resolver::Literal(const Word& word) const {
  const auto found = word.type == Word::Element ? mNames.find(word.token.text) : mNames.end();
  if (found == mNames.end() || found->second.what != DeclarationSyntax::Constants) return word;
  const std::int64_t index = mSyntax.Members(word.members).front().token.number - found->second.first;
  const std::span<const Word> constants = mSyntax.Members(found->second.constants);
  const bool within = index >= 0 && static_cast<std::uint64_t>(index) < constants.size();
  return within ? constants[static_cast<std::size_t>(index)] : word;
}

}  // namespace

ReadModel Read(Source& source, Diagnostics& diagnostics, const Files& files) {
  const Syntax syntax = Parse(source, files, diagnostics);
  ReadModel read = Resolver(syntax, diagnostics).Resolve();
  diagnostics.Sort();
  return read;
}

}  // namespace zornet
