// What zornet does for a few constraints, written by hand: plain FILE narrows a model of str_concat, str_le, str_lt and
// str_ne on listed texts, and prints its variables as zornet does. Any name comes after its declaration.
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
  std::string name;  // none of a constant
  bool known;
  Texts texts;
};

struct Constraint {
  std::string_view kind;
  std::vector<std::size_t> arguments;
};

[[noreturn]] void Fail(const char* what) {
  std::fprintf(stderr, "plain: %s\n", what);
  std::exit(1);
}

class Network {
 public:
  explicit Network(std::string_view source) : mRest(source) {
    for (std::string_view item = Word(); !item.empty(); item = Word()) item == "var" ? Declare() : Post();
  }

  void Narrow() {
    mReaders.resize(mVariables.size());
    mWaits.assign(mConstraints.size(), true);
    for (std::size_t c = 0; c < mConstraints.size(); ++c) {
      mQueue.push_back(c);
      for (const std::size_t variable : mConstraints[c].arguments) mReaders[variable].push_back(c);
    }
    while (!mQueue.empty()) {
      mNarrowed = mQueue.front();
      mQueue.pop_front();
      mWaits[mNarrowed] = false;
      const Constraint& constraint = mConstraints[mNarrowed];
      const auto& at = constraint.arguments;
      if (constraint.kind == "str_concat") {
        Concatenate(at[0], at[1], at[2]);
      } else if (constraint.kind == "str_ne") {
        Differ(at[0], at[1]);
        Differ(at[1], at[0]);
      } else {
        Order(at[0], at[1], constraint.kind == "str_lt");
      }
    }
  }

  void Print() const {
    std::string line;
    for (const Variable& variable : mVariables) {
      if (variable.name.empty()) continue;
      line = variable.name + " = ";
      if (!variable.known) line += "Any";
      if (variable.texts.size() > 1) line += "{ ";
      for (const std::string& text : variable.texts) {
        if (&text != &variable.texts.front()) line += ", ";
        line += '"' + text + '"';
      }
      if (variable.texts.size() > 1) line += " }";
      line += '\n';
      std::fwrite(line.data(), 1, line.size(), stdout);
    }
  }

 private:
  static bool IsInWord(char c) { return c == '_' || (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9'); }

  // A word, a text with its first quote, or one other character.
  std::string_view Word() {
    while (!mRest.empty() && (mRest.front() == ' ' || mRest.front() == '\n')) mRest.remove_prefix(1);
    std::size_t length = mRest.empty() ? 0 : 1;
    if (!mRest.empty() && mRest.front() == '"') {
      length = mRest.find('"', 1);
      const std::string_view text = mRest.substr(0, length);
      mRest.remove_prefix(length + 1);
      return text;
    }
    if (!mRest.empty() && IsInWord(mRest.front()))
      while (length < mRest.size() && IsInWord(mRest[length])) ++length;
    const std::string_view word = mRest.substr(0, length);
    mRest.remove_prefix(length);
    return word;
  }

  void Declare() {
    Variable variable{"", false, {}};
    std::string_view word = Word();
    if (word == "{") {
      variable.known = true;
      for (word = Word(); word != "}"; word = Word()) {
        if (word != ",") variable.texts.emplace_back(word.substr(1));
      }
      std::sort(variable.texts.begin(), variable.texts.end());
      variable.texts.erase(std::unique(variable.texts.begin(), variable.texts.end()), variable.texts.end());
    }
    while (word != ":") word = Word();
    const std::string_view name = Word();
    variable.name = name;
    mNames.emplace(name, mVariables.size());
    mVariables.push_back(std::move(variable));
    Word();
  }

  void Post() {
    Constraint constraint{Word(), {}};
    for (std::string_view word = Word(); word != ";"; word = Word()) {
      if (word.front() == '"') {
        constraint.arguments.push_back(mVariables.size());
        mVariables.push_back({"", true, {std::string(word.substr(1))}});
      } else if (IsInWord(word.front())) {
        constraint.arguments.push_back(mNames.at(word));
      }
    }
    mConstraints.push_back(std::move(constraint));
  }

  void Changed(std::size_t variable) {
    if (mVariables[variable].known && mVariables[variable].texts.empty()) Fail("a contradiction");
    for (const std::size_t reader : mReaders[variable]) {
      if (reader == mNarrowed || mWaits[reader]) continue;
      mWaits[reader] = true;
      mQueue.push_back(reader);
    }
  }

  void Keep(std::size_t variable, const std::vector<bool>& kept) {
    Texts& texts = mVariables[variable].texts;
    std::size_t count = 0;
    for (std::size_t i = 0; i < texts.size(); ++i) {
      if (!kept[i]) continue;
      if (count != i) texts[count] = std::move(texts[i]);
      ++count;
    }
    if (count == texts.size()) return;
    texts.resize(count);
    Changed(variable);
  }

  void Set(std::size_t variable, Texts texts) {
    mVariables[variable] = {std::move(mVariables[variable].name), true, std::move(texts)};
    Changed(variable);
  }

  void Concatenate(std::size_t x, std::size_t y, std::size_t z) {
    const Variable &heads = mVariables[x], &tails = mVariables[y], &all = mVariables[z];
    if (!heads.known || !tails.known) return Complete(x, y, z);
    if (!all.known) {
      Texts joined;
      for (const std::string& head : heads.texts) {
        for (const std::string& tail : tails.texts) joined.push_back(head + tail);
      }
      std::sort(joined.begin(), joined.end());
      joined.erase(std::unique(joined.begin(), joined.end()), joined.end());
      return Set(z, std::move(joined));
    }
    std::vector<bool> keptHeads(heads.texts.size()), keptTails(tails.texts.size()), kept(all.texts.size());
    std::string joined;
    for (std::size_t i = 0; i < heads.texts.size(); ++i) {
      for (std::size_t j = 0; j < tails.texts.size(); ++j) {
        joined.assign(heads.texts[i]).append(tails.texts[j]);
        const auto found = std::lower_bound(all.texts.begin(), all.texts.end(), joined);
        if (found == all.texts.end() || *found != joined) continue;
        keptHeads[i] = keptTails[j] = kept[static_cast<std::size_t>(found - all.texts.begin())] = true;
      }
    }
    Keep(x, keptHeads);
    Keep(y, keptTails);
    Keep(z, kept);
  }

  // One text is unknown, and the others are known.
  void Complete(std::size_t x, std::size_t y, std::size_t z) {
    if (!mVariables[z].known || mVariables[z].texts.size() != 1) return;
    const std::string& all = mVariables[z].texts.front();
    if (mVariables[x].known && mVariables[x].texts.size() == 1) {
      const std::string& head = mVariables[x].texts.front();
      if (all.compare(0, head.size(), head) != 0) Fail("a contradiction");
      Set(y, {all.substr(head.size())});
    } else if (mVariables[y].known && mVariables[y].texts.size() == 1) {
      const std::string& tail = mVariables[y].texts.front();
      if (all.size() < tail.size() || all.compare(all.size() - tail.size(), tail.size(), tail) != 0)
        Fail("a contradiction");
      Set(x, {all.substr(0, all.size() - tail.size())});
    }
  }

  void Order(std::size_t x, std::size_t y, bool strict) {
    Texts &lesser = mVariables[x].texts, &greater = mVariables[y].texts;
    const auto last = strict ? std::lower_bound(lesser.begin(), lesser.end(), greater.back())
                             : std::upper_bound(lesser.begin(), lesser.end(), greater.back());
    if (last != lesser.end()) {
      lesser.erase(last, lesser.end());
      Changed(x);
    }
    const auto first = strict ? std::upper_bound(greater.begin(), greater.end(), lesser.front())
                              : std::lower_bound(greater.begin(), greater.end(), lesser.front());
    if (first != greater.begin()) {
      greater.erase(greater.begin(), first);
      Changed(y);
    }
  }

  void Differ(std::size_t x, std::size_t y) {
    if (mVariables[y].texts.size() != 1) return;
    Texts& texts = mVariables[x].texts;
    const auto found = std::lower_bound(texts.begin(), texts.end(), mVariables[y].texts.front());
    if (found == texts.end() || *found != mVariables[y].texts.front()) return;
    texts.erase(found);
    Changed(x);
  }

  std::string_view mRest;
  std::vector<Variable> mVariables;
  std::vector<Constraint> mConstraints;
  std::unordered_map<std::string_view, std::size_t> mNames;
  std::vector<std::vector<std::size_t>> mReaders;
  std::deque<std::size_t> mQueue;
  std::vector<bool> mWaits;
  std::size_t mNarrowed = 0;
};

}  // namespace

int main(int argc, char** argv) {
  std::ifstream file(argc == 2 ? argv[1] : "", std::ios::binary);
  if (!file) Fail("no such file");
  const std::string source{std::istreambuf_iterator<char>(file), {}};
  Network network(source);
  network.Narrow();
  network.Print();
}
