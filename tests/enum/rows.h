// The operations of sets of texts beside their model: on sets, on a set and a single string, on texts and lengths.
#pragma once

#include "tests/enum/model.h"

namespace zor::test {

// Behind the tests of states that the entries of sets share. The source of an inverse is the value it is called on.
template <std::size_t kTarget, class Body, class... Operands>
int EntryOf(Body body, auto& first, Operands&... others) {
  if constexpr (kTarget == 0) {
    return model::Entry(first, body, others...);
  } else {
    return model::Entry(std::get<kTarget - 1>(std::tie(others...)), body, first);
  }
}

inline const std::vector<Row>& SetRows() {
  // clang-format off
#define SET_BEHIND(Name, target, ...) \
  ZOR_TYPED(Name, target, __VA_ARGS__) \
  ZOR_ENTRY(Name, target, [](auto&... v) { return EntryOf<target>([&] { return model::Name(v...); }, v...); }, __VA_ARGS__)
#define SET_PLAIN(Name, target, ...) ZOR_TYPED(Name, target, __VA_ARGS__) ZOR_ENTRY(Name, target, ZOR_MODEL(Name), __VA_ARGS__)
#define SET_WORDLESS(Name, ...) \
  ZOR_TYPED(Name, 0, __VA_ARGS__) ZOR_ENTRY(Name, 0, [](auto&... v) { model::Name(v...); }, __VA_ARGS__)
#define SET_NONE(Name, ...) ZOR_ENTRY(Name, 0, [](auto&...) { return 0; }, __VA_ARGS__)
#define SET_WORD(Name) \
  MakeRow<true, Set, Word>(#Name, 0, ZOR_CALL(Name), [](auto& z, auto& w) { return model::Name(z, w.text); }),

#define SET_Algebra(Name, ...)  SET_WORDLESS(Name, Set, Set)
#define SET_Test(Name, ...)     SET_PLAIN(Name, kNoTarget, Set, Set)
#define SET_Equality(Name, ...) SET_PLAIN(Name, (TargetOf<__VA_ARGS__>()), Set, Set)
#define SET_Pair(Name, ...)     SET_BEHIND(Name, (TargetOf<__VA_ARGS__>()), Set, Set)
#define SET_Triple(Name, ...)   SET_BEHIND(Name, (TargetOf<__VA_ARGS__>()), Set, Set, Set)
#define SET_Truth(Name, ...)    ZOR_RELATION(Name, Set, Set)
#define SET_Length(Name, ...)   SET_PLAIN(Name, (TargetOf<__VA_ARGS__>()), Set, Int)
#define SET_Alone(...)
#define SET_Form(Name, ...)     SET_NONE(Name, Set, Set) SET_NONE(Name, Set, Str)
#define SET_Slice(Name, ...)    SET_NONE(Name, Set, Set, Int, Int)
#define SET_ROW(Shape, ...) SET_##Shape(__VA_ARGS__)
  static const std::vector<Row> kRows = {
    ZOR_STRING_OPERATIONS(SET_ROW)
    ZOR_TYPED(Copy, 0, Set, Set) ZOR_TYPED(Append, 0, Set, Set)

    SET_WORDLESS(Assign, Set, Str) SET_WORDLESS(Intersect, Set, Str) SET_WORDLESS(Unite, Set, Str)
    SET_PLAIN(IsIntersected, kNoTarget, Set, Str) SET_PLAIN(CalcEqualValue, 0, Set, Str) SET_PLAIN(CalcInverseEqualValue, 1, Set, Str)
    SET_PLAIN(CalcUnequalValue, 0, Set, Str) SET_PLAIN(CalcInverseUnequalValue, 1, Set, Str)
    MakeRow<false, Set, Str>("CalcIsEqual", kNoTarget, ZOR_TELL(CalcIsEqual), ZOR_MODEL(CalcIsEqual)),
    MakeRow<false, Set, Str>("CalcIsLessOrEqual", kNoTarget, ZOR_TELL(CalcIsLessOrEqual), ZOR_MODEL(CalcIsLessOrEqual)),
    MakeRow<false, Set, Str>("CalcIsLess", kNoTarget, ZOR_TELL(CalcIsLess), ZOR_MODEL(CalcIsLess)),
    SET_NONE(CalcLessValue, Set, Str) SET_NONE(CalcInverseLessValue, Set, Str) SET_NONE(CalcNotLessValue, Set, Str)
    SET_NONE(CalcNotLessAndUnequalValue, Set, Str) SET_NONE(CalcNextValue, Set, Str) SET_NONE(CalcInverseNextValue, Set, Str)
    SET_BEHIND(CalcLessOrEqualValue, 0, Set, Str) SET_BEHIND(CalcInverseLessOrEqualValue, 1, Set, Str)
    SET_BEHIND(CalcInverseNotLessValue, 1, Set, Str) SET_BEHIND(CalcInverseNotLessAndUnequalValue, 1, Set, Str)
    SET_BEHIND(CalcLowerValue, 0, Set, Str) SET_BEHIND(CalcInverseLowerValue, 1, Set, Str)
    SET_BEHIND(CalcUpperValue, 0, Set, Str) SET_BEHIND(CalcInverseUpperValue, 1, Set, Str)
    ZOR_TYPED(Copy, 0, Set, Str) ZOR_TYPED(IntersectInverse, 1, Set, Str)

    SET_WORD(SetExactValue) SET_WORD(InsertExactValue) SET_WORD(RemoveExactValue) SET_WORD(SetLowerBound) SET_WORD(SetUpperBound)
    SET_WORD(CutLower) SET_WORD(CutUpper) SET_WORD(Insert)
  };
  // clang-format on
  return kRows;
}

}  // namespace zor::test
