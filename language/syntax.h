// The items of a model as they are written, before names are looked up.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <span>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

#include "language/diagnostics.h"
#include "language/files.h"
#include "language/inclusion.h"
#include "language/lexer.h"
#include "network/ZORModel.h"

namespace zornet {

inline constexpr std::string_view kTypes[] = {"string", "set", "int", "bool"};
inline constexpr std::string_view kAnyType =
    "a type: string, set string, {\"a\", \"b\"}, int, 1..9, {1, 3}, bool or the name of a set";

struct Word;

// Neighbours that Syntax::members keeps.
struct Range {
  const Word* first = nullptr;
  std::size_t count = 0;

  std::span<const Word> Words() const;
};

// Grows without moving what it holds, and gives its memory back from the front.
template <class T>
class Blocks {
 public:
  void Add(T value) {
    if (mSize++ % kBlock == 0) mBlocks.emplace_back().reserve(kBlock);
    mBlocks.back().push_back(std::move(value));
  }
  std::size_t Size() const { return mSize; }
  T& operator[](std::size_t i) { return mBlocks[i / kBlock][i % kBlock]; }
  const T& operator[](std::size_t i) const { return mBlocks[i / kBlock][i % kBlock]; }
  // The one at i and all before it are not needed any more.
  void Release(std::size_t i) {
    if ((i + 1) % kBlock == 0) mBlocks[i / kBlock] = std::vector<T>();
  }

 private:
  static constexpr std::size_t kBlock = 4096;

  std::vector<std::vector<T>> mBlocks;
  std::size_t mSize = 0;
};

// What stands where a value stands: a constant, a name, w[3], or in brackets a list or the rows of a table.
struct Word {
  enum Type : char { Name, Text, Number, Truth, Element, List, Rows };

  Type type = Name;
  Token token;  // of an Element the name of its array and the extent of all; of a List or Rows no more than the extent
  Range members = {};  // of an Element its index, of a List what it holds, of Rows lists
};

// In ascending order, and each once.
template <class T>
void SortUnique(std::vector<T>& values) {
  if (std::adjacent_find(values.begin(), values.end(), std::greater_equal<>()) == values.end()) return;
  std::sort(values.begin(), values.end());
  values.erase(std::unique(values.begin(), values.end()), values.end());
}

struct TypeSyntax {
  Sort sort = Sort::Text;
  Extent extent = {};
  Range members = {};                   // of a set; of an interval its two ends; of a named set its name
  std::vector<std::string> texts = {};  // instead of the members, of a set in braces that holds nothing else; in order

  bool HasName() const { return members.count == 1 && members.Words().front().type == Word::Name; }
};

// What few declarations have.
struct DetailSyntax {
  Range value = {};
  bool setValue = false;  // written in braces or from a file
  Extent valueExtent = {};
  Range indices = {};  // of an array the first and the last
};

struct DeclarationSyntax {
  enum What : char { Variable, Variables, Constants, Set };  // in the plural an array

  What what = Variable;
  TypeSyntax type = {};
  Token name = {};
  std::unique_ptr<DetailSyntax> details = nullptr;  // of an array or with a value
};

struct ConstraintSyntax {
  Token name;
  Extent extent;
  std::uint32_t arguments = 0;
};

inline std::span<const Word> Range::Words() const { return {first, count}; }

// Words that stay where they are.
class WordStore {
 public:
  Range Keep(std::span<const Word> words);

 private:
  std::vector<std::vector<Word>> mBlocks;  // none grows beyond its room
};

struct Syntax {
  Blocks<DeclarationSyntax> declarations;
  Blocks<ConstraintSyntax> constraints;
  Blocks<Word> arguments;  // of all constraints, one after another
  WordStore members;
  std::vector<Word> outputs;
  std::vector<Token> broken;                     // names whose declaration could not be read
  std::unordered_map<std::size_t, Range> lines;  // by file
  std::vector<Embedded> embedded;
};

// Adds the files that it names to the source.
Syntax Parse(Source& source, const Files& files, Diagnostics& diagnostics);

}  // namespace zornet
