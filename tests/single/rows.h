// The operations of single strings beside their model.
#pragma once

#include "tests/single/model.h"

namespace zor::test {

inline const std::vector<Row>& SingleRows() {
  // clang-format off
#define SINGLE_FORMS(Name, target, ...) \
  ZOR_TYPED(Name, target, __VA_ARGS__) ZOR_ENTRY(Name, target, ZOR_MODEL(Name), __VA_ARGS__)
#define SINGLE_WORDLESS(Name) \
  ZOR_TYPED(Name, 0, Str, Str) ZOR_ENTRY(Name, 0, [](auto&... v) { model::Name(v...); }, Str, Str)
#define SINGLE_Algebra(Name, ...)  SINGLE_WORDLESS(Name)
#define SINGLE_Test(Name, ...)     SINGLE_FORMS(Name, kNoTarget, Str, Str)
#define SINGLE_Pair(Name, ...)     SINGLE_FORMS(Name, (TargetOf<__VA_ARGS__>()), Str, Str)
#define SINGLE_Equality SINGLE_Pair
#define SINGLE_Form                SINGLE_Pair
#define SINGLE_Triple(Name, ...)   SINGLE_FORMS(Name, (TargetOf<__VA_ARGS__>()), Str, Str, Str)
#define SINGLE_Slice(Name, ...)    SINGLE_FORMS(Name, (TargetOf<__VA_ARGS__>()), Str, Str, Int, Int)
#define SINGLE_Length(Name, ...)   SINGLE_FORMS(Name, (TargetOf<__VA_ARGS__>()), Str, Int)
#define SINGLE_Truth(Name, ...)    ZOR_RELATION(Name, Str, Str)
#define SINGLE_Alone(...)
#define SINGLE_ROW(Shape, ...) SINGLE_##Shape(__VA_ARGS__)
#define SINGLE_WORD(Name) ZOR_TYPED(Name, 0, Str, Word)
  static const std::vector<Row> kRows = {
    ZOR_STRING_OPERATIONS(SINGLE_ROW)
    SINGLE_WORD(SetExactValue) SINGLE_WORD(SetLowerBound) SINGLE_WORD(SetUpperBound) SINGLE_WORD(InsertExactValue) SINGLE_WORD(RemoveExactValue)
  };
  // clang-format on
  return kRows;
}

}  // namespace zor::test
