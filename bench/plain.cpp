// What somebody would write for such networks by hand: reads a model of orders and concatenations, narrows its texts
// and prints them as zornet -q does. No more of the language than bench/problems.cpp writes, and no message that says
// where.
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <deque>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

namespace {

using Texts = std::vector<std::string>;

struct Variable {
  std::string name;
  bool known = false, set = false;
  Texts texts;  // ascending
  std::vector<int> constraints;
};

struct Constraint {
  bool order = false;
  int x = 0, y = 0, z = 0;
  bool waits = true;
};

struct Network {
  std::vector<Variable> variables;
  std::vector<Constraint> constraints;
};

[[noreturn]] void Fail(const char* what) {
  std::fprintf(stderr, "%s\n", what);
  std::exit(1);
}

class Parser {
 public:
  explicit Parser(std::string_view text) : mRest(text) {}

  Network Read() {
    for (Blank(); !mRest.empty(); Blank()) {
      if (Takes("var ")) {
        Declare();
      } else if (Takes("constraint ")) {
        Constrain();
      } else {
        Fail("neither variable nor constraint");
      }
      Expect(";");
    }
    return std::move(mNetwork);
  }

 private:
  void Blank() { mRest.remove_prefix(std::min(mRest.find_first_not_of(" \n"), mRest.size())); }

  bool Takes(std::string_view word) {
    Blank();
    if (!mRest.starts_with(word)) return false;
    mRest.remove_prefix(word.size());
    return true;
  }

  void Expect(std::string_view word) {
    if (!Takes(word)) Fail("a mark is missing");
  }

  std::string_view Until(std::string_view marks) {
    Blank();
    const std::size_t length = mRest.find_first_of(marks);
    if (length == std::string_view::npos) Fail("the model ends within a word");
    const std::string_view word = mRest.substr(0, length);
    mRest.remove_prefix(length);
    return word;
  }

  std::string Text() {
    std::string text(Until("\""));
    Expect("\"");
    return text;
  }

  void Declare() {
    Variable variable;
    if (Takes("{")) {
      do {
        Expect("\"");
        variable.texts.push_back(Text());
      } while (Takes(","));
      Expect("}");
      std::sort(variable.texts.begin(), variable.texts.end());
      variable.known = variable.set = true;
    } else {
      variable.set = Takes("set ");
      Expect("string");
    }
    Expect(":");
    const std::string_view name = Until(";");
    variable.name = name;
    if (!mNames.try_emplace(name, static_cast<int>(mNetwork.variables.size())).second) Fail("a name stands twice");
    mNetwork.variables.push_back(std::move(variable));
  }

  int Argument() {
    if (!Takes("\"")) {
      const auto found = mNames.find(Until(",)"));
      if (found == mNames.end()) Fail("a name is unknown");
      return found->second;
    }
    Variable& constant = mNetwork.variables.emplace_back();
    constant.known = true;
    constant.texts.push_back(Text());
    return static_cast<int>(mNetwork.variables.size()) - 1;
  }

  void Constrain() {
    Constraint made;
    made.order = Takes("str_le(");
    if (!made.order) Expect("str_concat(");
    const auto number = static_cast<int>(mNetwork.constraints.size());
    const auto argument = [&](std::string_view end) {
      const int variable = Argument();
      Expect(end);
      mNetwork.variables[static_cast<std::size_t>(variable)].constraints.push_back(number);
      return variable;
    };
    made.x = argument(",");
    made.y = argument(made.order ? ")" : ",");
    if (!made.order) made.z = argument(")");
    mNetwork.constraints.push_back(made);
  }

  std::string_view mRest;
  Network mNetwork;
  std::unordered_map<std::string_view, int> mNames;
};

class Solver {
 public:
  explicit Solver(Network& network) : mNetwork(network) {
    for (std::size_t i = 0; i < network.constraints.size(); ++i) mQueue.push_back(static_cast<int>(i));
  }

  void Run() {
    while (!mQueue.empty()) {
      Constraint& constraint = mNetwork.constraints[static_cast<std::size_t>(mQueue.front())];
      mQueue.pop_front();
      constraint.waits = false;
      constraint.order ? Order(constraint) : Concatenate(constraint);
    }
  }

 private:
  Variable& Of(int variable) { return mNetwork.variables[static_cast<std::size_t>(variable)]; }

  void Changed(const Variable& variable) {
    if (variable.texts.empty()) Fail("contradiction");
    for (const int other : variable.constraints) {
      Constraint& constraint = mNetwork.constraints[static_cast<std::size_t>(other)];
      if (!std::exchange(constraint.waits, true)) mQueue.push_back(other);
    }
  }

  void Learn(Variable& variable, Texts texts) {
    std::sort(texts.begin(), texts.end());
    texts.erase(std::unique(texts.begin(), texts.end()), texts.end());
    if (!variable.set && texts.size() > 1) return;
    variable.texts = std::move(texts);
    variable.known = true;
    Changed(variable);
  }

  template <class Fits>
  void Keep(Variable& variable, Fits fits) {
    if (std::erase_if(variable.texts, [&](const std::string& text) { return !fits(text); }) != 0) Changed(variable);
  }

  void Order(const Constraint& constraint) {
    Variable &x = Of(constraint.x), &y = Of(constraint.y);
    if (!x.known || !y.known) return;
    Keep(x, [&](const std::string& text) { return text <= y.texts.back(); });
    Keep(y, [&](const std::string& text) { return text >= x.texts.front(); });
  }

  void Concatenate(const Constraint& constraint) {
    Variable &x = Of(constraint.x), &y = Of(constraint.y), &z = Of(constraint.z);
    if (x.known && y.known) return Join(x, y, z);
    if (!z.known || (!x.known && !y.known)) return;
    Texts rests;
    for (const std::string_view whole : z.texts) {
      for (const std::string_view part : x.known ? x.texts : y.texts) {
        if (x.known && whole.starts_with(part)) rests.emplace_back(whole.substr(part.size()));
        if (y.known && whole.ends_with(part)) rests.emplace_back(whole.substr(0, whole.size() - part.size()));
      }
    }
    Learn(x.known ? y : x, std::move(rests));
    if (x.known && y.known) Join(x, y, z);
  }

  // Which of x, y and z have a part in a pair that fits.
  void Join(Variable& x, Variable& y, Variable& z) {
    if (!z.known) {
      Texts pairs;
      for (const std::string& head : x.texts) {
        for (const std::string& tail : y.texts) pairs.push_back(head + tail);
      }
      return Learn(z, std::move(pairs));
    }
    std::vector<char> heads(x.texts.size()), tails(y.texts.size()), wholes(z.texts.size());
    std::string pair;
    for (std::size_t i = 0; i < heads.size(); ++i) {
      for (std::size_t j = 0; j < tails.size(); ++j) {
        pair.assign(x.texts[i]).append(y.texts[j]);
        const auto found = std::lower_bound(z.texts.begin(), z.texts.end(), pair);
        if (found == z.texts.end() || *found != pair) continue;
        heads[i] = tails[j] = wholes[static_cast<std::size_t>(found - z.texts.begin())] = 1;
      }
    }
    KeepMarked(x, heads);
    KeepMarked(y, tails);
    KeepMarked(z, wholes);
  }

  void KeepMarked(Variable& variable, const std::vector<char>& marks) {
    if (std::find(marks.begin(), marks.end(), 0) == marks.end()) return;
    auto mark = marks.begin();
    Keep(variable, [&](const std::string&) { return *mark++ != 0; });
  }

  Network& mNetwork;
  std::deque<int> mQueue;
};

void Print(const Network& network) {
  std::string out;
  for (const Variable& variable : network.variables) {
    if (variable.name.empty()) continue;
    out += variable.name + " = ";
    const bool many = variable.texts.size() > 1;
    if (many) out += "{ ";
    if (!variable.known) out += "Any";
    for (std::size_t i = 0; i < variable.texts.size(); ++i) {
      out += i == 0 ? "\"" : ", \"";
      out += variable.texts[i];
      out += '"';
    }
    out += many ? " }\n" : "\n";
    if (out.size() < 1 << 16) continue;
    std::fwrite(out.data(), 1, out.size(), stdout);
    out.clear();
  }
  std::fwrite(out.data(), 1, out.size(), stdout);
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) Fail("plain MODEL");
  std::ifstream file(argv[1], std::ios::binary);
  const std::string text{std::istreambuf_iterator<char>(file), {}};
  Network network = Parser(text).Read();
  Solver(network).Run();
  Print(network);
}
