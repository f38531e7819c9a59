#include "tests/network/naive.h"

#include <algorithm>
#include <functional>
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
  return replaced;
}

std::string Form(Type type, const Value& value) {
  if (type == Type::Boolean) return value.number != 0 ? "true" : "false";
  if (!IsText(type)) return std::to_string(value.number);
  if (value.text == (type == Type::Text ? " " : "")) return "Min";
  if (value.text == kGreatest) return "Max";
  return '"' + value.text + '"';
}

bool Matches(const std::string& text, const std::string& expression) {
  static std::map<std::string, std::regex> compiled;
  return std::regex_match(text, compiled.try_emplace(expression, expression).first->second);
}

// What a constraint is asked about.
struct Asked {
  std::vector<Value> operands;
  Type first;
  const Constraint& constraint;

  const std::string& Text(std::size_t i) const { return operands[i].text; }
  template <class Fold>
  std::int64_t Folded(Fold fold) const {
    std::int64_t number = operands[0].number;
    for (std::size_t i = 1; i < operands.size(); ++i) number = fold(number, operands[i].number);
    return number;
  }
};

using Image = std::optional<Value>;
using In = const Asked&;

Image Truth(bool holds) { return Value{"", holds ? 1 : 0}; }
Image Text(const std::string& text) { return Value{text.size() > kLongest ? kGreatest : text, 0}; }
Image Number(std::int64_t number) {
  return number == static_cast<std::int32_t>(number) ? Image(Value{"", number}) : Image();
}

// What constraints mean on exact values, by their names without the types: what a function makes of all but its last
// operand, nothing where that is no value, or whether a relation holds.
struct Meaning {
  std::string_view names;
  bool computes;
  Image (*image)(In x);
};

// clang-format off
const Meaning kMeanings[] = {
  {"eq 2int",       false, [](In x) { return Truth(x.operands[0] == x.operands[1]); }},
  {"ne not xor",    false, [](In x) { return Truth(x.operands[0] != x.operands[1]); }},
  {"lt",            false, [](In x) { return Truth(x.operands[0] < x.operands[1]); }},
  {"le imply",      false, [](In x) { return Truth(x.operands[0] <= x.operands[1]); }},
  {"gt",            false, [](In x) { return Truth(x.operands[0] > x.operands[1]); }},
  {"ge",            false, [](In x) { return Truth(x.operands[0] >= x.operands[1]); }},
  {"prefix",        false, [](In x) { return Truth(x.Text(0) == x.Text(1).substr(0, x.Text(0).size())); }},
  {"suffix",        false, [](In x) { return Truth(Find(x.Text(1) + '\n', x.Text(0) + '\n') >= 0); }},
  {"contains",      false, [](In x) { return Truth(Find(x.Text(0), x.Text(1)) >= 0); }},
  {"matches",       false, [](In x) { return Truth(Matches(x.Text(0), x.constraint.expression)); }},
  {"all_different", false, [](In x) { return Truth(std::set(x.operands.begin(), x.operands.end()).size() == x.operands.size()); }},
  {"table",         false, [](In x) {
     const auto& rows = x.constraint.rows;
     return Truth(std::any_of(rows.begin(), rows.end(), [&](const auto& row) {
       return std::equal(row.begin(), row.end(), x.operands.begin(), [](auto& text, auto& v) { return v.text == text; });
     }));
   }},

  {"concat",        true,  [](In x) {
     return Text(std::accumulate(x.operands.begin(), x.operands.end(), std::string(),
                                 [](const std::string& head, const Value& v) { return head + v.text; }));
   }},
  {"substr",        true,  [](In x) { return Text(Slice(x.Text(0), x.operands[1].number, x.operands[2].number)); }},
  {"length",        true,  [](In x) { return Number(static_cast<std::int64_t>(x.Text(0).size())); }},
  {"lower",         true,  [](In x) { return Text(Fold(x.Text(0), 'A', 'Z', 'a' - 'A')); }},
  {"upper",         true,  [](In x) { return Text(Fold(x.Text(0), 'a', 'z', 'A' - 'a')); }},
  {"min and",       true,  [](In x) { return Image(*std::min_element(x.operands.begin(), x.operands.end())); }},
  {"max or",        true,  [](In x) { return Image(*std::max_element(x.operands.begin(), x.operands.end())); }},
  {"next",          true,  [](In x) { return Text(Next(x.Text(0))); }},
  {"find",          true,  [](In x) { return Number(Find(x.Text(0), x.Text(1))); }},
  {"replace",       true,  [](In x) { return Text(Replace(x.Text(0), x.Text(1), x.Text(2), false)); }},
  {"replace_all",   true,  [](In x) { return Text(Replace(x.Text(0), x.Text(1), x.Text(2), true)); }},
  {"text",          true,  [](In x) {
     const std::string form = Form(x.first, x.operands[0]);
     return form.size() <= kLongest ? Text(form) : Image();
   }},
  {"plus sum",      true,  [](In x) { return Number(x.Folded(std::plus())); }},
  {"times",         true,  [](In x) { return Number(x.Folded(std::multiplies())); }},
};
// clang-format on

const Meaning* FindMeaning(const zornet::Kind& kind) {
  std::string name(kind.name.substr(0, kind.name.find("_reif")));
  for (const char* type : {"str_", "int_", "array_", "bool_", "bool"}) {
    if (name.starts_with(type)) name.erase(0, std::string_view(type).size());
  }
  name = ' ' + name + ' ';
  return std::find_if(std::begin(kMeanings), std::end(kMeanings), [&](const Meaning& meaning) {
    return (' ' + std::string(meaning.names) + ' ').find(name) != std::string::npos;
  });
}

const Meaning& MeaningOf(const zornet::Kind& kind) {
  static std::map<const zornet::Kind*, const Meaning*> found;
  const Meaning*& meaning = found[&kind];
  if (meaning == nullptr) meaning = FindMeaning(kind);
  return *meaning;
}

// What a constraint makes of the first so many of its arguments.
Image ImageOf(const Network& network, const Constraint& constraint, const Assignment& values, std::size_t count) {
  const auto& arguments = constraint.arguments;
  Asked asked{{}, network.variables[static_cast<std::size_t>(arguments[0])].type, constraint};
  for (std::size_t i = 0; i < count; ++i) asked.operands.push_back(values[static_cast<std::size_t>(arguments[i])]);
  return MeaningOf(*constraint.kind).image(asked);
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
      if (constraint.arguments.back() != static_cast<int>(v) || constraint.kind->reified ||
          !MeaningOf(*constraint.kind).computes)
        continue;
      if (!std::all_of(constraint.arguments.begin(), constraint.arguments.end() - 1,
                       [&](int a) { return mAssigned[static_cast<std::size_t>(a)]; }))
        continue;
      if (const Image image = ImageOf(mNetwork, constraint, mValues, constraint.arguments.size() - 1))
        candidates.push_back(*image);
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
  const bool reified = constraint.kind->name.ends_with("_reif") || constraint.kind->name == "bool_xor";
  const bool computes = MeaningOf(*constraint.kind).computes;
  const std::size_t count = constraint.arguments.size() - (reified ? 1 : 0);
  const auto at = [&](std::size_t i) { return values[static_cast<std::size_t>(constraint.arguments[i])]; };
  const Image image = ImageOf(network, constraint, values, count - (computes ? 1 : 0));
  const bool holds = image && (computes ? *image == at(count - 1) : image->number != 0);
  return reified ? holds == (at(count).number != 0) : holds;
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
    model.Post(*constraint.kind, arguments);
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

  static char LetterOf(zornet::Takes takes) {
    if (takes == zornet::Takes::Anything) return 'a';
    return takes == zornet::Takes::Text ? 't' : takes == zornet::Takes::Boolean ? 'b' : 'i';
  }

  // Those with more to narrow come more often.
  void AddConstraint() {
    static const char* const kOften[] = {"str_concat", "str_substr", "str_all_different",
                                         "int_plus",   "int_times",  "int_sum"};
    const auto kinds = zornet::Kinds();
    const zornet::Kind* kind = &kinds[Draw(kinds.size())];
    if (Draw(6) == 0) kind = zornet::FindKind(kOften[Draw(std::size(kOften))], Draw(2) == 0);
    Constraint constraint{kind, {}};
    std::string takes;
    for (const zornet::Takes place : std::span(kind->takes).first(static_cast<std::size_t>(kind->arity))) {
      if (zornet::IsList(place)) constraint.members = 1 + Draw(4);
      if (zornet::IsVariable(place))
        takes.append(zornet::IsList(place) ? constraint.members : 1, LetterOf(zornet::MemberOf(place)));
      if (place == zornet::Takes::Expression) constraint.expression = Expression();
      if (place == zornet::Takes::Rows) constraint.rows = MakeRows(constraint.members);
    }
    for (const char wanted : takes) {
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
