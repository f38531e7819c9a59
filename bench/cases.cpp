#include "bench/cases.h"

#include <algorithm>
#include <map>
#include <set>
#include <string>
#include <utility>

namespace zor::bench {

Case Overlapping(TextMaker& maker, std::size_t size) {
  Texts all = maker.Distinct(size + size / 2);
  Texts shuffled = all;
  maker.Shuffle(shuffled);
  Case made;
  made.target.assign(shuffled.begin(), shuffled.begin() + static_cast<std::ptrdiff_t>(size));
  made.x.assign(shuffled.end() - static_cast<std::ptrdiff_t>(size), shuffled.end());
  std::sort(made.target.begin(), made.target.end());
  std::sort(made.x.begin(), made.x.end());
  return made;
}

Case Same(TextMaker& maker, std::size_t size) {
  const Texts texts = maker.Distinct(size);
  return {texts, texts, {texts[size / 4], texts[size - size / 4]}};
}

Case Shuffled(TextMaker& maker, std::size_t size) {
  Case made{maker.Distinct(size), {}, {}};
  maker.Shuffle(made.target);
  return made;
}

Case Sought(TextMaker& maker, std::size_t size) {
  Case made{maker.Distinct(size), {}, {}};
  for (std::size_t i = 0; i < 16; ++i) made.y.push_back(i % 2 == 0 ? made.target[maker.Below(size)] : maker.Next());
  maker.Shuffle(made.y);
  return made;
}

Case Few(TextMaker& maker, std::size_t size) {
  Case made{maker.Distinct(8), maker.Distinct(size), {}};
  for (std::size_t i = 0; i < 8; ++i) made.target.push_back(made.x[size / 8 * i + maker.Below(size / 8)]);
  std::sort(made.target.begin(), made.target.end());
  return made;
}

static Texts Pairs(const Texts& x, const Texts& y) {
  std::set<std::string> pairs;
  for (const std::string& head : x) {
    for (const std::string& tail : y) pairs.insert(head + tail);
  }
  return {pairs.begin(), pairs.end()};
}

// Heads have a word in common, results 8 to 24 characters.
Case Crossed(TextMaker& maker, std::size_t) {
  Case made;
  do {
    std::set<std::string> heads, tails;
    const std::string word = maker.Next().substr(0, 4);
    while (heads.size() < 16) heads.insert(word + maker.Letters(1 + maker.Below(8)));
    while (tails.size() < 16) tails.insert(maker.Letters(3 + maker.Below(10)));
    made = {{}, {heads.begin(), heads.end()}, {tails.begin(), tails.end()}};
  } while (Pairs(made.x, made.y).size() != 256);
  return made;
}

Case Runs(TextMaker& maker, std::size_t) {
  const std::string word = maker.Next().substr(0, 4);
  const char letter = maker.Letters(1)[0];
  Case made;
  for (std::size_t i = 0; i < 16; ++i) {
    made.x.push_back(word + std::string(i, letter));
    made.y.emplace_back(i, letter);
  }
  return made;
}

Case CrossedAll(TextMaker& maker, std::size_t size) {
  Case made = Crossed(maker, size);
  made.target = Pairs(made.x, made.y);
  return made;
}

Case CrossedSome(TextMaker& maker, std::size_t size) {
  Case made = CrossedAll(maker, size);
  maker.Shuffle(made.target);
  made.target.resize(32);
  for (std::size_t i = 0; i < 16; ++i) made.target[i].back() = '!';
  std::sort(made.target.begin(), made.target.end());
  return made;
}

// Capitals stand in front and further on, so that the order of the folds is another.
Case Folds(TextMaker& maker, std::size_t size) {
  const auto flip = [](char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c ^ 0x20) : c; };
  const auto lower = [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c ^ 0x20) : c; };
  Case made;
  do {
    made = {maker.Distinct(size), {}, {}};
    for (std::string& text : made.target) {
      std::transform(text.begin(), text.end(), text.begin(), lower);
      made.x.push_back(text);
      for (const std::size_t at : {std::size_t{0}, maker.Below(text.size())}) {
        if (maker.Below(2) == 0) made.x.back()[at] = flip(text[at]);
      }
    }
    std::sort(made.target.begin(), made.target.end());
    made.target.erase(std::unique(made.target.begin(), made.target.end()), made.target.end());
    std::sort(made.x.begin(), made.x.end());
  } while (made.target.size() != size);
  return made;
}

const Cases& Cached(Case (*make)(TextMaker&, std::size_t), int size, std::size_t count) {
  static std::map<std::pair<Case (*)(TextMaker&, std::size_t), int>, Cases> cached;
  Cases& cases = cached[{make, size}];
  TextMaker maker(static_cast<unsigned int>(size));
  while (cases.size() < count) cases.push_back(make(maker, static_cast<std::size_t>(size)));
  return cases;
}

}  // namespace zor::bench
