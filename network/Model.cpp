#include <algorithm>
#include <functional>
#include <stdexcept>
#include <utility>

#include "host/ZORNumbers.h"
#include "network/ZORModel.h"
#include "network/expression.h"
#include "network/tables.h"
#include "network/texts.h"

void ZOR_STANDARD_LIBRARY() {}  // programs need not link the host library

namespace zornet {

namespace {

[[noreturn]] void Refuse(const std::string& what) { throw std::invalid_argument(what); }

void CheckText(const std::string& text) {
  if (text.size() > kTextLimit)
    Refuse("a text has at most " + std::to_string(kTextLimit) + " characters, this one has " +
           std::to_string(text.size()));
  if (!std::all_of(text.begin(), text.end(), zor::IsInAlphabet)) Refuse("a text has characters from space to z only");
}

std::size_t MostNumbers(Sort sort) {
  if (IsText(sort)) return 0;
  if (sort == Sort::IntegerSet) return ZORVadEnumInteger::kListLimit;
  return sort == Sort::Interval ? 2 : 1;
}

void CheckValues(const Variable& variable) {
  const std::size_t texts = variable.texts.size(), numbers = variable.numbers.size();
  if (texts > 0 && !IsText(variable.sort)) Refuse("texts are no values for a number");
  if (texts > 1 && variable.sort == Sort::Text) Refuse("one text, not " + std::to_string(texts));
  if (numbers > MostNumbers(variable.sort))
    Refuse("at most " + std::to_string(MostNumbers(variable.sort)) + " integers, not " + std::to_string(numbers));
  if (numbers == 1 && variable.sort == Sort::Interval) Refuse("an interval has two ends");
  for (const std::string& text : variable.texts) CheckText(text);
}

template <class T>
void SortUnique(std::vector<T>& values) {
  if (std::adjacent_find(values.begin(), values.end(), std::greater_equal<>()) == values.end()) return;
  std::sort(values.begin(), values.end());
  values.erase(std::unique(values.begin(), values.end()), values.end());
}

}  // namespace

Var Model::Add(Variable variable) {
  SortUnique(variable.texts);
  if (variable.sort != Sort::Interval) SortUnique(variable.numbers);
  CheckValues(variable);
  mVariables.push_back(std::move(variable));
  return {static_cast<int>(mVariables.size()) - 1};
}

Var Model::Text(std::string name) { return Add({std::move(name), Sort::Text}); }
Var Model::Text(std::string name, std::string text) { return Add({std::move(name), Sort::Text, {std::move(text)}}); }

Var Model::TextSet(std::string name) { return Add({std::move(name), Sort::TextSet}); }
Var Model::TextSet(std::string name, std::vector<std::string> texts) {
  if (texts.empty()) Refuse("a set has at least one text");
  return Add({std::move(name), Sort::TextSet, std::move(texts)});
}

Var Model::Integer(std::string name) { return Add({std::move(name), Sort::Integer}); }
Var Model::Integer(std::string name, std::int32_t number) {
  return Add({std::move(name), Sort::Integer, {}, {number}});
}

Var Model::Interval(std::string name, std::int32_t first, std::int32_t last) {
  if (first > last) Refuse("the upper end of an interval is less than the lower");
  return Add({std::move(name), Sort::Interval, {}, {first, last}});
}

Var Model::IntegerSet(std::string name, std::vector<std::int32_t> numbers) {
  if (numbers.empty()) Refuse("a set has at least one integer");
  return Add({std::move(name), Sort::IntegerSet, {}, std::move(numbers)});
}

Var Model::Boolean(std::string name) { return Add({std::move(name), Sort::Boolean}); }
Var Model::Boolean(std::string name, bool truth) { return Add({std::move(name), Sort::Boolean, {}, {truth ? 1 : 0}}); }

Var Model::AddConstant(const Argument& value) {
  if (const auto* variable = std::get_if<Var>(&value.mValue)) return *variable;
  if (const auto* text = std::get_if<std::string>(&value.mValue)) return Add({"", Sort::Text, {*text}, {}, true});
  if (const auto* number = std::get_if<std::int32_t>(&value.mValue))
    return Add({"", Sort::Integer, {}, {*number}, true});
  return Add({"", Sort::Boolean, {}, {std::get<bool>(value.mValue) ? 1 : 0}, true});
}

int Model::Post(std::string_view name, std::initializer_list<Argument> arguments) {
  const bool list = std::any_of(arguments.begin(), arguments.end(), std::mem_fn(&Argument::IsList));
  const Kind* const kind = FindKind(name, list);
  if (kind == nullptr) Refuse("there is no constraint '" + std::string(name) + "'");
  return Post(*kind, {arguments.begin(), arguments.size()});
}

int Model::Post(const Kind& kind, std::span<const Argument> arguments) {
  if (static_cast<int>(arguments.size()) != kind.arity)
    Refuse(std::string(kind.name) + " takes " + std::to_string(kind.arity) + " arguments, not " +
           std::to_string(arguments.size()));
  const std::size_t before = mVariables.size();
  try {
    Flatten(kind, arguments);
  } catch (...) {
    mVariables.resize(before);
    throw;
  }
  mConstraints.push_back({&kind, Keep(mPosted), mExpression, mTable});
  return static_cast<int>(mConstraints.size()) - 1;
}

void Model::Flatten(const Kind& kind, std::span<const Argument> arguments) {
  mPosted.clear();
  mExpression = nullptr;
  mTable = nullptr;
  for (std::size_t place = 0; place < arguments.size(); ++place) {
    const auto* const list = std::get_if<std::vector<Argument>>(&arguments[place].mValue);
    if ((list != nullptr) != IsList(kind.takes[place]))
      Refuse(std::string(kind.name) + " takes " + (list != nullptr ? "no list" : "a list") + " for " +
             std::string(kind.roles[place]));
    if (!IsVariable(kind.takes[place]) && list == nullptr) {
      TakeExtra(kind, place, arguments[place]);
    } else if (list == nullptr) {
      Take(kind, place, arguments[place]);
    } else if (list->empty()) {
      Refuse(std::string(kind.name) + " takes at least one member in " + std::string(kind.roles[place]));
    } else {
      for (const Argument& member : *list) Take(kind, place, member);
    }
  }
}

// What is no variable.
void Model::TakeExtra(const Kind& kind, std::size_t place, const Argument& argument) {
  const auto* const text = std::get_if<std::string>(&argument.mValue);
  const auto* const rows = std::get_if<Rows>(&argument.mValue);
  if (kind.takes[place] == Takes::Expression && text != nullptr) {
    mExpression = mExpressions.emplace_back(std::make_shared<Expression>(*text)).get();
  } else if (kind.takes[place] == Takes::Rows && rows != nullptr) {
    for (const auto& row : rows->rows) std::for_each(row.begin(), row.end(), CheckText);
    mTable = mTables.emplace_back(std::make_shared<Table>(*rows, mPosted.size())).get();
  } else {
    Refuse(std::string(kind.name) + " cannot take this for " + std::string(kind.roles[place]));
  }
}

void Model::Take(const Kind& kind, std::size_t place, const Argument& argument) {
  if (argument.IsList()) Refuse("a list holds no list");
  if (std::holds_alternative<Rows>(argument.mValue))
    Refuse(std::string(kind.name) + " takes no table for " + std::string(kind.roles[place]));
  const Var variable = AddConstant(argument);
  const auto at = static_cast<std::size_t>(variable.index);
  if (at >= mVariables.size()) Refuse("no variable of this model");
  if (!Fits(mVariables[at].sort, MemberOf(kind.takes[place])))
    Refuse(std::string(kind.name) + " cannot take '" + mVariables[at].name + "' for " + std::string(kind.roles[place]));
  mPosted.push_back(variable.index);
}

std::span<const int> Model::Keep(std::span<const int> numbers) {
  constexpr std::size_t kBlock = 4096;
  if (mArguments.empty() || mArguments.back().size - mArguments.back().used < numbers.size()) {
    const std::size_t size = std::max(kBlock, numbers.size());
    mArguments.push_back({std::make_unique<int[]>(size), 0, size});
  }
  Block& block = mArguments.back();
  int* const first = block.numbers.get() + block.used;
  std::copy(numbers.begin(), numbers.end(), first);
  block.used += numbers.size();
  return {first, numbers.size()};
}

Model::Model(const Model& other)
    : mVariables(other.mVariables),
      mConstraints(other.mConstraints),
      mExpressions(other.mExpressions),
      mTables(other.mTables),
      mWanted(other.mWanted) {
  for (Constraint& constraint : mConstraints) constraint.arguments = Keep(constraint.arguments);
}

Model& Model::operator=(Model other) noexcept {
  mVariables.swap(other.mVariables);
  mConstraints.swap(other.mConstraints);
  mArguments.swap(other.mArguments);
  mExpressions.swap(other.mExpressions);
  mTables.swap(other.mTables);
  mWanted.swap(other.mWanted);
  return *this;
}

void Model::Want(Var variable) {
  if (static_cast<std::size_t>(variable.index) >= mVariables.size()) Refuse("no variable of this model");
  mWanted.push_back(variable.index);
}

void Model::Reserve(std::size_t variables, std::size_t constraints) {
  mVariables.reserve(variables);
  mConstraints.reserve(constraints);
}

}  // namespace zornet
