// Every operation of a string value on other values, in the order of the virtual table, as a macro and as a table.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <iterator>
#include <string_view>
#include <type_traits>
#include <utility>

#include "module/ZORVaDoString.h"

// Expands X(Shape, Name, operands...) for each operation. The first operand is the object of the call; the non-const
// one is the target. Shapes:
//   Algebra  returns nothing      Equality  of any two values     Pair, Triple  of strings
//   Test     narrows nothing      Truth     reified               Length, Form  of a string and another value
//   Alone    no operands                                          Slice         of strings and positions
// clang-format off
#define ZOR_STRING_OPERATIONS(X)                                                                                   \
  X(Algebra,  Assign,                            ZORVaDoAny&, const ZORVaDoAny&)                                   \
  X(Test,     IsIntersected,                     const ZORVaDoAny&, const ZORVaDoAny&)                             \
  X(Algebra,  Intersect,                         ZORVaDoAny&, const ZORVaDoAny&)                                   \
  X(Algebra,  Unite,                             ZORVaDoAny&, const ZORVaDoAny&)                                   \
  X(Triple,   CalcMinValue,                      ZORVaDoAny&, const ZORVaDoAny&, const ZORVaDoAny&)                \
  X(Alone,    CalcMinValue,                      ZORVaDoAny&)                                                      \
  X(Triple,   CalcMaxValue,                      ZORVaDoAny&, const ZORVaDoAny&, const ZORVaDoAny&)                \
  X(Alone,    CalcMaxValue,                      ZORVaDoAny&)                                                      \
  X(Equality, CalcEqualValue,                    ZORVaDoAny&, const ZORVaDoAny&)                                   \
  X(Equality, CalcInverseEqualValue,             const ZORVaDoAny&, ZORVaDoAny&)                                   \
  X(Equality, CalcUnequalValue,                  ZORVaDoAny&, const ZORVaDoAny&)                                   \
  X(Equality, CalcInverseUnequalValue,           const ZORVaDoAny&, ZORVaDoAny&)                                   \
  X(Truth,    CalcIsEqual,                       const ZORVaDoAny&, const ZORVaDoAny&, ZORVaDoBoolean&)            \
  X(Pair,     CalcLessOrEqualValue,              ZORVaDoAny&, const ZORVaDoAny&)                                   \
  X(Pair,     CalcInverseLessOrEqualValue,       const ZORVaDoAny&, ZORVaDoAny&)                                   \
  X(Pair,     CalcNotLessAndUnequalValue,        ZORVaDoAny&, const ZORVaDoAny&)                                   \
  X(Pair,     CalcInverseNotLessAndUnequalValue, const ZORVaDoAny&, ZORVaDoAny&)                                   \
  X(Truth,    CalcIsLessOrEqual,                 const ZORVaDoAny&, const ZORVaDoAny&, ZORVaDoBoolean&)            \
  X(Triple,   CalcFirstInverseMinValue,          const ZORVaDoAny&, ZORVaDoAny&, const ZORVaDoAny&)                \
  X(Triple,   CalcFirstInverseMaxValue,          const ZORVaDoAny&, ZORVaDoAny&, const ZORVaDoAny&)                \
  X(Pair,     CalcLessValue,                     ZORVaDoScalar&, const ZORVaDoScalar&)                             \
  X(Pair,     CalcInverseLessValue,              const ZORVaDoScalar&, ZORVaDoScalar&)                             \
  X(Pair,     CalcNotLessValue,                  ZORVaDoScalar&, const ZORVaDoScalar&)                             \
  X(Pair,     CalcInverseNotLessValue,           const ZORVaDoScalar&, ZORVaDoScalar&)                             \
  X(Truth,    CalcIsLess,                        const ZORVaDoScalar&, const ZORVaDoScalar&, ZORVaDoBoolean&)      \
  X(Pair,     CalcNextValue,                     ZORVaDoScalar&, const ZORVaDoScalar&)                             \
  X(Pair,     CalcInverseNextValue,              const ZORVaDoScalar&, ZORVaDoScalar&)                             \
  X(Alone,    CalcEmptyValue,                    ZORVaDoString&)                                                   \
  X(Alone,    CalcFullValue,                     ZORVaDoString&)                                                   \
  X(Length,   CalcLength,                        const ZORVaDoString&, ZORVaDoInteger&)                            \
  X(Length,   CalcInverseLength,                 ZORVaDoString&, const ZORVaDoInteger&)                            \
  X(Form,     CalcStringRepresentation,          ZORVaDoString&, const ZORVaDoAny&)                                \
  X(Form,     CalcInverseStringRepresentation,   const ZORVaDoString&, ZORVaDoAny&)                                \
  X(Pair,     CalcLowerValue,                    ZORVaDoString&, const ZORVaDoString&)                             \
  X(Pair,     CalcInverseLowerValue,             const ZORVaDoString&, ZORVaDoString&)                             \
  X(Pair,     CalcUpperValue,                    ZORVaDoString&, const ZORVaDoString&)                             \
  X(Pair,     CalcInverseUpperValue,             const ZORVaDoString&, ZORVaDoString&)                             \
  X(Triple,   CalcConcatenation,                 ZORVaDoString&, const ZORVaDoString&, const ZORVaDoString&)       \
  X(Triple,   CalcFirstInverseConcatenation,     const ZORVaDoString&, ZORVaDoString&, const ZORVaDoString&)       \
  X(Triple,   CalcSecondInverseConcatenation,    const ZORVaDoString&, const ZORVaDoString&, ZORVaDoString&)       \
  X(Slice,    CalcSubString,                     ZORVaDoString&, const ZORVaDoString&, const ZORVaDoInteger&, const ZORVaDoInteger&) \
  X(Slice,    CalcFirstInverseSubString,         const ZORVaDoString&, ZORVaDoString&, const ZORVaDoInteger&, const ZORVaDoInteger&) \
  X(Slice,    CalcSecondInverseSubString,        const ZORVaDoString&, const ZORVaDoString&, ZORVaDoInteger&, const ZORVaDoInteger&) \
  X(Slice,    CalcThirdInverseSubString,         const ZORVaDoString&, const ZORVaDoString&, const ZORVaDoInteger&, ZORVaDoInteger&)
// clang-format on

namespace zor {

// The index of the operand that is narrowed, or kNoTarget.
constexpr std::size_t kNoTarget = 4;

template <class... Operands>
constexpr std::size_t TargetOf() {
  const bool narrowed[] = {!std::is_const_v<std::remove_reference_t<Operands>>...};
  const auto* const found = std::find(std::begin(narrowed), std::end(narrowed), true);
  return found != std::end(narrowed) ? static_cast<std::size_t>(found - narrowed) : kNoTarget;
}

struct Operation {
  enum class Shape { Algebra, Test, Alone, Equality, Truth, Pair, Triple, Length, Form, Slice };

  enum class Kind { Any, Scalar, String, Integer, Boolean };

  Shape shape;
  std::string_view name;
  std::size_t operands;                      // how many, with the object of the call
  std::size_t target;                        // index, or kNoTarget
  std::array<Kind, 4> kinds;                 // the class of each operand
  int (*call)(ZORVaDoAny* const* operands);  // operands of these classes; 0 for Algebra
};

template <class Operand>
constexpr Operation::Kind KindOf() {
  using Class = std::remove_cvref_t<Operand>;
  return std::is_same_v<Class, ZORVaDoAny>       ? Operation::Kind::Any
         : std::is_same_v<Class, ZORVaDoScalar>  ? Operation::Kind::Scalar
         : std::is_same_v<Class, ZORVaDoInteger> ? Operation::Kind::Integer
         : std::is_same_v<Class, ZORVaDoBoolean> ? Operation::Kind::Boolean
                                                 : Operation::Kind::String;
}

template <class... Operands, class Call, std::size_t... kAt>
constexpr int CallWith(ZORVaDoAny* const* operands, Call call, std::index_sequence<kAt...>) {
  if constexpr (std::is_void_v<std::invoke_result_t<Call, Operands...>>) {
    call(static_cast<Operands>(*operands[kAt])...);
    return 0;
  } else {
    return call(static_cast<Operands>(*operands[kAt])...);
  }
}

template <class... Operands, class Call>
constexpr Operation MakeOperation(Operation::Shape shape, std::string_view name, Call) {
  return {shape,
          name,
          sizeof...(Operands),
          TargetOf<Operands...>(),
          {KindOf<Operands>()...},
          [](ZORVaDoAny* const* operands) {
            return CallWith<Operands...>(operands, Call(), std::index_sequence_for<Operands...>());
          }};
}

#define ZOR_OPERATION_ROW(shape, Name, ...) \
  MakeOperation<__VA_ARGS__>(Operation::Shape::shape, #Name, [](auto& z, auto&... x) { return z.Name(x...); }),
inline constexpr Operation kOperations[] = {ZOR_STRING_OPERATIONS(ZOR_OPERATION_ROW)};
#undef ZOR_OPERATION_ROW

}  // namespace zor
