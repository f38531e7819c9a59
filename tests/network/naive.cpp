#include "tests/network/naive.h"

#include <algorithm>
#include <limits>
#include <map>
#include <numeric>
#include <regex>
#include <set>

namespace naive {

namespace {

const std::string kGreatest(kLongest, 'z');

std::string Fold(std::string text, char first, char last, int by) {
  for (char& c : text) {
    if (c >= first && c <= last) c = static_cast<char>(c + by);
  }
  return text;
}

std::string Slice(const std::string& text, std::int64_t from, std::int64_t to) {
  std::string slice;
  for (std::int64_t i = from; i <= to && from >= 0 && i < static_cast<std::int64_t>(text.size()); ++i) {
    slice += text[static_cast<std::size_t>(i)];
  }
  return slice;
}

std::string Next(std::string text) {
  if (text.size() < kLongest) return text + ' ';
  if (text == kGreatest) return text;
  while (text.back() == 'z') text.pop_back();
  ++text.back();
  return text;
}

std::int64_t Find(const std::string& text, const std::string& part) {
  for (std::size_t i = 0; i + part.size() <= text.size(); ++i) {
    if (text.compare(i, part.size(), part) == 0) return static_cast<std::int64_t>(i);
  }
  return -1;
}

std::string Replace(const std::string& text, const std::string& from, const std::string& to, bool all) {
  std::string replaced;
  bool done = all && from.empty();
  for (std::size_t i = 0; i <= text.size();) {
    if (!done && i + from.size() <= text.size() && text.compare(i, from.size(), from) == 0) {
      replaced += to;
      i += from.size();
      done = !all;
    } else {
      replaced += text.substr(i++, 1);
    }
  }
  return replaced.size() > kLongest ? kGreatest : replaced;
}

std::string Form(Type type, const Value& value) {
  if (type == Type::Boolean) return value.number != 0 ? "true" : "false";
  if (!IsText(type)) return std::to_string(value.number);
  if (value.text == (type == Type::Text ? " " : "")) return "Min";
  if (value.text == kGreatest) return "Max";
  return '"' + value.text + '"';
}

using NumberFold = std::int64_t (*)(std::int64_t x, std::int64_t y);

// Of a function of numbers what it makes of two; else null.
NumberFold FoldOf(const std::string& name) {
  const NumberFold sum = [](std::int64_t x, std::int64_t y) { return x + y; };
  const NumberFold product = [](std::int64_t x, std::int64_t y) { return x * y; };
  const NumberFold least = [](std::int64_t x, std::int64_t y) { return x < y ? x : y; };
  const NumberFold greatest = [](std::int64_t x, std::int64_t y) { return x < y ? y : x; };
  const NumberFold either = [](std::int64_t x, std::int64_t y) { return x + y - x * y; };
  static const std::map<std::string, NumberFold> folds = {
      {"int_plus", sum},         {"int_sum", sum},      {"int_times", product},
      {"int_min", least},        {"int_max", greatest}, {"bool_or", either},
      {"array_bool_or", either}, {"bool_and", product}, {"array_bool_and", product}};
  const auto found = folds.find(name);
  return found != folds.end() ? found->second : nullptr;
}

// The value of a function; nothing when it has none, or when the constraint is a relation.
std::optional<Value> Compute(const Network& network, const Constraint& constraint, const Assignment& values) {
  const auto at = [&](std::size_t i) -> const Value& {
    return values[static_cast<std::size_t>(constraint.arguments[i])];
  };
  const std::string& name = constraint.name;
  if (const NumberFold fold = FoldOf(name)) {
    std::int64_t number = at(0).number;
    for (std::size_t i = 1; i + 1 < constraint.arguments.size(); ++i) number = fold(number, at(i).number);
    if (number != static_cast<std::int32_t>(number)) return std::nullopt;
    return Value{"", number};
  }
  const std::string& x = at(0).text;
  std::vector<std::string> inputs;
  for (std::size_t i = 0; i + 1 < constraint.arguments.size(); ++i) inputs.push_back(at(i).text);
  if (name == "str_concat") {
    const std::string z = std::accumulate(inputs.begin(), inputs.end(), std::string());
    return Value{z.size() > kLongest ? kGreatest : z, 0};
  }
  if (name == "str_substr") return Value{Slice(x, at(1).number, at(2).number), 0};
  if (name == "str_length") return Value{"", static_cast<std::int64_t>(x.size())};
  if (name == "str_lower") return Value{Fold(x, 'A', 'Z', 'a' - 'A'), 0};
  if (name == "str_upper") return Value{Fold(x, 'a', 'z', 'A' - 'a'), 0};
  if (name == "str_min") return Value{*std::min_element(inputs.begin(), inputs.end()), 0};
  if (name == "str_max") return Value{*std::max_element(inputs.begin(), inputs.end()), 0};
  if (name == "str_next") return Value{Next(x), 0};
  if (name == "str_find") return Value{"", Find(x, at(1).text)};
  if (name == "str_replace" || name == "str_replace_all")
    return Value{Replace(x, at(1).text, at(2).text, name == "str_replace_all"), 0};
  if (name == "str_text") {
    const std::string form = Form(network.variables[static_cast<std::size_t>(constraint.arguments[0])].type, at(0));
    if (form.size() <= kLongest) return Value{form, 0};
  }
  return std::nullopt;
}

bool IsFunction(const Constraint& constraint) {
  static const std::set<std::string> functions = {"str_concat", "str_substr", "str_length",  "str_lower",
                                                  "str_upper",  "str_min",    "str_max",     "str_next",
                                                  "str_text",   "str_find",   "str_replace", "str_replace_all"};
  return functions.contains(constraint.name) || FoldOf(constraint.name) != nullptr;
}

bool Matches(const std::string& text, const std::string& expression) {
  static std::map<std::string, std::regex> compiled;
  return std::regex_match(text, compiled.try_emplace(expression, expression).first->second);
}

// Whether the relation holds, or the function gives its last value. Relations go by their name behind the type.
bool IsTrue(const Network& network, const Constraint& constraint, const Assignment& values) {
  if (IsFunction(constraint)) {
    const auto image = Compute(network, constraint, values);
    return image && *image == values[static_cast<std::size_t>(constraint.arguments.back())];
  }
  std::vector<Value> all;
  for (const int argument : constraint.arguments) all.push_back(values[static_cast<std::size_t>(argument)]);
  const Value &x = all.front(), &y = all.back();
  const std::string relation = constraint.name.substr(constraint.name.find('_') + 1);
  if (relation == "eq" || relation == "bool2int") return x == y;
  if (relation == "ne" || relation == "not" || relation == "xor") return x != y;
  if (relation == "lt") return x < y;
  if (relation == "le" || relation == "imply") return x <= y;
  if (relation == "gt") return x > y;
  if (relation == "ge") return x >= y;
  if (relation == "prefix") return x.text == y.text.substr(0, x.text.size());
  if (relation == "suffix") return Find(y.text + '\n', x.text + '\n') >= 0;
  if (relation == "contains") return Find(x.text, y.text) >= 0;
  if (relation == "matches") return Matches(x.text, constraint.expression);
  if (relation == "all_different") return std::set<Value>(all.begin(), all.end()).size() == all.size();
  return std::any_of(constraint.rows.begin(), constraint.rows.end(), [&](const std::vector<std::string>& row) {
    return std::equal(all.begin(), all.end(), row.begin(),
                      [](const Value& v, const std::string& t) { return v.text == t; });
  });
}

class Solver {
 public:
  Solver(const Network& network, const std::vector<std::string>& universe,
         const std::function<void(const Assignment&)>& found)
      : mNetwork(network),
        mFound(found),
        mValues(network.variables.size()),
        mAssigned(network.variables.size(), false) {
    for (const std::string& text : universe) mTexts.push_back({text, 0});
    for (std::int64_t n = -1; n <= 4; ++n) mNumbers.push_back({"", n});
    for (const bool unknown : {false, true}) {
      for (std::size_t v = 0; v < network.variables.size(); ++v) {
        if (network.variables[v].domain.empty() == unknown) mOrder.push_back(v);
      }
    }
  }

  void Run(std::size_t depth = 0) {
    if (depth == mOrder.size()) return mFound(mValues);
    const std::size_t v = mOrder[depth];
    for (const Value& value : Candidates(v)) {
      mValues[v] = value;
      mAssigned[v] = true;
      if (IsConsistent(v)) Run(depth + 1);
    }
    mAssigned[v] = false;
  }

 private:
  std::vector<Value> Candidates(std::size_t v) const {
    const Variable& variable = mNetwork.variables[v];
    if (!variable.domain.empty()) return variable.domain;
    if (variable.type == Type::Boolean) return {{"", 0}, {"", 1}};
    std::vector<Value> candidates = IsText(variable.type) ? mTexts : mNumbers;
    for (const Constraint& constraint : mNetwork.constraints) {
      if (constraint.arguments.back() != static_cast<int>(v) || !IsFunction(constraint)) continue;
      if (!std::all_of(constraint.arguments.begin(), constraint.arguments.end() - 1,
                       [&](int a) { return mAssigned[static_cast<std::size_t>(a)]; }))
        continue;
      if (const auto image = Compute(mNetwork, constraint, mValues)) candidates.push_back(*image);
    }
    std::sort(candidates.begin(), candidates.end());
    candidates.erase(std::unique(candidates.begin(), candidates.end()), candidates.end());
    return candidates;
  }

  // Whether the constraints on v hold that have all their values.
  bool IsConsistent(std::size_t v) const {
    return std::all_of(mNetwork.constraints.begin(), mNetwork.constraints.end(), [&](const Constraint& constraint) {
      bool concerned = false, ready = true;
      for (const int a : constraint.arguments) {
        concerned = concerned || a == static_cast<int>(v);
        ready = ready && mAssigned[static_cast<std::size_t>(a)];
      }
      return !concerned || !ready || Holds(mNetwork, constraint, mValues);
    });
  }

  const Network& mNetwork;
  const std::function<void(const Assignment&)>& mFound;
  Assignment mValues;
  std::vector<bool> mAssigned;
  std::vector<std::size_t> mOrder;
  std::vector<Value> mTexts, mNumbers;
};

}  // namespace

bool Holds(const Network& network, const Constraint& constraint, const Assignment& values) {
  const bool reified = constraint.name.ends_with("_reif") || constraint.name == "bool_xor";
  if (!reified) return IsTrue(network, constraint, values);
  Constraint plain = constraint;
  plain.name.resize(std::min(plain.name.size(), plain.name.find("_reif")));
  plain.arguments.pop_back();
  return IsTrue(network, plain, values) == (values[static_cast<std::size_t>(constraint.arguments.back())].number != 0);
}

void Solve(const Network& network, const std::vector<std::string>& universe,
           const std::function<void(const Assignment&)>& found) {
  Solver(network, universe, found).Run();
}

zornet::Model Network::Build() const {
  zornet::Model model;
  for (const Variable& variable : variables) {
    zornet::Variable declared{"v" + std::to_string(model.Variables().size()), static_cast<zornet::Sort>(variable.type)};
    for (const Value& value : variable.domain) {
      if (IsText(variable.type)) declared.texts.push_back(value.text);
      if (!IsText(variable.type)) declared.numbers.push_back(static_cast<std::int32_t>(value.number));
    }
    if (!declared.numbers.empty() && variable.type == Type::Interval)
      declared.numbers = {declared.numbers.front(), declared.numbers.back()};
    model.Add(std::move(declared));
  }
  for (const Constraint& constraint : constraints) {
    std::vector<zornet::Argument> arguments, members;
    for (const int argument : constraint.arguments) {
      auto& list = members.size() < constraint.members ? members : arguments;
      list.emplace_back(zornet::Var{argument});
    }
    if (!members.empty()) arguments.insert(arguments.begin(), members);
    if (!constraint.expression.empty()) arguments.insert(arguments.begin() + 1, constraint.expression);
    if (!constraint.rows.empty()) arguments.emplace_back(zornet::Rows{constraint.rows});
    model.Post(*zornet::FindKind(constraint.name, !members.empty()), arguments);
  }
  return model;
}

namespace {

class Maker {
 public:
  Maker(std::mt19937& random, std::vector<std::string>& universe) : mRandom(random), mUniverse(universe) {}

  Network Make() {
    MakeUniverse();
    const bool isOfNumbers = Draw(2) != 0;
    const std::size_t texts = isOfNumbers ? Draw(2) : 2 + Draw(3);
    const std::size_t numbers = isOfNumbers ? 1 + Draw(4) : Draw(3);
    const std::size_t truths = isOfNumbers ? 1 + Draw(4) : Draw(2);
    for (std::size_t i = 0; i < texts; ++i) AddText();
    for (std::size_t i = 0; i < numbers; ++i) AddNumber();
    for (std::size_t i = 0; i < truths; ++i) mNetwork.variables.push_back({Type::Boolean, MaybeTruth()});
    const std::size_t constraints = 1 + Draw(4);
    while (mNetwork.constraints.size() < constraints) AddConstraint();
    return std::move(mNetwork);
  }

 private:
  std::size_t Draw(std::size_t limit) { return mRandom() % limit; }

  // Texts of up to two or three characters, of which " " and "" are least ones, and at times the longest texts.
  void MakeUniverse() {
    static const char* const kAlphabets[] = {"ab", "aA", " a", "az", " z", "bAa", "a\"", "1-", "{ a"};
    std::string alphabet = kAlphabets[Draw(8)];
    const std::size_t longest = alphabet.size() > 2 ? 2 : 2 + Draw(2);
    mUniverse = {""};
    for (std::size_t i = 0; i < mUniverse.size(); ++i) {
      if (mUniverse[i].size() == longest) break;
      const std::string prefix = mUniverse[i];
      for (const char c : alphabet) {
        if (c != '"') mUniverse.push_back(prefix + c);
      }
    }
    if (Draw(6) == 0) {
      mUniverse.resize(std::min<std::size_t>(mUniverse.size(), 6));
      mUniverse.insert(mUniverse.end(), {kGreatest, std::string(254, 'z'), std::string(254, 'z') + 'y',
                                         std::string(255, 'a'), std::string(254, 'A') + ' '});
    }
    if (Draw(8) == 0) mUniverse.insert(mUniverse.end(), {"Min", "Max", "true", "1", "-1"});
  }

  const std::string& Text() { return mUniverse[Draw(mUniverse.size())]; }

  void AddText() {
    Variable variable{Draw(5) < 2 ? Type::Text : Type::TextSet, {}};
    const std::size_t count = variable.type == Type::Text ? Draw(3) != 0 : Draw(5) == 0 ? 0 : 1 + Draw(5);
    std::set<Value> texts;
    for (std::size_t i = 0; i < count; ++i) texts.insert({Text(), 0});
    variable.domain.assign(texts.begin(), texts.end());
    mNetwork.variables.push_back(std::move(variable));
  }

  void AddNumber() {
    const std::int64_t least = std::numeric_limits<std::int32_t>::min(),
                       greatest = std::numeric_limits<std::int32_t>::max();
    const std::size_t end = Draw(8);  // now and then near an end of all numbers
    const std::int64_t from = end == 0 ? least : end == 1 ? greatest - 5 : static_cast<std::int64_t>(Draw(5)) - 2;
    Variable variable{Type::Integer, {}};
    const std::size_t kind = Draw(4);
    if (kind == 0 && Draw(3) == 0) variable.type = Draw(2) == 0 ? Type::Interval : Type::IntegerSet;
    if (kind == 1) variable.domain = {{"", from}};
    if (kind == 2) {
      variable.type = Type::Interval;
      for (std::int64_t n = from; n <= from + static_cast<std::int64_t>(Draw(5)); ++n)
        variable.domain.push_back({"", n});
    }
    if (kind == 3) {
      variable.type = Type::IntegerSet;
      variable.domain = {{"", from}, {"", from + 2}, {"", from + 3 + static_cast<std::int64_t>(Draw(3))}};
      if (Draw(4) == 0) variable.domain = {{"", least}, {"", static_cast<std::int64_t>(Draw(4))}, {"", greatest}};
    }
    mNetwork.variables.push_back(std::move(variable));
  }

  std::vector<Value> MaybeTruth() {
    const std::size_t kind = Draw(3);
    return kind == 2 ? std::vector<Value>{} : std::vector<Value>{{"", static_cast<std::int64_t>(kind)}};
  }

  const char* Expression() {
    static const char* const kExpressions[] = {"a*", "[ab]?z*", ".", "(a|b| )+", "[^a]*", "a.*|z", "..?", "A+b*"};
    return kExpressions[Draw(std::size(kExpressions))];
  }

  std::vector<std::vector<std::string>> MakeRows(std::size_t columns) {
    std::vector<std::vector<std::string>> rows(1 + Draw(12));
    for (auto& row : rows) {
      while (row.size() < columns) row.push_back(Text());
    }
    return rows;
  }

  void AddConstraint() {
    struct Shape {
      const char* name;
      const char* takes;  // t: a text, i: an integer, b: a truth value, a: anything; *: a list of what follows,
                          // e: an expression, r: rows
    };
    // clang-format off
    static constexpr Shape kShapes[] = {
        {"str_eq", "tt"}, {"str_ne", "tt"}, {"str_lt", "tt"}, {"str_le", "tt"}, {"str_gt", "tt"}, {"str_ge", "tt"},
        {"str_eq_reif", "ttb"}, {"str_ne_reif", "ttb"}, {"str_lt_reif", "ttb"}, {"str_le_reif", "ttb"},
        {"str_gt_reif", "ttb"}, {"str_ge_reif", "ttb"},
        {"str_concat", "ttt"}, {"str_concat", "ttt"}, {"str_concat", "ttt"}, {"str_concat", "*tt"},
        {"str_concat", "*tt"}, {"str_substr", "tiit"}, {"str_substr", "tiit"}, {"str_length", "ti"},
        {"str_lower", "tt"}, {"str_upper", "tt"}, {"str_min", "ttt"}, {"str_max", "ttt"}, {"str_min", "*tt"},
        {"str_max", "*tt"}, {"str_next", "tt"}, {"str_text", "at"},
        {"str_prefix", "tt"}, {"str_suffix", "tt"}, {"str_contains", "tt"}, {"str_matches", "te"},
        {"str_find", "tti"}, {"str_replace", "tttt"}, {"str_replace_all", "tttt"},
        {"str_prefix_reif", "ttb"}, {"str_suffix_reif", "ttb"}, {"str_contains_reif", "ttb"},
        {"str_matches_reif", "teb"}, {"str_find_reif", "ttib"}, {"str_replace_reif", "ttttb"},
        {"str_replace_all_reif", "ttttb"}, {"str_all_different", "*t"}, {"str_all_different", "*t"},
        {"str_table", "*tr"},

        {"int_eq", "ii"}, {"int_ne", "ii"}, {"int_lt", "ii"}, {"int_le", "ii"}, {"int_eq_reif", "iib"},
        {"int_ne_reif", "iib"}, {"int_lt_reif", "iib"}, {"int_le_reif", "iib"}, {"int_plus", "iii"},
        {"int_plus", "iii"}, {"int_times", "iii"}, {"int_times", "iii"}, {"int_min", "iii"}, {"int_max", "iii"},
        {"int_min", "*ii"}, {"int_max", "*ii"}, {"int_sum", "*ii"}, {"int_sum", "*ii"},

        {"bool_eq", "bb"}, {"bool_not", "bb"}, {"bool_lt", "bb"}, {"bool_le", "bb"}, {"bool_imply", "bb"},
        {"bool_eq_reif", "bbb"}, {"bool_xor", "bbb"}, {"bool_lt_reif", "bbb"}, {"bool_le_reif", "bbb"},
        {"bool_and", "bbb"}, {"bool_or", "bbb"}, {"array_bool_and", "*bb"}, {"array_bool_or", "*bb"},
        {"bool2int", "bi"}};
    // clang-format on
    const Shape& shape = kShapes[Draw(std::size(kShapes))];
    Constraint constraint{shape.name, {}};
    if (*shape.takes == '*') constraint.members = 1 + Draw(4);
    const std::string takes =
        constraint.members == 0 ? shape.takes : std::string(constraint.members, shape.takes[1]) + (shape.takes + 2);
    for (const char wanted : takes) {
      if (wanted == 'e') constraint.expression = Expression();
      if (wanted == 'r') constraint.rows = MakeRows(constraint.members);
      if (wanted == 'e' || wanted == 'r') continue;
      std::vector<int> fitting;
      for (std::size_t v = 0; v < mNetwork.variables.size(); ++v) {
        const Type type = mNetwork.variables[v].type;
        const char letter = IsText(type) ? 't' : type == Type::Boolean ? 'b' : 'i';
        if (wanted == 'a' || wanted == letter) fitting.push_back(static_cast<int>(v));
      }
      if (fitting.empty()) return;
      constraint.arguments.push_back(fitting[Draw(fitting.size())]);
    }
    mNetwork.constraints.push_back(std::move(constraint));
  }

  std::mt19937& mRandom;
  std::vector<std::string>& mUniverse;
  Network mNetwork;
};

}  // namespace

Network Random(std::mt19937& random, std::vector<std::string>& universe) { return Maker(random, universe).Make(); }

}  // namespace naive
