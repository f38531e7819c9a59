#include <iterator>
#include <random>
#include <set>
#include <utility>

#include "tests/vector/strings.h"

namespace {

constexpr unsigned int kNowhere = 22;  // limit + 1 of a vector with 21 places

struct Row {
  const char* strings;
  const char* sought;
  unsigned int find, first, lower, firstLower, upper, firstUpper;
};

const Row kSearches[] = {
    // clang-format off
    // strings, sought      find      first     lower     cluster   upper     cluster
    {"",         "a",       kNowhere, kNowhere, kNowhere, kNowhere, kNowhere, kNowhere},
    {"ace",      "cc",      kNowhere, kNowhere, 1,        1,        2,        2},
    {"aaac",     "b",       kNowhere, kNowhere, 2,        0,        3,        3},

    // Which of equal strings is met is what halving meets first, not the first or the last of them.
    {"aaaaaa",   "a",       2,        0,        2,        0,        2,        0},
    {"abbbbbbb", "b",       3,        1,        3,        1,        3,        1},
    {"aaabb",    "b",       3,        3,        3,        3,        3,        3},
    {"aabbb",    "a",       0,        0,        0,        0,        0,        0},
    {"aaabbbb",  "a",       1,        0,        1,        0,        1,        0},
    {"abccccc",  "b",       1,        1,        1,        1,        1,        1},
    // clang-format on
};

TEST(VectorSearch, Searches) {
  for (const Row& row : kSearches) {
    SCOPED_TRACE(testing::Message() << row.sought << " in " << row.strings);
    const Strings v{std::string(row.strings)};
    const ZORString sought(row.sought);
    EXPECT_EQ(row.find, v.Find(&sought));
    EXPECT_EQ(row.first, v.ClusteredFind(&sought));
    EXPECT_EQ(row.lower, v.FindLowerBound(&sought, 0));
    EXPECT_EQ(row.firstLower, v.FindLowerBound(&sought, 1));
    EXPECT_EQ(row.upper, v.FindUpperBound(&sought, 0));
    EXPECT_EQ(row.firstUpper, v.FindUpperBound(&sought, 1));
  }
}

using Model = std::multiset<char>;

void ExpectSearches(const Strings& v, const Model& model, char letter) {
  const auto at = [&](Model::const_iterator place) {
    return place == model.end() ? v.Limit() + 1 : static_cast<unsigned int>(std::distance(model.begin(), place));
  };
  const ZORString sought(ZORChar(letter), 1);
  const auto [first, behind] = model.equal_range(letter);
  const auto last = behind == model.begin() ? model.end() : std::prev(behind);
  EXPECT_EQ(at(model.count(letter) != 0 ? first : model.end()), v.ClusteredFind(&sought));
  EXPECT_EQ(at(last == model.end() ? last : model.lower_bound(*last)), v.FindLowerBound(&sought, 1));
  EXPECT_EQ(at(first), v.FindUpperBound(&sought, 1));

  if (first == behind) {
    EXPECT_EQ(v.Limit() + 1, v.Find(&sought));
    EXPECT_EQ(at(last), v.FindLowerBound(&sought, 0));
    EXPECT_EQ(at(first), v.FindUpperBound(&sought, 0));
  } else {
    EXPECT_EQ(letter, *v[v.Find(&sought)]->CastToCharPtr());
    EXPECT_EQ(v.Find(&sought), v.FindLowerBound(&sought, 0));
    EXPECT_EQ(v.Find(&sought), v.FindUpperBound(&sought, 0));
  }
}

// One random change of both.
void Change(Strings& v, Model& model, char letter, unsigned int what) {
  if (what == 0) {
    v.Flush(1);
    model.clear();
  } else if (what < 80) {
    EXPECT_EQ(model.count(letter) != 0, Detach(v, letter));
    if (const auto found = model.find(letter); found != model.end()) model.erase(found);
  } else if (what < 120) {
    EXPECT_EQ(1, AddUnique(v, letter));
    if (model.count(letter) == 0) model.insert(letter);
  } else {
    EXPECT_EQ(1, Add(v, letter));
    model.insert(letter);
  }
}

TEST(VectorSearch, BesideTheStandardContainer) {
  std::mt19937 random(20261);
  Strings stepped(0, 3u), scaled(0, 0.3), doubled(0, 1.0);
  for (Strings* v : {&stepped, &scaled, &doubled}) {
    Model model;
    for (int round = 0; round < 3000 && !testing::Test::HasFailure(); ++round) {
      SCOPED_TRACE(round);
      Change(*v, model, static_cast<char>('b' + 2 * (random() % 12)), random() % 200);
      EXPECT_EQ(std::string(model.begin(), model.end()), Show(*v));
      ExpectNullBehindTop(*v);
      ExpectSearches(*v, model, static_cast<char>('a' + random() % 26));
    }
  }
}

TEST(VectorSearch, NullPlacesOrderBeforeStrings) {
  Strings v("");
  AddAt(v, 'c', 2);
  const ZORString c("c"), d("d");
  EXPECT_EQ(2u, v.Find(&c));
  EXPECT_EQ(2u, v.FindLowerBound(&d, 1));
  EXPECT_EQ(kNowhere, v.FindUpperBound(&d, 1));
  EXPECT_EQ(1, Add(v, 'b'));
  EXPECT_EQ("--bc", Show(v));
}

// What a walk sees, and which letters its test takes.
struct Walk {
  std::string wanted, seen;
};
int IsWanted(const ZORString& s, void* walk) {
  auto& [wanted, seen] = *static_cast<Walk*>(walk);
  seen += s.CastToCharPtr();
  return wanted.find(s.CastToCharPtr()) != std::string::npos;
}

TEST(VectorSearch, Walks) {
  Strings v("abcd");
  AddAt(v, 'e', 5);  // behind a null place
  constexpr unsigned int kBeyond = 100;
  const struct {
    const char* wanted;
    unsigned int first, last;
    const char *seen, *seenByFirst;
    int firstThat, lastThat;  // -1: none
  } rows[] = {
      {"ae", 0, 6, "abcde", "a", 0, 5},      {"e", 0, 6, "abcde", "abcde", 5, 5}, {"ad", 1, 3, "bc", "bc", -1, -1},
      {"bc", 1, 3, "bc", "b", 1, 2},         {"a", 3, 3, "", "", -1, -1},         {"a", 3, 1, "", "", -1, -1},
      {"x", 0, 6, "abcde", "abcde", -1, -1}, {"de", 3, kBeyond, "de", "d", 3, 5},
  };
  for (const auto& row : rows) {
    SCOPED_TRACE(testing::Message() << row.wanted << " from " << row.first << " to " << row.last);
    const auto place = [&](int pos) { return pos < 0 ? nullptr : v[static_cast<unsigned int>(pos)]; };
    Walk each{row.wanted, ""}, first(each), last(each);
    v.ForEach([](ZORString& s, void* walk) { IsWanted(s, walk); }, &each, row.first, row.last);
    EXPECT_EQ(place(row.firstThat), v.FirstThat(IsWanted, &first, row.first, row.last));
    EXPECT_EQ(place(row.lastThat), v.LastThat(IsWanted, &last, row.first, row.last));
    EXPECT_EQ(each.seen + ' ' + first.seen + ' ' + last.seen,
              std::string(row.seen) + ' ' + row.seenByFirst + ' ' + row.seen);
  }
  Walk each{"", ""}, first{"e", ""}, last{"ae", ""};  // without a range: all that count
  v.ForEach([](ZORString& s, void* walk) { IsWanted(s, walk); }, &each);
  EXPECT_EQ("abcde", each.seen);
  EXPECT_EQ(v[5], v.FirstThat(IsWanted, &first));
  EXPECT_EQ(v[5], v.LastThat(IsWanted, &last));
}

using Iterator = ZORISVectorIteratorImp_String;

std::string LettersOf(Iterator& i) {
  std::string letters;
  for (; i; ++i) letters += i.Current()->CastToCharPtr();
  return letters;
}

TEST(VectorIterator, Ranges) {
  Strings v("bcde");
  Iterator all(v), range(v, 1, 3);
  EXPECT_EQ("cd", LettersOf(range));
  EXPECT_EQ(nullptr, range.Current());
  range.Restart();
  EXPECT_EQ(v[1], range.Current());
  range.Restart(2, 4);
  EXPECT_EQ("de", LettersOf(range));
  Iterator copy(range);
  EXPECT_EQ(0, static_cast<int>(copy));
  copy.Restart();
  EXPECT_EQ("de", LettersOf(copy));

  Add(v, 'a');  // the places are read now, the end was fixed before
  EXPECT_EQ("abcd", LettersOf(all));
  copy = all;
  copy.Restart();
  EXPECT_EQ("abcd", LettersOf(copy));
}

TEST(VectorIterator, Steps) {
  const Strings v("abc"), empty("");
  Iterator i(v), none(empty);
  EXPECT_EQ(v[0], i++);
  EXPECT_EQ(v[2], ++i);
  EXPECT_EQ(nullptr, ++i);
  EXPECT_EQ(nullptr, i++);  // moves on at the end too
  EXPECT_EQ(0, static_cast<int>(none));
  EXPECT_EQ(nullptr, none.Current());
}

}  // namespace
