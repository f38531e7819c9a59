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
  Blocks<DeclarationSyntax>& declarations = mSyntax.declarations;
  mNames.reserve(declarations.Size());
  const std::size_t variables = declarations.Size() + CountConstants();
  mModel.Reserve(variables, mSyntax.constraints.Size());
  mRead.places.variables.reserve(variables);
  mRead.places.constraints.reserve(mSyntax.constraints.Size());
  std::vector<Named*> named;
  named.reserve(declarations.Size());
  for (std::size_t i = 0; i < declarations.Size(); ++i) named.push_back(Introduce(declarations[i]));
  for (std::size_t i = 0; i < declarations.Size(); ++i) {
    if (named[i] != nullptr && declarations[i].what == DeclarationSyntax::Set) DeclareSet(declarations[i], *named[i]);
  }
  for (std::size_t i = 0; i < declarations.Size(); ++i) {
    if (named[i] != nullptr && !Declare(declarations[i], *named[i])) {
      mBroken.insert(declarations[i].name.text);
      mNames.erase(declarations[i].name.text);
    }
    declarations.Release(i);
  }
  for (std::size_t i = 0; i < mSyntax.constraints.Size(); ++i) {
    Add(mSyntax.constraints[i]);
    mSyntax.constraints.Release(i);
  }
  for (const Word& word : mSyntax.outputs) AddOutput(word);
  mRead.places.embedded = std::move(mSyntax.embedded);
  return std::move(mRead);
}

std::size_t Resolver::CountConstants() const {
  std::size_t constants = 0;
  for (std::size_t i = 0; i < mSyntax.arguments.Size(); ++i) {
    if (mSyntax.arguments[i].type != Word::Name) ++constants;
  }
  return constants;
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
    for (std::int64_t i = 0; i < named->Size(); ++i) mModel.Want({named->index + static_cast<int>(i)});
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
  if (!mHasArrays) return nullptr;
  const auto found = word.type == Word::Name ? mNames.find(word.token.text) : mNames.end();
  return found != mNames.end() && found->second.IsArray() ? &found->second : nullptr;
}

// The constant that an element of an array is; else the word itself.
Word Resolver::Literal(const Word& word) const {
  const auto found = word.type == Word::Element ? mNames.find(word.token.text) : mNames.end();
  if (found == mNames.end() || found->second.what != DeclarationSyntax::Constants) return word;
  const std::int64_t index = std::int64_t{word.members.Words().front().token.number} - found->second.first;
  const std::span<const Word> constants = found->second.constants.Words();
  const bool within = index >= 0 && static_cast<std::uint64_t>(index) < constants.size();
  return within ? constants[static_cast<std::size_t>(index)] : word;
}

// The variable w[3].
int Resolver::ElementOf(const Word& word) {
  const Named* const array = Find(word.token);
  if (array == nullptr) return kUnknown;
  const Token& index = word.members.Words().front().token;
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
  return fmt::format("'{}[{}]'", name.token.text, name.members.Words().front().token.number);
}

ReadModel Read(Source& source, Diagnostics& diagnostics, const Files& files) {
  ReadModel read = Resolver(Parse(source, files, diagnostics), diagnostics).Resolve();
  diagnostics.Sort();
  return read;
}

}  // namespace zornet
