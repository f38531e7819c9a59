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
};

Set Drawn(TextMaker& maker, std::size_t count, std::size_t length) {
  Set texts;
  while (texts.size() < count) texts.insert(maker.Letters(length));
  return texts;
}

constexpr std::size_t kStep = 4;  // characters that go and come

}  // namespace

Problem Chain(std::size_t size) {
  TextMaker maker(static_cast<unsigned int>(size));
  Writer writer;
  std::string text = maker.Letters(16);
  writer.Declare("v0", "string");
  writer.Concatenation(Quoted(text), Quoted(""), "v0");
  for (std::size_t i = 0; i < size / 2; ++i) {
    const std::string v = Numbered("v", i), longer = Numbered("p", i), next = Numbered("v", i + 1);
    writer.Declare(longer, "string");
    writer.Declare(next, "string");
    const std::string tail = maker.Letters(kStep);
    writer.Concatenation(v, Quoted(tail), longer);
    writer.Concatenation(Quoted(text.substr(0, kStep)), next, longer);
    text = (text + tail).substr(kStep);
  }
  return writer.Finish();
}

Problem Sets(std::size_t size) {
  TextMaker maker(static_cast<unsigned int>(size));
  Writer writer;
  Set texts = Drawn(maker, 8, 2 * kStep);
  writer.Declare("v0", texts);
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

    writer.Declare(Numbered("p", i), "set string");
    writer.Declare(Numbered("t", i), tails);
    writer.Declare(Numbered("h", i), heads);
    writer.Declare(Numbered("v", i + 1), listed);
    writer.Concatenation(Numbered("v", i), Numbered("t", i), Numbered("p", i));
    writer.Concatenation(Numbered("h", i), Numbered("v", i + 1), Numbered("p", i));
  }
  return writer.Finish();
}

Problem Order(std::size_t size) {
  TextMaker maker(static_cast<unsigned int>(size));
  Writer writer;
  for (std::size_t i = 0; i <= size; ++i) {
    Set texts = Drawn(maker, 15, 8);
    texts.insert(Numbered("m", 100000 + i));
    writer.Declare(Numbered("v", i), texts);
    if (i > 0) writer.LessOrEqual(Numbered("v", i - 1), Numbered("v", i));
  }
  return writer.Finish();
}

}  // namespace zor::bench
