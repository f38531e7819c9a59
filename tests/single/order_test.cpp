// Order relations of single strings.
#include "tests/support/check.h"

using namespace zor::test;

// Whether left < right and left <= right hold; where they do not, the operand that is narrowed becomes Nil.
static const struct {
  const char* why;
  Str left, right;
  bool less, lessOrEqual;
} kRelations[] = {
    // clang-format off
  {"ascending",               Text("abc"),  Text("abd"),   true,  true},
  {"descending",              Text("abd"),  Text("abc"),   false, false},
  {"equal",                   Text("abc"),  Text("abc"),   false, true},
  {"a prefix comes first",    Text("ab"),   Text("ab "),   true,  true},
  {"codes are unsigned",      Text("z"),    Text("\xff"),  true,  true},

  {"both the least",          kMin,         kMin,          false, true},
  {"both the greatest",       kMax,         kMax,          false, true},
  {"from end to end",         kMin,         kMax,          true,  true},
  {"nothing above max",       kMax,         Text("\xff"),  false, false},
  {"nothing below min",       Text(""),     kMin,          false, false},

  {"nil before undefined",    kAny,         kNil,          false, false},
  {"undefined tells nothing", kMax,         {kAnyTag, ""}, true,  true},
    // clang-format on
};

template <class Forward, class Inverse>
static void CheckRelation(const char* why, const Str& a, const Str& b, bool holds, Forward forward, Inverse inverse) {
  const auto answer = [&](const Str& target) { return holds || target == kNil ? 0 : 1; };
  Check<0, Str, Str>({why, {a, b}, answer(a), holds ? a : kNil}, forward);
  Check<1, Str, Str>({why, {a, b}, answer(b), holds ? b : kNil}, inverse);
}

#define CHECK_RELATION(a, b, holds, Name) \
  CheckRelation(why, a, b, holds, ZOR_OPERATION(Calc##Name), ZOR_OPERATION(CalcInverse##Name))

TEST(SingleOrder, Relations) {
  for (const auto& [why, a, b, less, lessOrEqual] : kRelations) {
    CHECK_RELATION(a, b, less, LessValue);
    CHECK_RELATION(a, b, lessOrEqual, LessOrEqualValue);
    CHECK_RELATION(b, a, lessOrEqual, NotLessValue);
    CHECK_RELATION(b, a, less, NotLessAndUnequalValue);
  }
}
