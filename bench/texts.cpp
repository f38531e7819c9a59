#include "bench/texts.h"

#include <algorithm>

namespace zor::bench {

namespace {

constexpr const char* kWords[] = {"Cable-",   "cable/",  "cabinet-", "Frame.",  "frame-x", "gear",
                                  "gearbox-", "gear-",   "Handle-",  "handle.", "hinge",   "lamp-",
                                  "Lamp/",    "lampada", "motor-",   "motor.a", "Panel-",  "panel.",
                                  "pipe",     "Spring-", "spring/",  "table",   "valve-",  "valve.z"};

}  // namespace

std::string TextMaker::Letters(std::size_t length) {
  constexpr char kLetters[] = "abcdefghijklmnopqrstuvwxyz0123456789";
  std::string text(length, ' ');
  for (char& c : text) c = kLetters[Below(sizeof kLetters - 1)];
  return text;
}

std::string TextMaker::Next() {
  const std::string word = kWords[Below(std::size(kWords))];
  const std::size_t shortest = std::max<std::size_t>(8, word.size() + 4);
  return word + Letters(shortest + Below(25 - shortest) - word.size());
}

Texts TextMaker::Distinct(std::size_t count) {
  Texts texts;
  while (texts.size() < count) {
    while (texts.size() < count) texts.push_back(Next());
    std::sort(texts.begin(), texts.end());
    texts.erase(std::unique(texts.begin(), texts.end()), texts.end());
  }
  return texts;
}

void TextMaker::Shuffle(Texts& texts) {
  for (std::size_t i = texts.size(); i > 1; --i) std::swap(texts[i - 1], texts[Below(i)]);
}

}  // namespace zor::bench
