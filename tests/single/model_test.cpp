// Every operation on every combination of values, beside the model.
#include <gtest/gtest.h>

#include <climits>

#include "tests/single/rows.h"

using namespace zor::test;

// The last ones are for operations on two strings alone.
static const std::vector<Value> kValues = {Str(kNil),
                                           Str(kNilTag, "ab"),
                                           Str(kAny),
                                           Str(kAnyTag, "a"),
                                           Str("Max"),
                                           Str("Min"),
                                           Str(""),
                                           Str("a"),
                                           Str("ab"),
                                           Str("b"),
                                           Str("aba"),
                                           Str("z*255"),
                                           Str("z*254"),
                                           Str("a*200"),
                                           Str("a*55"),
                                           Str("a*56"),  // in triples
                                           Str("A"),
                                           Str("aB"),
                                           Str("  "),
                                           Str("a!"),
                                           Str("\"a\""),
                                           Text("Max"),
                                           Str("\xff!"),
                                           Str("A*255"),
                                           Str("z*256"),
                                           Str("z*254y"),
                                           Str("a*254z"),
                                           Str("a*256z"),
                                           Str(kNilTag, "Min"),
                                           Str("@A[\xc4`1"),
                                           Str("7")};
static const std::vector<Value> kTripled(kValues.begin(), kValues.begin() + 16);
static const std::vector<Value> kSliced = {Str("Nil"), Str("Any"),   Str(kAnyTag, "b"), Str("Max"), Str("Min"),
                                           Str(""),    Str("a"),     Str("bc"),         Str("b"),   Str("abcbc"),
                                           Str("bcb"), Str("z*255"), Str("c*300")};
static const std::vector<Value> kNumbers = {Int(kNilTag), Int(),    Int(INT_MIN), Int(INT_MIN + 1), Int(-2),
                                            Int(-1),      Int(0),   Int(1),       Int(2),           Int(3),
                                            Int(254),     Int(255), Int(299),     Int(INT_MAX - 1), Int(INT_MAX)};
static const std::vector<Value> kWords = {
    Word{""}, Word{"a"}, Word{"ab"}, Word{" "}, Word{std::string(255, 'z')}, Word{std::string(300, 'x')}};

TEST(SingleModel, EveryCombination) {
  for (const Row& row : SingleRows()) {
    std::vector<std::vector<Value>> lists;
    const auto& strings = row.kinds.size() == 4 ? kSliced : row.kinds.size() == 3 ? kTripled : kValues;
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
