#include <gtest/gtest.h>

#include <algorithm>
#include <bit>
#include <climits>
#include <functional>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include "host/ZORNumbers.h"
#include "host/ZORSolver.h"

namespace {

using Integer = ZORVaDoInteger;
using Any = ZORVaDoAny;
using Wide = std::int64_t;

// A value made and destroyed through its descriptor, read from its text form.
template <class Class>
class Made {
 public:
  explicit Made(const ZORVaDoObjectDescriptor* descriptor, const std::string& text)
      : mDescriptor(descriptor),
        mMemory(new char[descriptor->GetObjectSize()]),
        mValue(static_cast<Class*>(descriptor->CreateObject(mMemory.get(), text.c_str()))) {}
  Made(const Made& other) : Made(other.mDescriptor, "Any") { mValue->Assign(*other.mValue); }
  Made& operator=(const Made&) = delete;
  ~Made() { mDescriptor->DestroyObject(mValue); }
  Class& operator*() const { return *mValue; }
  Class* operator->() const { return mValue; }

 private:
  const ZORVaDoObjectDescriptor* mDescriptor;
  std::unique_ptr<char[]> mMemory;
  Class* mValue;
};

std::string Print(const Any& value) {
  ZORostrstream out;
  value.PrintOn(out);
  return std::string(out.View());
}

const ZORVaDoObjectDescriptor* const kBoolean = ZORVadSingleBoolean::sDescriptor;
const ZORVaDoObjectDescriptor* const kSingle = ZORVadSingleInteger::sDescriptor;
const ZORVaDoObjectDescriptor* const kInterval = ZORVadIntervalInteger::sDescriptor;
const ZORVaDoObjectDescriptor* const kEnum = ZORVadEnumInteger::sDescriptor;

const std::string kLeast = "-2147483648", kGreatest = "2147483647";

// The numbers that the values of kTexts are made of, and some beside them.
const Wide kSamples[] = {INT_MIN, INT_MIN + 1, -1, 0, 1, 2, 3, 4, INT_MAX - 1, INT_MAX};

const std::pair<const ZORVaDoObjectDescriptor*, std::string> kTexts[] = {
    // clang-format off
    {kSingle, "Nil"}, {kSingle, "Any"}, {kSingle, "0"}, {kSingle, "1"}, {kSingle, "3"}, {kSingle, kLeast},
    {kSingle, kGreatest}, {kInterval, "Nil"}, {kInterval, "Any"}, {kInterval, "0..1"}, {kInterval, "1..3"},
    {kInterval, "2"}, {kInterval, "0..3"}, {kInterval, "-1..0"}, {kInterval, kLeast + "..-2147483647"},
    {kEnum, "Nil"}, {kEnum, "Any"}, {kEnum, "{ 0, 3 }"}, {kEnum, "{ 1 }"}, {kEnum, "{ 0, 1, 2, 3 }"},
    {kEnum, "{ -1, 1, 3 }"}, {kEnum, "{ 2, " + kGreatest + " }"},
    {kEnum, "{ " + kLeast + ", 0, " + kGreatest + " }"},
    // clang-format on
};

std::vector<Made<Integer>> AllIntegers() {
  std::vector<Made<Integer>> all;
  for (const auto& [descriptor, text] : kTexts) all.emplace_back(descriptor, text);
  return all;
}

std::set<Wide> SamplesOf(const Integer& x) {
  std::set<Wide> samples;
  for (const Wide value : kSamples) {
    if (x.FindAtLeast(value) == value) samples.insert(value);
  }
  return samples;
}

bool Exists(const std::set<Wide>& x, const std::function<bool(Wide)>& test) {
  return std::any_of(x.begin(), x.end(), test);
}

// Compares target after a call with what remains of before. Every number that remains must be kept; when all
// operands are listed, nothing else than the class needs may be kept.
void ExpectKept(const Integer& target, const Integer& before, const std::set<Wide>& remains, bool listed) {
  const std::set<Wide> kept = SamplesOf(target);
  for (const Wide value : remains) EXPECT_TRUE(kept.count(value)) << value << " is lost";
  for (const Wide value : kept) EXPECT_EQ(before.FindAtLeast(value), value) << value << " is new";
  if (!listed || before.IsUndefined() != 0) return;
  EXPECT_EQ(target.IsNil() != 0, remains.empty());
  if (remains.empty()) return;
  EXPECT_EQ(target.FindAtLeast(INT_MIN), *remains.begin());
  EXPECT_EQ(target.FindAtMost(INT_MAX), *remains.rbegin());
  if (target.GetDescriptor() == kEnum) {
    EXPECT_EQ(kept, remains);
  }
}

struct BinaryRow {
  const char* relation;  // between x, the target, and y
  int (*call)(Integer& x, const Integer& y);
  bool (*holds)(Wide x, Wide y);
};

const BinaryRow kBinary[] = {
    // clang-format off
  {"x = y",           [](Integer& x, const Integer& y) { return x.CalcEqualValue(y); },                    [](Wide x, Wide y) { return x == y; }},
  {"y = x",           [](Integer& x, const Integer& y) { return y.CalcInverseEqualValue(x); },             [](Wide x, Wide y) { return x == y; }},
  {"x != y",          [](Integer& x, const Integer& y) { return x.CalcUnequalValue(y); },                  [](Wide x, Wide y) { return x != y; }},
  {"y != x",          [](Integer& x, const Integer& y) { return y.CalcInverseUnequalValue(x); },           [](Wide x, Wide y) { return x != y; }},
  {"x < y",           [](Integer& x, const Integer& y) { return x.CalcLessValue(y); },                     [](Wide x, Wide y) { return x < y; }},
  {"y < x",           [](Integer& x, const Integer& y) { return y.CalcInverseLessValue(x); },              [](Wide x, Wide y) { return x > y; }},
  {"x <= y",          [](Integer& x, const Integer& y) { return x.CalcLessOrEqualValue(y); },              [](Wide x, Wide y) { return x <= y; }},
  {"y <= x",          [](Integer& x, const Integer& y) { return y.CalcInverseLessOrEqualValue(x); },       [](Wide x, Wide y) { return x >= y; }},
  {"x >= y",          [](Integer& x, const Integer& y) { return x.CalcNotLessValue(y); },                  [](Wide x, Wide y) { return x >= y; }},
  {"y >= x",          [](Integer& x, const Integer& y) { return y.CalcInverseNotLessValue(x); },           [](Wide x, Wide y) { return x <= y; }},
  {"x > y",           [](Integer& x, const Integer& y) { return x.CalcNotLessAndUnequalValue(y); },        [](Wide x, Wide y) { return x > y; }},
  {"y > x",           [](Integer& x, const Integer& y) { return y.CalcInverseNotLessAndUnequalValue(x); }, [](Wide x, Wide y) { return x < y; }},
  {"x = y + 1",       [](Integer& x, const Integer& y) { return x.CalcNextValue(y); },                     [](Wide x, Wide y) { return x == y + 1; }},
  {"y = x + 1",       [](Integer& x, const Integer& y) { return y.CalcInverseNextValue(x); },              [](Wide x, Wide y) { return y == x + 1; }},
  {"x meets y",       [](Integer& x, const Integer& y) { const std::string was = Print(x); x.Intersect(y); return int{Print(x) != was}; },
                                                                                                           [](Wide x, Wide y) { return x == y; }},
    // clang-format on
};

struct TernaryRow {
  const char* relation;  // between x, the target, and y and z
  int (*call)(Integer& x, const Integer& y, const Integer& z);
  bool (*holds)(Wide x, Wide y, Wide z);
};

const TernaryRow kTernary[] = {
    // clang-format off
  {"x = min(y, z)", [](Integer& x, const Integer& y, const Integer& z) { return x.CalcMinValue(y, z); },             [](Wide x, Wide y, Wide z) { return x == std::min(y, z); }},
  {"x = max(y, z)", [](Integer& x, const Integer& y, const Integer& z) { return x.CalcMaxValue(y, z); },             [](Wide x, Wide y, Wide z) { return x == std::max(y, z); }},
  {"y = min(x, z)", [](Integer& x, const Integer& y, const Integer& z) { return y.CalcFirstInverseMinValue(x, z); }, [](Wide x, Wide y, Wide z) { return y == std::min(x, z); }},
  {"y = max(x, z)", [](Integer& x, const Integer& y, const Integer& z) { return y.CalcFirstInverseMaxValue(x, z); }, [](Wide x, Wide y, Wide z) { return y == std::max(x, z); }},
    // clang-format on
};

}  // namespace

TEST(Integer, RelationsKeepWhatHasAPartner) {
  const auto all = AllIntegers();
  for (const BinaryRow& row : kBinary) {
    for (const auto& before : all) {
      for (const auto& y : all) {
        SCOPED_TRACE(std::string(row.relation) + " of " + Print(*before) + " and " + Print(*y));
        const Made<Integer> x(before);
        const std::set<Wide> partners = SamplesOf(*y);
        std::set<Wide> remains;
        for (const Wide value : SamplesOf(*before)) {
          if (Exists(partners, [&](Wide other) { return row.holds(value, other); })) remains.insert(value);
        }
        const std::string operand = Print(*y);
        const int answer = row.call(*x, *y);
        EXPECT_EQ(answer, Print(*x) != Print(*before));
        EXPECT_EQ(Print(*y), operand);
        ExpectKept(*x, *before, remains, y->IsUndefined() == 0);
        EXPECT_EQ(row.call(*x, *y), 0) << "the second time";
        const Made<Integer> aliased(before), copy(before);
        row.call(*aliased, *aliased);
        row.call(*copy, *before);
        EXPECT_EQ(Print(*aliased), Print(*copy)) << "with itself";
        if (testing::Test::HasFailure()) return;
      }
    }
  }
}

TEST(Integer, ExtremesKeepWhatHasPartners) {
  const auto all = AllIntegers();
  for (const TernaryRow& row : kTernary) {
    for (const auto& before : all) {
      for (const auto& y : all) {
        for (const auto& z : all) {
          const Made<Integer> x(before);
          const std::set<Wide> second = SamplesOf(*y), third = SamplesOf(*z);
          std::set<Wide> remains;
          for (const Wide a : SamplesOf(*before)) {
            const auto fits = [&](Wide b) { return Exists(third, [&](Wide c) { return row.holds(a, b, c); }); };
            if (Exists(second, fits)) remains.insert(a);
          }
          SCOPED_TRACE(std::string(row.relation) + " of " + Print(*x) + ", " + Print(*y) + " and " + Print(*z));
          const int answer = row.call(*x, *y, *z);
          EXPECT_EQ(answer, Print(*x) != Print(*before));
          ExpectKept(*x, *before, remains, y->IsUndefined() == 0 && z->IsUndefined() == 0);
          EXPECT_EQ(row.call(*x, *y, *z), 0) << "the second time";
          if (testing::Test::HasFailure()) return;
        }
      }
    }
  }
}

TEST(Integer, RelationsIntoABoolean) {
  struct Row {
    const char* relation;
    int (*call)(const Integer& x, const Integer& y, ZORVaDoBoolean& result);
    bool (*holds)(Wide x, Wide y);
  };
  const Row rows[] = {
      // clang-format off
    {"x = y",  [](const Integer& x, const Integer& y, ZORVaDoBoolean& r) { return x.CalcIsEqual(y, r); },       [](Wide x, Wide y) { return x == y; }},
    {"x < y",  [](const Integer& x, const Integer& y, ZORVaDoBoolean& r) { return x.CalcIsLess(y, r); },        [](Wide x, Wide y) { return x < y; }},
    {"x <= y", [](const Integer& x, const Integer& y, ZORVaDoBoolean& r) { return x.CalcIsLessOrEqual(y, r); }, [](Wide x, Wide y) { return x <= y; }},
      // clang-format on
  };
  const auto all = AllIntegers();
  for (const Row& row : rows) {
    for (const auto& x : all) {
      for (const auto& y : all) {
        std::set<bool> outcomes;
        for (const Wide a : SamplesOf(*x)) {
          for (const Wide b : SamplesOf(*y)) outcomes.insert(row.holds(a, b));
        }
        ZORVadSingleBoolean result;
        const int answer = row.call(*x, *y, result);
        const char* expected = outcomes.empty()       ? "Nil"
                               : outcomes.size() == 2 ? "Any"
                               : *outcomes.begin()    ? "true"
                                                      : "false";
        EXPECT_EQ(Print(result), expected) << Print(*x) << ' ' << row.relation << ' ' << Print(*y);
        EXPECT_EQ(answer, outcomes.size() != 2);
        EXPECT_EQ(row.call(*x, *y, result), 0);
      }
    }
  }
}

TEST(Integer, UniteAndIntersect) {
  const auto all = AllIntegers();
  for (const auto& before : all) {
    for (const auto& y : all) {
      SCOPED_TRACE(Print(*before) + " with " + Print(*y));
      std::set<Wide> both = SamplesOf(*before), common;
      for (const Wide value : SamplesOf(*y)) {
        if (!both.insert(value).second) common.insert(value);
      }
      EXPECT_EQ(before->IsIntersected(*y), !common.empty());
      const Made<Integer> x(before), assigned(before);
      x->Unite(*y);
      const std::set<Wide> united = SamplesOf(*x);
      for (const Wide value : both) EXPECT_TRUE(united.count(value)) << value;
      if (x->GetDescriptor() == kEnum && before->IsUndefined() == 0 && y->IsUndefined() == 0) {
        EXPECT_EQ(united, both);
      }

      assigned->Assign(*y);
      for (const Wide value : SamplesOf(*y)) EXPECT_EQ(assigned->FindAtLeast(value), value);
      if (before->GetDescriptor() == y->GetDescriptor()) {
        EXPECT_EQ(Print(*assigned), Print(*y));
      }
    }
  }
}

TEST(Integer, BisectSplitsWithoutLoss) {
  struct Row {
    const ZORVaDoObjectDescriptor* type;
    const char* text;
    int selection;
    const char* kept;
    const char* rest;
  };
  const Row rows[] = {
      // type, value, selection, kept, rest
      {kInterval, "1..4", ZORVaDoAny::ZorSelectLeast, "1", "2..4"},
      {kInterval, "1..4", ZORVaDoAny::ZorSelectGreatest, "4", "1..3"},
      {kInterval, "1..4", ZORVaDoAny::ZorSelectLowerHalf, "1..2", "3..4"},
      {kInterval, "1..4", ZORVaDoAny::ZorSelectUpperHalf, "3..4", "1..2"},
      {kInterval, "Any", ZORVaDoAny::ZorSelectLowerHalf, "-2147483648..-1", "0..2147483647"},
      {kEnum, "{ 1, 2, 9 }", ZORVaDoAny::ZorSelectUpperHalf, "{ 9 }", "{ 1, 2 }"},
      {kBoolean, "Any", ZORVaDoAny::ZorSelectUpperHalf, "true", "false"},

      {kSingle, "7", ZORVaDoAny::ZorSelectUpperHalf, "7", "Nil"},
      {kSingle, "Any", ZORVaDoAny::ZorSelectLowerHalf, "Any", "Any"},
      {kEnum, "Nil", ZORVaDoAny::ZorSelectLeast, "Nil", "Nil"},
      {kBoolean, "true", ZORVaDoAny::ZorSelectLeast, "true", "Nil"},

      {kInterval, "1..4", 4, "1..4", "Any"},
      {kInterval, "1..4", -1, "1..4", "Any"},
  };
  for (const Row& row : rows) {
    const Made<Any> value(row.type, row.text), rest(row.type, "Any");
    value->Bisect(*rest, static_cast<ZORVaDoAny::ValueSelection>(row.selection));
    EXPECT_EQ(Print(*value), row.kept) << row.text << ' ' << row.selection;
    EXPECT_EQ(Print(*rest), row.rest) << row.text << ' ' << row.selection;
  }
}

TEST(Integer, ExactValues) {
  struct Row {
    const ZORVaDoObjectDescriptor* type;
    std::string text;
    std::string afterSetting5;
    ZORLong exact;
    unsigned long count;
  };
  constexpr unsigned long kAll = 1ul << 32;
  const Row rows[] = {
      // clang-format off
      // type, value, after SetExactValue(5), GetExactValue, GetCardinality
      {kSingle, "Any", "5", INT_MIN, kAll}, {kSingle, "Nil", "5", INT_MIN, 0}, {kSingle, "7", "5", 7, 1},
      {kSingle, kLeast, "5", INT_MIN, 1}, {kInterval, "Any", "5", INT_MIN, kAll},
      {kInterval, "Nil", "Nil", INT_MIN, 0}, {kInterval, "2..9", "5", 9, 8}, {kInterval, "-3..-1", "Nil", -1, 3},
      {kInterval, "-2147483647.." + kGreatest, "5", INT_MAX, kAll - 1}, {kEnum, "Any", "{ 5 }", INT_MIN, kAll},
      {kEnum, "{ 4, 5, 6 }", "{ 5 }", 6, 3}, {kEnum, "{ 4, 6 }", "Nil", 6, 2},
      // clang-format on
  };
  for (const Row& row : rows) {
    const Made<Integer> value(row.type, row.text);
    EXPECT_EQ(value->GetExactValue(), row.exact) << row.text;
    EXPECT_EQ(value->GetCardinality(), row.count) << row.text;
    value->SetExactValue(5);
    EXPECT_EQ(Print(*value), row.afterSetting5) << row.text;
  }
  EXPECT_EQ(ZORVadSingleInteger().GetValue(), ZORVadSingleInteger::sNC_INT_ANY);
}

TEST(Integer, LeastAndGreatestNumber) {
  const Made<Integer> any(kInterval, "Any"), same(kInterval, "Any"), other(kInterval, "1..9");
  EXPECT_EQ(any->CalcMinValue(), 1);
  EXPECT_EQ(Print(*any), kLeast);
  EXPECT_EQ(same->CalcMaxValue(), 1);
  EXPECT_EQ(Print(*same), kGreatest);
  EXPECT_EQ(other->CalcMaxValue(), 1);
  EXPECT_EQ(Print(*other), "Nil");
}

TEST(EnumInteger, TellsLengthsToOtherIntegers) {
  struct Row {
    const ZORVaDoObjectDescriptor* type;
    const char* before;
    const char* set;
    int answer;
    const char* after;
  };
  const Row rows[] = {
      // clang-format off
      // target, before, set, answer, after
      {kSingle, "Any", "{ 3 }", 1, "3"}, {kSingle, "Any", "{ 3, 4 }", 0, "Any"},
      {kSingle, "4", "{ 3, 4 }", 0, "4"}, {kSingle, "5", "{ 3, 4 }", 1, "Nil"}, {kSingle, "Any", "Nil", 1, "Nil"},
      {kSingle, "Nil", "{ 3 }", 0, "Nil"}, {kSingle, "5", "Any", 0, "5"},

      {kInterval, "Any", "{ 3, 9 }", 1, "3..9"}, {kInterval, "4..20", "{ 3, 5, 9 }", 1, "5..9"},
      {kInterval, "4..8", "{ 3, 9 }", 1, "Nil"}, {kInterval, "3..9", "{ 3, 9 }", 0, "3..9"},

      {kEnum, "Any", "{ 3, 9 }", 1, "{ 3, 9 }"}, {kEnum, "{ 1, 3, 9 }", "{ 3, 4, 9 }", 1, "{ 3, 9 }"},
      {kEnum, "{ 1 }", "{ 3 }", 1, "Nil"}, {kEnum, "{ 1 }", "{ 1, 3 }", 0, "{ 1 }"},
      // clang-format on
  };
  for (const Row& row : rows) {
    const Made<Integer> target(row.type, row.before);
    const Made<ZORVadEnumInteger> set(kEnum, row.set);
    int answer = -1;
    if (auto* single = ZORVadSingleInteger::DynamicCast(&*target)) answer = set->IntersectInverse(*single);
    if (auto* interval = ZORVadIntervalInteger::DynamicCast(&*target)) answer = set->IntersectInverse(*interval);
    if (auto* other = ZORVadEnumInteger::DynamicCast(&*target)) answer = other->Intersect(*set);
    EXPECT_EQ(answer, row.answer) << row.before << " by " << row.set;
    EXPECT_EQ(Print(*target), row.after) << row.before << " by " << row.set;
  }
}

TEST(EnumInteger, ListsUpToItsLimit) {
  ZORVadEnumInteger set;
  set.SetNilValue();
  for (int round = 0; round < 2; ++round) {
    for (ZORLong value = 0; value < static_cast<ZORLong>(ZORVadEnumInteger::kListLimit); ++value) set.Insert(value);
  }
  EXPECT_EQ(set.GetCardinality(), ZORVadEnumInteger::kListLimit);
  ZORVadEnumInteger listed;
  EXPECT_EQ(listed.CalcEqualValue(ZORVadIntervalInteger(0, ZORVadEnumInteger::kListLimit - 1)), 1);
  EXPECT_EQ(Print(listed), Print(set));
  set.Insert(-1);
  EXPECT_EQ(Print(set), "Any");
  EXPECT_EQ(set.CalcEqualValue(ZORVadIntervalInteger(0, ZORVadEnumInteger::kListLimit)), 0);
  EXPECT_EQ(Print(set), "Any");
}

TEST(NumberText, ReadAndPrinted) {
  struct Row {
    const ZORVaDoObjectDescriptor* type;
    std::string text;
    std::string printed;
  };
  const Row rows[] = {
      // clang-format off
      {kSingle, " \t12", "12"}, {kSingle, "-7", "-7"}, {kSingle, kLeast, kLeast}, {kSingle, kGreatest, kGreatest},
      {kSingle, "Any", "Any"}, {kSingle, "Nil7", "Nil"}, {kSingle, "any", "Nil"}, {kSingle, "", "Nil"},
      {kSingle, "-", "Nil"}, {kSingle, "2147483648", "Nil"}, {kSingle, "-2147483649", "Nil"},
      {kSingle, std::string(400, '9'), "Nil"}, {kSingle, "{ 1 }", "Nil"}, {kSingle, "\xff", "Nil"},

      {kInterval, "2..9", "2..9"}, {kInterval, "4", "4"}, {kInterval, "4..4", "4"}, {kInterval, "9..2", "Nil"},
      {kInterval, "1.", "Nil"}, {kInterval, "1..", "Nil"}, {kInterval, "1.2", "Nil"}, {kInterval, "..2", "Nil"},
      {kInterval, "-5..-3", "-5..-3"}, {kInterval, kLeast + ".." + kGreatest, "Any"},

      {kEnum, "{3,1,3, 2 }", "{ 1, 2, 3 }"}, {kEnum, "{ 1 }", "{ 1 }"}, {kEnum, "{ }", "Nil"},
      {kEnum, "{ 1, }", "Nil"}, {kEnum, "{ 1 2 }", "Nil"}, {kEnum, "{ 1, 2", "Nil"}, {kEnum, ", 1 }", "Nil"},
      {kEnum, "Any", "Any"}, {kEnum, "5", "Nil"},

      {kBoolean, "true", "true"}, {kBoolean, " false", "false"}, {kBoolean, "Any", "Any"},
      {kBoolean, "Nil", "Nil"}, {kBoolean, "truex", "Nil"}, {kBoolean, "1", "Nil"},
      // clang-format on
  };
  for (const Row& row : rows) EXPECT_EQ(Print(*Made<Any>(row.type, row.text)), row.printed) << row.text;
}

TEST(NumberStream, ComesBackAsItWent) {
  std::vector<Made<Any>> all;
  for (const auto& [descriptor, text] : kTexts) all.emplace_back(descriptor, text);
  for (const char* text : {"Nil", "Any", "false", "true"}) all.emplace_back(kBoolean, text);
  for (const auto& value : all) {
    ZORopstream out;
    value->Write(out);
    ZORipstream in(out.Bytes());
    const Made<Any> back(value->GetDescriptor(), "Any");
    back->Read(in);
    EXPECT_EQ(Print(*back), Print(*value));
    EXPECT_FALSE(in.Fail());
    EXPECT_EQ(in.Left(), 0u);
  }
}

TEST(NumberStream, BrokenValuesAreNil) {
  for (const auto* descriptor : {kBoolean, kSingle, kInterval, kEnum}) {
    for (const ZORLong tag : {-1, 4, INT_MIN}) {
      ZORopstream out;
      out << tag << 1 << 1;
      ZORipstream in(out.Bytes());
      const Made<Any> value(descriptor, "Any");
      value->Read(in);
      EXPECT_EQ(Print(*value), "Nil") << tag;
      EXPECT_TRUE(in.Fail()) << tag;
    }
  }
  ZORopstream out;
  out << 0 << INT_MAX << 1;
  ZORipstream in(out.Bytes());
  ZORVadEnumInteger set;
  set.Read(in);
  EXPECT_EQ(Print(set), "Nil");
}

TEST(Boolean, OperationsKeepTruthsWithPartners) {
  struct Row {
    const char* relation;
    int (*call)(Any& x, const Any& y, const Any& z);
    bool (*holds)(bool x, bool y, bool z);
  };
  const Row rows[] = {
      // clang-format off
    {"x = y",    [](Any& x, const Any& y, const Any&)   { return x.CalcEqualValue(y); },                    [](bool x, bool y, bool)   { return x == y; }},
    {"y = x",    [](Any& x, const Any& y, const Any&)   { return y.CalcInverseEqualValue(x); },             [](bool x, bool y, bool)   { return x == y; }},
    {"x != y",   [](Any& x, const Any& y, const Any&)   { return x.CalcUnequalValue(y); },                  [](bool x, bool y, bool)   { return x != y; }},
    {"y != x",   [](Any& x, const Any& y, const Any&)   { return y.CalcInverseUnequalValue(x); },           [](bool x, bool y, bool)   { return x != y; }},
    {"x <= y",   [](Any& x, const Any& y, const Any&)   { return x.CalcLessOrEqualValue(y); },              [](bool x, bool y, bool)   { return x <= y; }},
    {"y <= x",   [](Any& x, const Any& y, const Any&)   { return y.CalcInverseLessOrEqualValue(x); },       [](bool x, bool y, bool)   { return y <= x; }},
    {"x > y",    [](Any& x, const Any& y, const Any&)   { return x.CalcNotLessAndUnequalValue(y); },        [](bool x, bool y, bool)   { return x > y; }},
    {"y > x",    [](Any& x, const Any& y, const Any&)   { return y.CalcInverseNotLessAndUnequalValue(x); }, [](bool x, bool y, bool)   { return y > x; }},
    {"x = y&z",  [](Any& x, const Any& y, const Any& z) { return x.CalcMinValue(y, z); },                   [](bool x, bool y, bool z) { return x == (y && z); }},
    {"x = y|z",  [](Any& x, const Any& y, const Any& z) { return x.CalcMaxValue(y, z); },                   [](bool x, bool y, bool z) { return x == (y || z); }},
    {"y = x&z",  [](Any& x, const Any& y, const Any& z) { return y.CalcFirstInverseMinValue(x, z); },       [](bool x, bool y, bool z) { return y == (x && z); }},
    {"y = x|z",  [](Any& x, const Any& y, const Any& z) { return y.CalcFirstInverseMaxValue(x, z); },       [](bool x, bool y, bool z) { return y == (x || z); }},
      // clang-format on
  };
  const char* const texts[] = {"Nil", "false", "true", "Any"};  // by the set of truths as bits
  for (const Row& row : rows) {
    for (unsigned code = 0; code < 64; ++code) {
      const unsigned sets[] = {code & 3, code >> 2 & 3, code >> 4};
      if (sets[2] == 0) continue;  // a row without z asks for any
      unsigned remains = 0;
      for (unsigned truths = 0; truths < 8; ++truths) {
        const unsigned x = truths & 1, y = truths >> 1 & 1, z = truths >> 2;
        const bool possible = (sets[0] >> x & 1) && (sets[1] >> y & 1) && (sets[2] >> z & 1);
        if (possible && row.holds(x, y, z)) remains |= 1u << x;
      }
      const Made<Any> x(kBoolean, texts[sets[0]]), y(kBoolean, texts[sets[1]]), z(kBoolean, texts[sets[2]]);
      EXPECT_EQ(row.call(*x, *y, *z), remains != sets[0]) << row.relation << ' ' << code;
      EXPECT_EQ(Print(*x), texts[remains]) << row.relation << ' ' << code;
    }
  }
}

TEST(Boolean, StatesAndSets) {
  const char* const texts[] = {"Nil", "false", "true", "Any"};
  for (unsigned code = 0; code < 16; ++code) {
    const unsigned x = code & 3, y = code >> 2;
    const Made<Any> first(kBoolean, texts[x]), second(kBoolean, texts[y]), united(first), met(first);
    EXPECT_EQ(first->IsIntersected(*second), (x & y) != 0);
    EXPECT_EQ(first->GetCardinality(), static_cast<unsigned long>(std::popcount(x)));
    united->Unite(*second);
    EXPECT_EQ(Print(*united), texts[x | y]);
    met->Intersect(*second);
    EXPECT_EQ(Print(*met), texts[x & y]);
    ZORVadSingleBoolean equal, lessOrEqual;
    first->CalcIsEqual(*second, equal);
    first->CalcIsLessOrEqual(*second, lessOrEqual);
    unsigned equals = 0, lessOrEquals = 0;
    for (unsigned a = 0; a < 2; ++a) {
      for (unsigned b = 0; b < 2; ++b) {
        if ((x >> a & 1) == 0 || (y >> b & 1) == 0) continue;
        equals |= 1u << (a == b);
        lessOrEquals |= 1u << (a <= b);
      }
    }
    EXPECT_EQ(Print(equal), texts[equals]) << texts[x] << texts[y];
    EXPECT_EQ(Print(lessOrEqual), texts[lessOrEquals]) << texts[x] << texts[y];
  }
}

TEST(Operands, OfAnotherKindTeachNothing) {
  const Made<Integer> integer(kInterval, "1..4"), same(kInterval, "1..4");
  const Made<Any> boolean(kBoolean, "true");
  ZORVadSingleBoolean result;
  EXPECT_EQ(integer->CalcEqualValue(*boolean), 0);
  EXPECT_EQ(integer->CalcInverseEqualValue(*boolean), 0);
  EXPECT_EQ(integer->CalcMinValue(*same, *boolean), 0);
  EXPECT_EQ(integer->CalcFirstInverseMaxValue(*boolean, *same), 0);
  EXPECT_EQ(integer->CalcIsEqual(*boolean, result), 0);
  EXPECT_EQ(integer->IsIntersected(*boolean), 0);
  EXPECT_EQ(boolean->CalcEqualValue(*integer), 0);
  EXPECT_EQ(boolean->CalcIsLessOrEqual(*integer, result), 0);
  EXPECT_EQ(Print(*integer) + Print(*boolean) + Print(result), "1..4trueAny");

  Any* volatile nothing = nullptr;  // a reference to nothing is an operand of no kind
  EXPECT_EQ(integer->CalcEqualValue(*nothing), 0);
  EXPECT_EQ(integer->CalcInverseEqualValue(*nothing), 0);
  EXPECT_EQ(boolean->CalcMaxValue(*boolean, *nothing), 0);

  for (const auto change : {&Any::Assign, &Any::Intersect, &Any::Unite}) {
    const Made<Any> x(kEnum, "{ 1 }"), y(kBoolean, "true");
    ((*x).*change)(*boolean);
    ((*y).*change)(*integer);
    EXPECT_EQ(Print(*x) + Print(*y), "NilNil");
  }
}
