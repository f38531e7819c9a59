// What a propagation calls, by name, for statistics and traces.
#pragma once

#include <array>
#include <cstddef>
#include <string_view>

namespace zornet {

enum class Operation {
  Equal,
  InverseEqual,
  Unequal,
  LessOrEqual,
  NotLess,
  IsEqual,
  IsLess,
  IsLessOrEqual,
  Concatenation,
  Slice,
  Length,
  Lower,
  Upper,
  Minimum,
  Maximum,
  Successor,
  TextForm,
  Sum,
  Product,
  Bounds,
  Matching,
  Supports,
  Shape,
  Choice,
};
inline constexpr std::size_t kOperations = static_cast<std::size_t>(Operation::Choice) + 1;

// The module's operation; in lower case what the propagation does by itself.
constexpr std::string_view NameOf(Operation operation) {
  constexpr std::array<std::string_view, kOperations> kNames = {"CalcEqualValue",
                                                                "CalcInverseEqualValue",
                                                                "CalcUnequalValue",
                                                                "CalcLessOrEqualValue",
                                                                "CalcNotLessValue",
                                                                "CalcIsEqual",
                                                                "CalcIsLess",
                                                                "CalcIsLessOrEqual",
                                                                "CalcConcatenation",
                                                                "CalcSubString",
                                                                "CalcLength",
                                                                "CalcLowerValue",
                                                                "CalcUpperValue",
                                                                "CalcMinValue",
                                                                "CalcMaxValue",
                                                                "CalcNextValue",
                                                                "CalcStringRepresentation",
                                                                "sum",
                                                                "product",
                                                                "bounds",
                                                                "matching",
                                                                "supports",
                                                                "shape",
                                                                "choice"};
  return kNames[static_cast<std::size_t>(operation)];
}

}  // namespace zornet
