#include <gtest/gtest.h>

#include <random>
#include <string>
#include <utility>

#include "host/ZORText.h"

namespace {

constexpr std::size_t kLengths[] = {0, 1, 30, 31, 32, 33, 255, 256, 300};  // around the ends of each storage mode

std::string StdOf(const ZORString& text) {
  return std::string(text.CastToCharPtr(), static_cast<std::size_t>(text.GetLengthInChar()));
}

void ExpectSame(const ZORString& text, const std::string& model) {
  ASSERT_EQ(StdOf(text), model);
  ASSERT_EQ(text.CastToCharPtr()[model.size()], '\0');
}

// A text and the standard string that it must equal.
struct Pair {
  ZORString text;
  std::string model;
};

class RandomTexts {
 public:
  std::size_t Below(std::size_t limit) { return std::uniform_int_distribution<std::size_t>(0, limit - 1)(mEngine); }

  Pair Make() {
    const std::size_t length = kLengths[Below(std::size(kLengths))];
    if (Below(2) == 0) return {ZORString('z', length), std::string(length, 'z')};
    std::string model(length, ' ');
    for (char& c : model) c = "abAZz{@\xe9 "[Below(9)];
    return {ZORString(model.data(), model.size()), model};
  }

 private:
  std::mt19937 mEngine{20240229};
};

// One change of x, in both worlds; y is another pair or x itself.
void Change(Pair& x, Pair& y, RandomTexts& random) {
  const std::size_t start = random.Below(x.model.size() + 1), count = random.Below(40);
  switch (random.Below(8)) {
    case 0:
      if (x.model.size() + y.model.size() > 2000) break;
      EXPECT_EQ(&x.text.Append(y.text), &x.text);
      x.model.append(std::string(y.model));
      break;
    case 1:
      x.text.ReplaceSubString(static_cast<int>(start), static_cast<int>(count), y.text);
      x.model.replace(start, count, std::string(y.model));
      break;
    case 2:
      x.text = x.text.SubString(start, count);
      x.model = x.model.substr(start, count);
      break;
    case 3:
      x.text = y.text;
      x.model = y.model;
      break;
    case 4:
      x = random.Make();
      break;
    case 5:
      x.text.ToUpper();
      for (char& c : x.model) c = c >= 'a' && c <= 'z' ? static_cast<char>(c - 32) : c;
      break;
    case 6:
      x.text.ToLower();
      for (char& c : x.model) c = c >= 'A' && c <= 'Z' ? static_cast<char>(c + 32) : c;
      break;
    default:
      ZORString moved(std::move(x.text));
      EXPECT_EQ(x.text.GetLengthInChar(), 0);
      x.text = std::move(moved);
  }
}

}  // namespace

TEST(String, BehavesAsAStandardString) {
  RandomTexts random;
  Pair texts[4];
  for (int round = 0; round < 20000; ++round) {
    Pair& x = texts[random.Below(std::size(texts))];
    Pair& y = texts[random.Below(std::size(texts))];
    const Pair untouched{ZORString(x.text), x.model};
    Change(x, y, random);
    ExpectSame(untouched.text, untouched.model);
    for (const Pair& pair : texts) ExpectSame(pair.text, pair.model);
    ASSERT_EQ(x.text == y.text, x.model == y.model);
    ASSERT_EQ(x.text < y.text, x.model < y.model);
    ASSERT_EQ(x.text <= y.text, x.model <= y.model);
    ASSERT_EQ(x.text == y.model.c_str(), x.model == y.model);
    const Pair pattern{y.text.SubString(0, 2), y.model.substr(0, 2)};
    const std::size_t start = random.Below(x.model.size() + 2);
    ASSERT_EQ(x.text.FindPosition(pattern.text, static_cast<int>(start)),
              static_cast<int>(x.model.find(pattern.model, start)));
  }
}

TEST(String, RunsOfTheGreatestCharacterAreNeverWrittenThrough) {
  const ZORString run('z', 256);
  ZORString changed[] = {run, run, run, run};
  changed[0].ToUpper();
  changed[1].Append("y");
  changed[2].ReplaceSubString(255, 1, "y");
  changed[3] = changed[3].SubString(1, 40);
  for (const std::size_t length : kLengths) ExpectSame(ZORString('z', length), std::string(length, 'z'));
  EXPECT_EQ(ZORString('z', 100).CastToCharPtr(), ZORString('z', 100).CastToCharPtr()) << "shared, not copied";
}

TEST(String, RangesOutsideTheText) {
  const ZORString text("abc");
  constexpr auto kMinusOne = static_cast<std::size_t>(-1);
  EXPECT_TRUE(text.SubString(3, 1) == "");
  EXPECT_TRUE(text.SubString(kMinusOne, 1) == "");
  EXPECT_TRUE(text.SubString(0, kMinusOne) == "");
  EXPECT_TRUE(text.SubString(1, 100) == "bc");

  EXPECT_EQ(text.FindPosition("", 3), 3);
  EXPECT_EQ(text.FindPosition("", 4), -1);
  EXPECT_EQ(text.FindPosition("a", -1), -1);

  EXPECT_EQ(static_cast<char>(text[2]), 'c');
  EXPECT_EQ(static_cast<char>(text[3]), '\0');
  EXPECT_EQ(static_cast<char>(text[-1]), '\0');

  for (const auto& [start, length] : {std::pair(-1, 1), std::pair(4, 1), std::pair(0, -1)}) {
    ZORString same(text);
    same.ReplaceSubString(start, length, "x");
    EXPECT_TRUE(same == text) << start << ' ' << length;
  }
}

TEST(String, ANullTextIsEmpty) {
  EXPECT_TRUE(ZORString(static_cast<const char*>(nullptr)) == "");
  EXPECT_TRUE(ZORString(nullptr, 0) == "");
  EXPECT_TRUE(ZORString() == static_cast<const char*>(nullptr));
}

TEST(String, OrdersByTheFirstCharacterThatDiffers) {
  for (const std::size_t length : kLengths) {
    for (std::size_t at = 0; at < length; ++at) {
      std::string low(length, 'm'), high(low);
      high[at] = '\xe9';
      if (at + 1 < length) low[at + 1] = '\xff';
      EXPECT_LT(ZORString(low.data(), length), ZORString(high.data(), length)) << length << ' ' << at;
    }
  }
  EXPECT_LT(ZORString("a"), ZORString("a\0", 2));
  EXPECT_LT(ZORString("ab"), ZORString("ab "));
}

TEST(String, ConcatenationsAreTestedWithoutBeingBuilt) {
  ZORString kept('z', 40);  // a shared run; then whatever the last concatenation left
  for (const std::size_t first : kLengths) {
    for (const std::size_t second : kLengths) {
      const ZORString head('a', first), tail('z', second);
      std::string model = std::string(first, 'a') + std::string(second, 'z');
      ExpectSame(ZORString::Concatenation(head, tail), model);
      kept.Concatenate(head, tail);
      ExpectSame(kept, model);
      EXPECT_TRUE(ZORString(model.data(), model.size()).IsConcatenation(head, tail));
      EXPECT_FALSE(ZORString(model.data(), model.size()).IsConcatenation(head, ZORString('z', second + 1)));
      for (std::size_t at = 0; at < model.size(); at += 15) {
        std::string other(model);
        other[at] = 'b';
        EXPECT_FALSE(ZORString(other.data(), other.size()).IsConcatenation(head, tail)) << first << ' ' << at;
      }
    }
  }
}
