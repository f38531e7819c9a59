// The values that a sequence of operations works on.
#pragma once

#include <array>
#include <type_traits>

#include "fuzz/support.h"

namespace zor::fuzz {

using Any = ZORVaDoAny;
using Boolean = ZORVaDoBoolean;
using Integer = ZORVaDoInteger;
using Scalar = ZORVaDoScalar;
using Set = ZORVadEnumString;
using Single = ZORVadSingleString;
using String = ZORVaDoString;
using Text = ZORString;
using Vector = ZORISVectorImp_String;

// Values of one class stand together, so that those of a class and of the classes below it are a range.
constexpr std::size_t kStrings = 0, kSets = 3, kIntegers = 6, kBooleans = 11, kValues = 13;

template <class Value>
constexpr std::size_t kFirst = std::is_same_v<Value, Set>       ? kSets
                               : std::is_same_v<Value, Integer> ? kIntegers
                               : std::is_same_v<Value, Boolean> ? kBooleans
                                                                : kStrings;
template <class Value>
constexpr std::size_t kLast = std::is_same_v<Value, Single>      ? kSets
                              : std::is_base_of_v<String, Value> ? kIntegers
                              : std::is_base_of_v<Scalar, Value> ? kBooleans
                                                                 : kValues;

class Network {
 public:
  using Contents = std::array<Content, kValues>;

  Network() = default;
  Network(const Network&) = delete;
  Network& operator=(const Network&) = delete;

  Any& operator[](std::size_t i) { return *mValues[i]; }
  Contents Now() const {
    Contents contents;
    for (std::size_t i = 0; i < kValues; ++i) contents[i] = ContentOf(*mValues[i]);
    return contents;
  }
  std::size_t Find(const Any* value) const {  // kValues when there is none
    return static_cast<std::size_t>(std::find(mValues.begin(), mValues.end(), value) - mValues.begin());
  }

 private:
  Single mSingles[3];
  Set mSets[3];
  ZORVadSingleInteger mNumbers[3];
  ZORVadIntervalInteger mInterval;
  ZORVadEnumInteger mNumberSet;
  ZORVadSingleBoolean mTruths[2];
  std::array<Any*, kValues> mValues = {&mSingles[0], &mSingles[1], &mSingles[2], &mSets[0],    &mSets[1],
                                       &mSets[2],    &mNumbers[0], &mNumbers[1], &mNumbers[2], &mInterval,
                                       &mNumberSet,  &mTruths[0],  &mTruths[1]};
};

// Brings copy, a value of the same class, to what original holds, and to the text that an Undefined or Nil single
// value still has. No: original has a text twice, which no copy takes over.
inline bool Reproduce(const Any& original, Any& copy) {
  const auto* const single = Single::DynamicCast(&original);
  if (single != nullptr) static_cast<Single&>(copy).SetExactValue(single->GetLowerBound());
  copy.Assign(original);
  return ContentOf(copy) == ContentOf(original);
}

}  // namespace zor::fuzz
