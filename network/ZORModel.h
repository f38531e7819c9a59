// A model: variables over texts, integers and truth values, and constraints between them.
//
//   zornet::Model model;
//   const zornet::Var host = model.TextSet("host", {"north-7", "south-7"});
//   model.Post("str_concat", {"north", "-7", host});
//
// A text has at most 255 characters, from the space to z. An integer has 32 bits. Anything else, such as a constraint
// with wrong arguments, throws std::invalid_argument, whose what() says what is wrong; the model is then as before.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <memory>
#include <span>
#include <stdexcept>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "host/ZORExport.h"

namespace zornet {

// What a variable ranges over.
enum class Sort {
  Text,        // one text, known or not: a variable that could still be two texts counts as unknown
  TextSet,     // a set of possible texts
  Integer,     // one integer, known or not
  Interval,    // the integers from one to another
  IntegerSet,  // a set of at most 4096 possible integers
  Boolean,
};
inline constexpr int kSorts = 6;

struct SortNames {
  std::string_view type;       // "set string": in reports
  std::string_view described;  // "a set of texts": in messages
  std::string_view solver;     // "enum string": what the solver's descriptor is called
};
ZOR_EXPORT const SortNames& NamesOf(Sort sort);

constexpr bool IsText(Sort sort) { return sort == Sort::Text || sort == Sort::TextSet; }
constexpr bool IsInteger(Sort sort) { return !IsText(sort) && sort != Sort::Boolean; }

// A variable or constant of a model, by its number there. Post and Want refuse a number that the model does not have;
// elsewhere it is not checked.
struct Var {
  int index = -1;

  friend bool operator==(Var, Var) = default;
};

// A variable as it is declared. Nothing is known of it when both lists are empty; else it is one of the texts or of the
// numbers. The numbers of an interval are its two ends, those of a truth value 0 or 1.
struct Variable {
  std::string name;
  Sort sort = Sort::Text;
  std::vector<std::string> texts = {};
  std::vector<std::int32_t> numbers = {};
  bool constant = false;
};

// What a constraint says: a relation between its arguments, or a function whose result is the last one. A reified
// constraint has one more argument, which tells whether the relation holds. Truth values count as 0 and 1: for them
// Unequal is "not", LessOrEqual is "implies", Minimum is "and" and Maximum is "or".
enum class Meaning {
  Equal,
  Unequal,
  LessOrEqual,
  Less,
  Prefix,    // the second text begins with the first
  Suffix,    // the second text ends with the first
  Contains,  // the second text occurs in the first
  Matches,   // the regular expression matches the whole text
  AllDifferent,
  Row,  // the texts are a row of the table
  Concatenation,
  Slice,  // characters from one position to another, both included
  Length,
  Lower,
  Upper,
  Minimum,
  Maximum,
  Successor,
  TextForm,
  Position,  // of the first occurrence of the second text in the first, or -1
  ReplaceFirst,
  ReplaceAll,
  Sum,
  Product,
};

// What a constraint takes as one argument. A plural is a list, as in str_concat([a, "-", b], z); a constraint has at
// most one list. An expression and rows are not variables.
enum class Takes {
  Text,
  Integer,
  Boolean,
  Anything,
  Expression,
  Rows,
  Texts,
  Integers,
  Booleans,
};
constexpr bool IsList(Takes takes) { return takes >= Takes::Texts; }
constexpr bool IsVariable(Takes takes) { return takes != Takes::Expression && takes != Takes::Rows; }
constexpr bool IsNumber(Takes takes) {
  return takes == Takes::Integer || takes == Takes::Boolean || takes >= Takes::Integers;
}
ZOR_EXPORT Takes MemberOf(Takes list);  // what the members of the list are; anything but a list gives itself

inline constexpr int kMostArguments = 5;

// A constraint that can be posted. Two forms may share a name: one with a list and one without.
struct ZOR_EXPORT Kind {
  std::string_view name;
  Meaning meaning;
  bool mirrored;  // the relation with first and second exchanged
  bool reified;
  int arity;  // number of arguments as they are written: a list is one
  std::array<Takes, kMostArguments> takes;
  std::array<std::string_view, kMostArguments> roles;

  constexpr bool IsComparison() const { return meaning <= Meaning::Less; }
  constexpr bool IsRelation() const { return meaning <= Meaning::Row; }
  constexpr bool IsOfNumbers() const { return IsNumber(takes[0]); }  // integers or truth values, no texts
  bool HasList() const;
};

ZOR_EXPORT std::span<const Kind> Kinds();

// The constraint of that name; of two forms the one with a list, or the one without. Null when there is none.
ZOR_EXPORT const Kind* FindKind(std::string_view name, bool list = false);
// Whether a variable of this sort may stand for such an argument.
ZOR_EXPORT bool Fits(Sort sort, Takes takes);

// The rows of a table, all of one length.
struct Rows {
  std::vector<std::vector<std::string>> rows;
};

// A regular expression that cannot be read from the character at offset on: what() says why.
struct ZOR_EXPORT ExpressionError : std::invalid_argument {
  ExpressionError(const std::string& what, std::size_t at) : std::invalid_argument(what), offset(at) {}
  std::size_t offset;
};

class Expression;
class Table;

// A constraint of a model. The model owns everything that it points to.
struct ZOR_EXPORT Constraint {
  const Kind* kind = nullptr;
  std::span<const int> arguments = {};  // variables by number; the members of a list take its place one by one
  const Expression* expression = nullptr;
  const Table* table = nullptr;

  // Of a function or a reified constraint: how many arguments come before the result, and the result, which is last.
  std::size_t Inputs() const { return arguments.size() - 1; }
  int Result() const { return arguments.back(); }

  // To which of the written arguments arguments[position] belongs: an index into takes and roles.
  std::size_t Place(std::size_t position) const;
  std::string_view RoleOf(std::size_t position) const { return kind->roles[Place(position)]; }
};

// An argument of a constraint as it is written: a variable, a constant, a list of them, a regular expression in a text,
// or the rows of a table.
class Argument {
 public:
  // NOLINTBEGIN(google-explicit-constructor): arguments are written as what they are
  Argument(Var variable) : mValue(variable) {}
  Argument(const char* text) : mValue(std::string(text)) {}
  Argument(std::string text) : mValue(std::move(text)) {}
  Argument(std::int32_t number) : mValue(number) {}
  Argument(bool truth) : mValue(truth) {}
  Argument(std::vector<Argument> list) : mValue(std::move(list)) {}
  Argument(std::initializer_list<Argument> list) : mValue(std::vector<Argument>(list)) {}
  Argument(Rows rows) : mValue(std::move(rows)) {}
  // NOLINTEND(google-explicit-constructor)

  bool IsList() const { return std::holds_alternative<std::vector<Argument>>(mValue); }

 private:
  friend class Model;
  std::variant<Var, std::string, std::int32_t, bool, std::vector<Argument>, Rows> mValue;
};

// The variables and constraints of one problem, numbered from 0 as they are added. Copies share nothing that changes.
class ZOR_EXPORT Model {
 public:
  Model() = default;
  Model(const Model& other);
  Model(Model&&) noexcept = default;
  Model& operator=(Model other) noexcept;
  ~Model() = default;

  // clang-format off
  // Add a variable. Its name is for people and may be empty. Without a value nothing is known of it.
  Var Text      (std::string name);
  Var Text      (std::string name, std::string text);
  Var TextSet   (std::string name);
  Var TextSet   (std::string name, std::vector<std::string> texts);  // at least one, in any order
  Var Integer   (std::string name);
  Var Integer   (std::string name, std::int32_t number);
  Var Interval  (std::string name, std::int32_t first, std::int32_t last);
  Var IntegerSet(std::string name, std::vector<std::int32_t> numbers);  // from 1 to 4096, in any order
  Var Boolean   (std::string name);
  Var Boolean   (std::string name, bool truth);
  // clang-format on
  Var Add(Variable variable);
  Var AddConstant(const Argument& value);

  // Posts the constraint of that name, such as "str_concat"; docs/language.md lists them with their arguments.
  // Returns its number.
  //
  //   model.Post("str_concat", {x, "-7", z});
  //   model.Post("str_concat", {{a, "-", b}, z});  // with a list; FindKind chooses the form
  int Post(std::string_view name, std::initializer_list<Argument> arguments);
  int Post(const Kind& kind, std::span<const Argument> arguments);

  // Makes a variable wanted: solutions that differ only in other variables are one solution. Without a call, all
  // variables are wanted.
  void Want(Var variable);

  const std::string& NameOf(Var variable) const { return mVariables[static_cast<std::size_t>(variable.index)].name; }
  const std::vector<Variable>& Variables() const { return mVariables; }
  const std::vector<Constraint>& Constraints() const { return mConstraints; }
  const std::vector<int>& Wanted() const { return mWanted; }  // by number

  void Reserve(std::size_t variables, std::size_t constraints);  // makes room for large models

 private:
  struct ZOR_INTERNAL Block {
    std::unique_ptr<int[]> numbers;
    std::size_t used = 0, size = 0;
  };

  void Flatten(const Kind& kind, std::span<const Argument> arguments);
  void TakeExtra(const Kind& kind, std::size_t place, const Argument& argument);
  void Take(const Kind& kind, std::size_t place, const Argument& argument);
  std::span<const int> Keep(std::span<const int> numbers);

  std::vector<Variable> mVariables;
  std::vector<Constraint> mConstraints;
  std::vector<Block> mArguments;            // of all constraints; never moved, so that these may point at them
  std::vector<int> mPosted;                 // the arguments of the constraint that is posted
  const Expression* mExpression = nullptr;  // of the same
  const Table* mTable = nullptr;
  std::vector<std::shared_ptr<const Expression>> mExpressions;  // of all constraints; copies of a model share them
  std::vector<std::shared_ptr<const Table>> mTables;
  std::vector<int> mWanted;
};

}  // namespace zornet
