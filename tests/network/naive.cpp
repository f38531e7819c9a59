#include "tests/network/naive.h"

#include <algorithm>
#include <limits>
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

std::string Form(Type type, const Value& value) {
  if (type == Type::Boolean) return value.number != 0 ? "true" : "false";
  if (!IsText(type)) return std::to_string(value.number);
  if (value.text == (type == Type::Text ? " " : "")) return "Min";
  if (value.text == kGreatest) return "Max";
  return '"' + value.text + '"';
}

Image Truth(bool holds) { return Value{"", holds ? 1 : 0}; }
Image Text(std::string text) { return Value{std::move(text), 0}; }

using In = const Arguments&;

// clang-format off
const Meaning kMeanings[] = {
  {"str_eq",     "tt",  'b', [](In x) { return Truth(x.Text(0) == x.Text(1)); }},
  {"str_ne",     "tt",  'b', [](In x) { return Truth(x.Text(0) != x.Text(1)); }},
  {"str_lt",     "tt",  'b', [](In x) { return Truth(x.Text(0) < x.Text(1)); }},
  {"str_le",     "tt",  'b', [](In x) { return Truth(x.Text(0) <= x.Text(1)); }},
  {"str_gt",     "tt",  'b', [](In x) { return Truth(x.Text(0) > x.Text(1)); }},
  {"str_ge",     "tt",  'b', [](In x) { return Truth(x.Text(0) >= x.Text(1)); }},
  {"str_concat", "tt",  't', [](In x) { return Text(x.Text(0).size() + x.Text(1).size() > kLongest ? kGreatest : x.Text(0) + x.Text(1)); }},
  {"str_substr", "tii", 't', [](In x) { return Text(Slice(x.Text(0), x[1].number, x[2].number)); }},
  {"str_length", "t",   'i', [](In x) -> Image { return Value{"", static_cast<std::int64_t>(x.Text(0).size())}; }},
  {"str_lower",  "t",   't', [](In x) { return Text(Fold(x.Text(0), 'A', 'Z', 'a' - 'A')); }},
  {"str_upper",  "t",   't', [](In x) { return Text(Fold(x.Text(0), 'a', 'z', 'A' - 'a')); }},
  {"str_min",    "tt",  't', [](In x) { return Text(std::min(x.Text(0), x.Text(1))); }},
  {"str_max",    "tt",  't', [](In x) { return Text(std::max(x.Text(0), x.Text(1))); }},
  {"str_next",   "t",   't', [](In x) { return Text(Next(x.Text(0))); }},
  {"str_text",   "a",   't', [](In x) {
     const std::string form = Form(x.TypeOf(0), x[0]);
     return form.size() <= kLongest ? Text(form) : Image();
   }},
};
// clang-format on

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
      if (constraint.arguments.back() != static_cast<int>(v) || !constraint.result) continue;
      if (!std::all_of(constraint.arguments.begin(), constraint.arguments.end() - 1,
                       [&](int a) { return mAssigned[static_cast<std::size_t>(a)]; }))
        continue;
      if (const Image image = constraint.meaning->image({mNetwork, constraint, mValues})) candidates.push_back(*image);
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
  const Image image = constraint.meaning->image({network, constraint, values});
  return image && (constraint.result ? *image == values[static_cast<std::size_t>(constraint.arguments.back())]
                                     : image->number != 0);
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
    if (variable.type == Type::Interval) declared.numbers = {declared.numbers.front(), declared.numbers.back()};
    model.Add(std::move(declared));
  }
  for (const Constraint& constraint : constraints) {
    std::vector<zornet::Var> arguments;
    for (const int argument : constraint.arguments) arguments.push_back({argument});
    model.Post(*zornet::FindKind(constraint.Name()), arguments);
  }
  return model;
}

namespace {

class Maker {
 public:
  Maker(std::mt19937& random, std::vector<std::string>& universe) : mRandom(random), mUniverse(universe) {}

  Network Make() {
    MakeUniverse();
    const std::size_t texts = 2 + Draw(3), numbers = Draw(3), truths = Draw(2);
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

  // Those with more to narrow come more often, and a third of the relations are reified where that is possible.
  void AddConstraint() {
    const Meaning* meaning = &kMeanings[Draw(std::size(kMeanings))];
    if (const std::size_t common = Draw(8); common < 2) {
      meaning = std::find_if(std::begin(kMeanings), std::end(kMeanings), [&](const Meaning& m) {
        return m.name == std::string(common == 0 ? "str_concat" : "str_substr");
      });
    }
    Constraint constraint{meaning, meaning->gives != 'b', {}};
    if (Draw(3) == 0 && zornet::FindKind(meaning->name + std::string("_reif")) != nullptr) constraint.result = true;
    std::string takes = meaning->takes;
    if (constraint.result) takes += meaning->gives;
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
