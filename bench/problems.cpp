#include "bench/problems.h"

#include <fmt/format.h>

#include <set>

#include "bench/texts.h"

namespace zor::bench {

namespace {

using Set = std::set<std::string>;

std::string Quoted(const std::string& text) { return fmt::format("\"{}\"", text); }
std::string Numbered(const char* name, std::size_t number) { return fmt::format("{}{}", name, number); }

class Writer {
 public:
  Writer() { mProblem.smt = "(set-logic QF_S)\n"; }

  // What is named from here on has names of its own.
  void StartPart(const char* part) { mPart = part; }
  std::string Name(const char* name, std::size_t number) const { return mPart + Numbered(name, number); }

  void Declare(const std::string& name, const std::string& type) {
    mProblem.network += fmt::format("var {}: {};\n", type, name);
    mProblem.smt += fmt::format("(declare-const {} String)\n", name);
  }
  void Declare(const std::string& name, const Set& texts) {
    std::string choice;
    for (const std::string& text : texts) choice += fmt::format(" (= {} {})", name, Quoted(text));
    Declare(name, fmt::format("{{\"{}\"}}", fmt::join(texts, "\", \"")));
    mProblem.smt += fmt::format("(assert (or{}))\n", choice);
  }
  void Concatenation(const std::string& x, const std::string& y, const std::string& z) {
    mProblem.network += fmt::format("constraint str_concat({}, {}, {});\n", x, y, z);
    mProblem.smt += fmt::format("(assert (= {} (str.++ {} {})))\n", z, x, y);
  }
  void LessOrEqual(const std::string& x, const std::string& y) {
    mProblem.network += fmt::format("constraint str_le({}, {});\n", x, y);
    mProblem.smt += fmt::format("(assert (str.<= {} {}))\n", x, y);
  }
  Problem Finish() {
    mProblem.smt += "(check-sat)\n";
    return mProblem;
  }

 private:
  Problem mProblem;
  std::string mPart;
};

Set Drawn(TextMaker& maker, std::size_t count, std::size_t length) {
  Set texts;
  while (texts.size() < count) texts.insert(maker.Letters(length));
  return texts;
}

constexpr std::size_t kStep = 4;  // characters that go and come

void AddChain(Writer& writer, std::size_t size) {
  TextMaker maker(static_cast<unsigned int>(size));
  std::string text = maker.Letters(16);
  writer.Declare(writer.Name("v", 0), "string");
  writer.Concatenation(Quoted(text), Quoted(""), writer.Name("v", 0));
  for (std::size_t i = 0; i < size / 2; ++i) {
    const std::string v = writer.Name("v", i), longer = writer.Name("p", i), next = writer.Name("v", i + 1);
    writer.Declare(longer, "string");
    writer.Declare(next, "string");
    const std::string tail = maker.Letters(kStep);
    writer.Concatenation(v, Quoted(tail), longer);
    writer.Concatenation(Quoted(text.substr(0, kStep)), next, longer);
    text = (text + tail).substr(kStep);
  }
}

void AddSets(Writer& writer, std::size_t size) {
  TextMaker maker(static_cast<unsigned int>(size));
  Set texts = Drawn(maker, 8, 2 * kStep);
  writer.Declare(writer.Name("v", 0), texts);
  for (std::size_t i = 0; i < size / 2; ++i) {
    const Set tails = Drawn(maker, 4, kStep);
    Set heads, all;
    for (const std::string& text : texts) {
      heads.insert(text.substr(0, kStep));
      for (const std::string& tail : tails) all.insert((text + tail).substr(kStep));
    }
    Texts fitting(all.begin(), all.end());
    maker.Shuffle(fitting);
    texts = Set(fitting.begin(), fitting.begin() + 8);
    Set listed = Drawn(maker, 8, 2 * kStep);
    listed.insert(texts.begin(), texts.end());

    writer.Declare(writer.Name("p", i), "set string");
    writer.Declare(writer.Name("t", i), tails);
    writer.Declare(writer.Name("h", i), heads);
    writer.Declare(writer.Name("v", i + 1), listed);
    writer.Concatenation(writer.Name("v", i), writer.Name("t", i), writer.Name("p", i));
    writer.Concatenation(writer.Name("h", i), writer.Name("v", i + 1), writer.Name("p", i));
  }
}

template <std::size_t kTexts>
void AddOrder(Writer& writer, std::size_t size) {
  TextMaker maker(static_cast<unsigned int>(size));
  for (std::size_t i = 0; i <= size; ++i) {
    Set texts = Drawn(maker, kTexts - 1, 8);
    texts.insert(Numbered("m", 100000 + i));
    writer.Declare(writer.Name("v", i), texts);
    if (i > 0) writer.LessOrEqual(writer.Name("v", i - 1), writer.Name("v", i));
  }
}

Problem Written(void (*add)(Writer&, std::size_t), std::size_t size) {
  Writer writer;
  add(writer, size);
  return writer.Finish();
}

}  // namespace

Problem Chain(std::size_t size) { return Written(AddChain, size); }
Problem Sets(std::size_t size) { return Written(AddSets, size); }
Problem Order(std::size_t size) { return Written(AddOrder<16>, size); }
Problem SmallOrder(std::size_t size) { return Written(AddOrder<4>, size); }

Problem Mix(std::size_t size) {
  Writer writer;
  writer.StartPart("chain_");
  AddChain(writer, size / 3);
  writer.StartPart("sets_");
  AddSets(writer, size / 3);
  writer.StartPart("order_");
  AddOrder<16>(writer, size / 3);
  return writer.Finish();
}

}  // namespace zor::bench
