// Sets of integers that are computed, not stored: what a relation allows, given its operands. They refer to their
// operands, which must outlive them.
#pragma once

#include <algorithm>
#include <cstdint>
#include <limits>

#include "host/ZORNumbers.h"

// FindAtLeast and FindAtMost as in ZORVaDoInteger. Numbers have 32 bits and results 64, so that a step beyond the ends
// cannot overflow.
class ZORIntegerSet {
 public:
  static constexpr std::int64_t kLeast = std::numeric_limits<ZORLong>::min();
  static constexpr std::int64_t kGreatest = std::numeric_limits<ZORLong>::max();
  static constexpr std::int64_t kAbove = std::int64_t{1} << 40;
  static constexpr std::int64_t kBelow = -kAbove;

  virtual std::int64_t FindAtLeast(std::int64_t value) const = 0;
  virtual std::int64_t FindAtMost(std::int64_t value) const = 0;
  bool Holds(std::int64_t value) const { return FindAtLeast(value) == value; }

 protected:
  ~ZORIntegerSet() = default;
};

namespace zorhost {

// The numbers from lower to upper.
class Range final : public ZORIntegerSet {
 public:
  constexpr Range(std::int64_t lower, std::int64_t upper) : mLower(lower), mUpper(upper) {}
  std::int64_t FindAtLeast(std::int64_t value) const override {
    return std::max(value, mLower) <= mUpper ? std::max(value, mLower) : kAbove;
  }
  std::int64_t FindAtMost(std::int64_t value) const override {
    return std::min(value, mUpper) >= mLower ? std::min(value, mUpper) : kBelow;
  }

 private:
  std::int64_t mLower, mUpper;
};

// All numbers but one.
class AllBut final : public ZORIntegerSet {
 public:
  explicit AllBut(std::int64_t value) : mValue(value) {}
  std::int64_t FindAtLeast(std::int64_t value) const override { return value == mValue ? value + 1 : value; }
  std::int64_t FindAtMost(std::int64_t value) const override { return value == mValue ? value - 1 : value; }

 private:
  std::int64_t mValue;
};

// The numbers of a domain, shifted by a distance.
class Numbers final : public ZORIntegerSet {
 public:
  explicit Numbers(const ZORVaDoInteger& integer, std::int64_t distance = 0) : mInteger(integer), mDistance(distance) {}
  std::int64_t FindAtLeast(std::int64_t value) const override {
    return mInteger.FindAtLeast(value - mDistance) + mDistance;
  }
  std::int64_t FindAtMost(std::int64_t value) const override {
    return mInteger.FindAtMost(value - mDistance) + mDistance;
  }

 private:
  const ZORVaDoInteger& mInteger;
  std::int64_t mDistance;
};

// The numbers of a domain that are in a range.
class Part final : public ZORIntegerSet {
 public:
  Part(const ZORVaDoInteger& integer, std::int64_t lower, std::int64_t upper)
      : mInteger(integer), mLower(lower), mUpper(upper) {}
  std::int64_t FindAtLeast(std::int64_t value) const override {
    const std::int64_t found = mInteger.FindAtLeast(std::max(value, mLower));
    return found <= mUpper ? found : kAbove;
  }
  std::int64_t FindAtMost(std::int64_t value) const override {
    const std::int64_t found = mInteger.FindAtMost(std::min(value, mUpper));
    return found >= mLower ? found : kBelow;
  }

 private:
  const ZORVaDoInteger& mInteger;
  std::int64_t mLower, mUpper;
};

// The numbers of either set.
class Union final : public ZORIntegerSet {
 public:
  Union(const ZORIntegerSet& first, const ZORIntegerSet& second) : mFirst(first), mSecond(second) {}
  std::int64_t FindAtLeast(std::int64_t value) const override {
    return std::min(mFirst.FindAtLeast(value), mSecond.FindAtLeast(value));
  }
  std::int64_t FindAtMost(std::int64_t value) const override {
    return std::max(mFirst.FindAtMost(value), mSecond.FindAtMost(value));
  }

 private:
  const ZORIntegerSet& mFirst;
  const ZORIntegerSet& mSecond;
};

inline constexpr Range kEveryNumber(ZORIntegerSet::kLeast, ZORIntegerSet::kGreatest);
inline constexpr auto kAllNumbers = static_cast<unsigned long>(
    std::min<std::uint64_t>(std::uint64_t{1} << 32, std::numeric_limits<unsigned long>::max()));

inline std::int64_t Lower(const ZORVaDoInteger& x) { return x.FindAtLeast(ZORIntegerSet::kLeast); }
inline std::int64_t Upper(const ZORVaDoInteger& x) { return x.FindAtMost(ZORIntegerSet::kGreatest); }

}  // namespace zorhost
