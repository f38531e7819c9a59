// The constraints of a model and their arguments.
#include <fmt/core.h>

#include <algorithm>
#include <utility>

#include "language/resolver.h"
#include "language/spelling.h"

namespace zornet {

namespace {

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

}  // namespace

void Resolver::Add(const ConstraintSyntax& syntax) {
  const std::span<const Word> arguments = TakeArguments(syntax);
  const Kind* kind = FindKindFor(syntax, arguments);
  if (kind == nullptr) return;
  mArguments.clear();
  mListed = 0;
  bool good = true;
  for (std::size_t i = 0; i < arguments.size(); ++i) good = AddArgument(*kind, i, arguments[i]) && good;
  if (!good) return;
  try {
    mModel.Post(*kind, mArguments);
  } catch (const ExpressionError& error) {
    RefuseExpression(*kind, arguments, error);
  }
  mRead.places.constraints.push_back(syntax.extent);
}

// They are good until the next call.
std::span<const Word> Resolver::TakeArguments(const ConstraintSyntax& syntax) {
  mWritten.clear();
  for (const std::size_t end = mTaken + syntax.arguments; mTaken < end; ++mTaken) {
    mWritten.push_back(mSyntax.arguments[mTaken]);
    mSyntax.arguments.Release(mTaken);
  }
  return mWritten;
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
    for (const Word& member : word.members.Words()) good = AddMember(kind, place, member, members) && good;
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
  for (std::int64_t i = 0; i < array.Size(); ++i) {
    const bool constant = array.what == DeclarationSyntax::Constants;
    const int variable = constant ? AddConstant(array.constants.Words()[static_cast<std::size_t>(i)])
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
  for (const Word& row : word.members.Words()) {
    std::vector<std::string>& texts = rows.rows.emplace_back();
    for (const Word& member : row.members.Words()) {
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

// Null when there is no constraint of that name, or when it takes another number of arguments.
const Kind* Resolver::FindKindFor(const ConstraintSyntax& constraint, std::span<const Word> arguments) {
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

}  // namespace zornet
