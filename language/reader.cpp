#include "language/reader.h"

#include <fmt/core.h>

#include <algorithm>
#include <utility>

#include "language/resolver.h"
#include "language/spelling.h"

namespace zornet {

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

void Resolver::TellPlace(const Token& name, const Named& named) {
  mDiagnostics.Note(named.place, fmt::format("'{}' is declared here", name.text));
}

std::string Resolver::Written(const Word& name) const {
  if (name.type == Word::Name) return fmt::format("'{}'", name.token.text);
  return fmt::format("'{}[{}]'", name.token.text, mSyntax.Members(name.members).front().token.number);
}

ReadModel Read(Source& source, Diagnostics& diagnostics, const Files& files) {
  const Syntax syntax = Parse(source, files, diagnostics);
  ReadModel read = Resolver(syntax, diagnostics).Resolve();
  diagnostics.Sort();
  return read;
}

}  // namespace zornet
