// Every operation on every combination of values, beside the model.
#include <gtest/gtest.h>

#include <climits>

#include "tests/single/rows.h"

using namespace zor::test;

static const std::vector<Value> kTripled =
    ListOf<Str>({"Nil", Str(kNilTag, "ab"), "Any", Str(kAnyTag, "a"), "Max", "Min", "", "a", "ab", "b", "aba", "z*255",
                 "z*254", "a*200", "a*55", "a*56"});
static const std::vector<Value> kMore =
    ListOf<Str>({"A", "aB", "  ", "a!", "\"a\"", Text("Max"), "\xff!", "A*255", "z*256", "z*254y", "a*254z", "a*256z",
                 Str(kNilTag, "Min"), "@A[\xc4`1", "7"});
static const std::vector<Value> kSliced =
    ListOf<Str>({"Nil", "Any", Str(kAnyTag, "b"), "Max", "Min", "", "a", "bc", "b", "abcbc", "bcb", "z*255", "c*300"});
static const std::vector<Value> kNumbers =
    ListOf<Int>({Int(kNilTag), Int(), INT_MIN, INT_MIN + 1, -2, -1, 0, 1, 2, 3, 254, 255, 299, INT_MAX - 1, INT_MAX});
static const std::vector<Value> kWords = ListOf<Word>({"", "a", "ab", " ", "z*255", "x*300"});

TEST(SingleModel, EveryCombination) {
  std::vector<Value> all = kTripled;
  all.insert(all.end(), kMore.begin(), kMore.end());
  for (const Row& row : SingleRows()) {
    std::vector<std::vector<Value>> lists;
    const auto& strings = row.kinds.size() == 4 ? kSliced : row.kinds.size() == 3 ? kTripled : all;
    for (const std::size_t kind : row.kinds) lists.push_back(kind == 0 ? strings : kind == 2 ? kNumbers : kWords);
    EXPECT_EQ(CompareAll(row, lists), "");
  }
}

TEST(SingleModel, WrongOperands) {
  ZORVadEnumString set("b");
  ZORVadSingleInteger number(7);
  for (const Value& z : {Value(Str("ab")), Value(Str("Any")), Value(Str("Max"))}) {
    for (ZORVaDoAny* wrong : {static_cast<ZORVaDoAny*>(nullptr), static_cast<ZORVaDoAny*>(&set)})
      EXPECT_EQ(CheckWrongOperand(z, Str("b"), wrong, true, 2), "") << z;
    EXPECT_EQ(CheckWrongOperand(z, Str("b"), &number, false, 2), "") << z;
  }
  EXPECT_EQ(Of(set), Set("{b}"));
}
