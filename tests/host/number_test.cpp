#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <fstream>
#include <map>
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
using Samples = std::set<Wide>;

const ZORVaDoObjectDescriptor* const kBoolean = ZORVadSingleBoolean::sDescriptor;
const ZORVaDoObjectDescriptor* const kSingle = ZORVadSingleInteger::sDescriptor;
const ZORVaDoObjectDescriptor* const kInterval = ZORVadIntervalInteger::sDescriptor;
const ZORVaDoObjectDescriptor* const kEnum = ZORVadEnumInteger::sDescriptor;

// A value made and destroyed through its descriptor, read from its text form.
class Made {
 public:
  Made(const ZORVaDoObjectDescriptor* descriptor, const std::string& text)
      : mDescriptor(descriptor),
        mMemory(new char[descriptor->GetObjectSize()]),
        mValue(static_cast<Any*>(descriptor->CreateObject(mMemory.get(), text.c_str()))) {}
  Made(const Made& other) : Made(other.mDescriptor, "Any") { mValue->Assign(*other.mValue); }
  Made& operator=(const Made&) = delete;
  ~Made() { mDescriptor->DestroyObject(mValue); }
  Any& operator*() const { return *mValue; }
  Any* operator->() const { return mValue; }

 private:
  const ZORVaDoObjectDescriptor* mDescriptor;
  std::unique_ptr<char[]> mMemory;
  Any* mValue;
};

Integer& Number(Any& value) { return *Integer::DynamicCast(&value); }
const Integer& Number(const Any& value) { return *Integer::DynamicCast(&value); }

std::string Print(const Any& value) {
  ZORostrstream out;
  value.PrintOn(out);
  return std::string(out.View());
}

const std::string kLeast = "-2147483648", kGreatest = "2147483647";

std::vector<Made> Integers() {
  return {
      // clang-format off
      {kSingle, "Nil"}, {kSingle, "Any"}, {kSingle, "0"}, {kSingle, "1"}, {kSingle, "3"}, {kSingle, kLeast},
      {kSingle, kGreatest}, {kInterval, "Nil"}, {kInterval, "Any"}, {kInterval, "0..1"}, {kInterval, "1..3"},
      {kInterval, "2"}, {kInterval, "0..3"}, {kInterval, "-1..0"}, {kInterval, kLeast + "..-2147483647"},
      {kEnum, "Nil"}, {kEnum, "Any"}, {kEnum, "{ 0, 3 }"}, {kEnum, "{ 1 }"}, {kEnum, "{ 0, 1, 2, 3 }"},
      {kEnum, "{ -1, 1, 3 }"}, {kEnum, "{ 2, " + kGreatest + " }"}, {kEnum, "{ " + kLeast + ", 0, " + kGreatest + " }"},
      // clang-format on
  };
}
std::vector<Made> Booleans() { return {{kBoolean, "Nil"}, {kBoolean, "false"}, {kBoolean, "true"}, {kBoolean, "Any"}}; }

// What the values above are made of and some numbers beside it; false is 0.
Samples SamplesOf(const Any& x) {
  Samples samples;
  if (x.GetDescriptor() == kBoolean) {
    if (x.IsNil() == 0 && Print(x) != "true") samples.insert(0);
    if (x.IsNil() == 0 && Print(x) != "false") samples.insert(1);
  } else {
    for (const Wide value : {Wide{INT_MIN}, Wide{INT_MIN + 1}, Wide{-1}, Wide{0}, Wide{1}, Wide{2}, Wide{3}, Wide{4},
                             Wide{INT_MAX - 1}, Wide{INT_MAX}})
      if (Number(x).FindAtLeast(value) == value && Number(x).FindAtMost(value) == value) samples.insert(value);
  }
  return samples;
}

bool Includes(const Samples& all, const Samples& some) {
  return std::includes(all.begin(), all.end(), some.begin(), some.end());
}

// Compares target after a call with what remains of before. All that remains must be kept; when all operands are
// listed, nothing else than the class needs may be kept.
void ExpectKept(const Any& target, const Any& before, const Samples& remains, bool listed) {
  const Samples kept = SamplesOf(target);
  EXPECT_TRUE(Includes(kept, remains)) << "lost";
  EXPECT_TRUE(Includes(SamplesOf(before), kept)) << "new";
  const bool isInteger = target.GetDescriptor() != kBoolean;
  if (isInteger && (!listed || before.IsUndefined() != 0)) return;
  EXPECT_EQ(target.IsNil() != 0, remains.empty());
  if (target.GetDescriptor() == kEnum || !isInteger) {
    EXPECT_EQ(kept, remains);
  } else if (!remains.empty()) {
    EXPECT_EQ(Number(target).FindAtLeast(INT_MIN), *remains.begin());
    EXPECT_EQ(Number(target).FindAtMost(INT_MAX), *remains.rbegin());
  }
}

struct Relation {
  const char* name;
  int (*call)(Any& x, const Any& y, const Any& z);  // narrows x
  bool (*holds)(Wide x, Wide y, Wide z);
};

// clang-format off
#define RELATION(expression, holds) \
  {#expression, [](Any& x, const Any& y, [[maybe_unused]] const Any& z) -> int { return expression; }, \
   [](Wide x, Wide y, [[maybe_unused]] Wide z) { return holds; }}

const Relation kRelations[] = {
  RELATION(x.CalcEqualValue(y), x == y),               RELATION(y.CalcInverseEqualValue(x), x == y),
  RELATION(x.CalcUnequalValue(y), x != y),             RELATION(y.CalcInverseUnequalValue(x), x != y),
  RELATION(x.CalcLessOrEqualValue(y), x <= y),         RELATION(y.CalcInverseLessOrEqualValue(x), y <= x),
  RELATION(x.CalcNotLessAndUnequalValue(y), x > y),    RELATION(y.CalcInverseNotLessAndUnequalValue(x), y > x),
};
const Relation kIntegerRelations[] = {
  RELATION(Number(x).CalcLessValue(Number(y)), x < y),     RELATION(Number(y).CalcInverseLessValue(Number(x)), y < x),
  RELATION(Number(x).CalcNotLessValue(Number(y)), x >= y), RELATION(Number(y).CalcInverseNotLessValue(Number(x)), y >= x),
  RELATION(Number(x).CalcNextValue(Number(y)), x == y + 1), RELATION(Number(y).CalcInverseNextValue(Number(x)), y == x + 1),
};
const Relation kExtremes[] = {
  RELATION(x.CalcMinValue(y, z), x == std::min(y, z)), RELATION(y.CalcFirstInverseMinValue(x, z), y == std::min(x, z)),
  RELATION(x.CalcMaxValue(y, z), x == std::max(y, z)), RELATION(y.CalcFirstInverseMaxValue(x, z), y == std::max(x, z)),
};
// clang-format on

Samples Remaining(const Relation& relation, const Any& x, const Any& y, const Any& z) {
  const Samples second = SamplesOf(y), third = SamplesOf(z);
  Samples remains;
  for (const Wide a : SamplesOf(x))
    for (const Wide b : second)
      for (const Wide c : third)
        if (relation.holds(a, b, c)) remains.insert(a);
  return remains;
}

void ExpectNarrowing(const Relation& relation, const Made& before, const Any& y, const Any& z, bool listed) {
  SCOPED_TRACE(std::string(relation.name) + " of " + Print(*before) + ", " + Print(y) + ", " + Print(z));
  const Made x(before);
  const std::string operands = Print(y) + Print(z);
  const int answer = relation.call(*x, y, z);
  EXPECT_EQ(answer, Print(*x) != Print(*before));
  EXPECT_EQ(Print(y) + Print(z), operands);
  ExpectKept(*x, *before, Remaining(relation, *before, y, z), listed);
  EXPECT_EQ(relation.call(*x, y, z), 0) << "the second time";
}

template <std::size_t kCount>
void ExpectNarrowings(const Relation (&relations)[kCount], const std::vector<Made>& all) {
  for (const Relation& relation : relations) {
    for (const Made& before : all) {
      for (const Made& y : all) {
        ExpectNarrowing(relation, before, *y, *all[2], y->IsUndefined() == 0);
        if (testing::Test::HasFailure()) return;
      }
      const Made aliased(before), copy(before);
      relation.call(*aliased, *aliased, *aliased);
      relation.call(*copy, *before, *before);
      EXPECT_EQ(Print(*aliased), Print(*copy)) << relation.name << " with itself";
    }
  }
}

}  // namespace

TEST(Numbers, RelationsKeepWhatHasAPartner) {
  ExpectNarrowings(kRelations, Integers());
  ExpectNarrowings(kIntegerRelations, Integers());
  ExpectNarrowings(kRelations, Booleans());
}

TEST(Numbers, ExtremesKeepWhatHasPartners) {
  for (const auto& all : {Integers(), Booleans()}) {
    for (const Relation& relation : kExtremes)
      for (const Made& x : all)
        for (const Made& y : all)
          for (const Made& z : all) {
            ExpectNarrowing(relation, x, *y, *z, y->IsUndefined() == 0 && z->IsUndefined() == 0);
            if (testing::Test::HasFailure()) return;
          }
  }
}

TEST(Numbers, RelationsIntoABoolean) {
  struct Row {
    const char* name;
    int (*call)(const Any& x, const Any& y, ZORVaDoBoolean& result);
    bool (*holds)(Wide x, Wide y);
  };
  const Row rows[] = {
      // clang-format off
      {"==", [](const Any& x, const Any& y, ZORVaDoBoolean& b) { return x.CalcIsEqual(y, b); },       [](Wide x, Wide y) { return x == y; }},
      {"<=", [](const Any& x, const Any& y, ZORVaDoBoolean& b) { return x.CalcIsLessOrEqual(y, b); }, [](Wide x, Wide y) { return x <= y; }},
      {"<",  [](const Any& x, const Any& y, ZORVaDoBoolean& b) { return Number(x).CalcIsLess(Number(y), b); }, [](Wide x, Wide y) { return x < y; }},
      // clang-format on
  };
  const auto expect = [](const Row& row, const Any& x, const Any& y) {
    std::set<bool> outcomes;
    for (const Wide a : SamplesOf(x))
      for (const Wide b : SamplesOf(y)) outcomes.insert(row.holds(a, b));
    ZORVadSingleBoolean result;
    EXPECT_EQ(row.call(x, y, result), outcomes.size() != 2);
    EXPECT_EQ(SamplesOf(result), Samples(outcomes.begin(), outcomes.end())) << Print(x) << row.name << Print(y);
    EXPECT_EQ(row.call(x, y, result), 0);
  };
  for (const auto& all : {Integers(), Booleans()})
    for (const Made& x : all)
      for (const Made& y : all)
        for (const Row& row : rows)
          if (x->GetDescriptor() != kBoolean || &row != &rows[2]) expect(row, *x, *y);
}

// The smallest domain of the class with all of these: a single integer has one number or all, an interval no gap.
static void ExpectUnion(const Any& united, const Samples& both) {
  if (united.GetDescriptor() == kSingle && both.size() > 1) {
    EXPECT_NE(united.IsUndefined(), 0);
  } else if (united.GetDescriptor() == kInterval && !both.empty()) {
    EXPECT_EQ(Number(united).FindAtLeast(INT_MIN), *both.begin());
    EXPECT_EQ(Number(united).FindAtMost(INT_MAX), *both.rbegin());
  } else {
    EXPECT_EQ(SamplesOf(united), both);
    EXPECT_EQ(united.IsNil() != 0, both.empty());
  }
}

TEST(Numbers, UniteIntersectAndAssign) {
  for (const auto& all : {Integers(), Booleans()}) {
    for (const Made& before : all) {
      for (const Made& y : all) {
        SCOPED_TRACE(Print(*before) + " with " + Print(*y));
        Samples both = SamplesOf(*before), common;
        for (const Wide value : SamplesOf(*y))
          if (!both.insert(value).second) common.insert(value);
        EXPECT_EQ(before->IsIntersected(*y), !common.empty());
        const Made met(before), united(before), assigned(before);
        met->Intersect(*y);
        ExpectKept(*met, *before, common, y->IsUndefined() == 0);
        united->Unite(*y);
        EXPECT_TRUE(Includes(SamplesOf(*united), both));
        if (before->IsUndefined() == 0 && y->IsUndefined() == 0) ExpectUnion(*united, both);
        assigned->Assign(*y);
        EXPECT_TRUE(Includes(SamplesOf(*assigned), SamplesOf(*y)));
        EXPECT_TRUE(before->GetDescriptor() != y->GetDescriptor() || Print(*assigned) == Print(*y));
      }
    }
  }
}

// What is asked of a value, and the answer: single numbers, or what the value and the other half print then.
static std::string Answer(const Made& value, const std::string& question) {
  const Made rest(value->GetDescriptor(), "Any");
  static const char* const kSelections[] = {"least", "greatest", "lower half", "upper half", "no such half"};
  const auto selection = std::find(std::begin(kSelections), std::end(kSelections), question) - kSelections;
  if (selection < 5) {
    value->Bisect(*rest, static_cast<Any::ValueSelection>(selection));
    return Print(*value) + " | " + Print(*rest);
  }
  if (question == "exact") return std::to_string(Number(*value).GetExactValue());
  if (question == "count") return std::to_string(value->GetCardinality());
  if (question == "set 5") Number(*value).SetExactValue(5);
  if (question == "min") value->CalcMinValue();
  if (question == "max") value->CalcMaxValue();
  return Print(*value);
}

TEST(Numbers, Rows) {
  const std::map<std::string, const ZORVaDoObjectDescriptor*> types = {
      {"single", kSingle}, {"interval", kInterval}, {"enum", kEnum}, {"boolean", kBoolean}};
  std::ifstream rows(HOST_ROWS);
  std::size_t count = 0;
  for (std::string line; std::getline(rows, line);) {
    std::vector<std::string> cells(1);
    for (const char c : line) c == '\t' ? cells.emplace_back() : cells.back() += c, void();
    if (cells.size() != 4) continue;
    EXPECT_EQ(Answer(Made(types.at(cells[0]), cells[1]), cells[2]), cells[3]) << line;
    ++count;
  }
  EXPECT_GT(count, 70u);
  EXPECT_EQ(Print(*Made(kSingle, std::string(400, '9'))), "Nil");
  EXPECT_EQ(ZORVadSingleInteger().GetValue(), ZORVadSingleInteger::sNC_INT_ANY);
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

TEST(NumberStream, ComesBackAsItWent) {
  for (const auto& all : {Integers(), Booleans()}) {
    for (const Made& value : all) {
      ZORopstream out;
      value->Write(out);
      ZORipstream in(out.Bytes());
      const Made back(value->GetDescriptor(), "Any");
      back->Read(in);
      EXPECT_EQ(Print(*back), Print(*value));
      EXPECT_TRUE(!in.Fail() && in.Left() == 0);
    }
  }
}

TEST(NumberStream, BrokenValuesAreNil) {
  for (const auto* descriptor : {kBoolean, kSingle, kInterval, kEnum}) {
    for (const ZORLong tag : {-1, 4, INT_MIN}) {
      ZORopstream out;
      out << tag << 1 << 1;
      ZORipstream in(out.Bytes());
      const Made value(descriptor, "Any");
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

TEST(Operands, OfAnotherKindTeachNothing) {
  const Made integer(kInterval, "1..4"), same(kInterval, "1..4");
  const Made boolean(kBoolean, "true");
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
    const Made x(kEnum, "{ 1 }"), y(kBoolean, "true");
    ((*x).*change)(*boolean);
    ((*y).*change)(*integer);
    EXPECT_EQ(Print(*x) + Print(*y), "NilNil");
  }
}
