// Boolean and integer domains, the types of the built-in module "ZORVadNumbers": "single boolean", "single integer",
// "interval integer" and "enum integer".
//
// Every operation narrows by intersection: it keeps each number or truth value that the relation still allows, as far
// as the class can represent the result. A Nil operand makes the target Nil. An operand of another kind (not an
// integer, not a Boolean) changes nothing, 0, but makes the target of Assign, Intersect and Unite Nil. A reified
// relation leaves its Boolean alone while the relation is open.
//
// Text forms: Nil, Any, true, false, 7, 2..9, { 1, 5 }. Any other input gives Nil.
#pragma once

#include <cstddef>
#include <cstdint>
#include <type_traits>
#include <vector>

#include "host/ZORSolver.h"

class ZORIntegerSet;

#define ZOR_DECLARE_TYPE_TEST(Class) \
 public:                             \
  static const char* const sIdent;   \
  ZOR_DECLARE_CASTS(Class);          \
                                     \
 protected:                          \
  int IsDerivedFrom(const char* ident) const override

// A concrete class. sDescriptor is never null.
#define ZOR_DECLARE_NUMBER_CLASS(Class)                    \
  ZOR_DECLARE_TYPE_TEST(Class);                            \
                                                           \
 public:                                                   \
  static const ZORVaDoObjectDescriptor* const sDescriptor; \
  const char* CastableID() const override;                 \
  const ZORVaDoObjectDescriptor* GetDescriptor() const override

// A Boolean domain; false is less than true.
class ZOR_EXPORT ZORVaDoBoolean : public ZORVaDoAny {
  ZOR_DECLARE_TYPE_TEST(ZORVaDoBoolean);

 public:
  // Keep only false, only true.
  virtual int CalcFalseValue() = 0;
  virtual int CalcTrueValue() = 0;

  // Takes the outcome of a reified relation: unchanged when it can be both, Nil when it can be neither.
  int CalcOutcome(bool canBeFalse, bool canBeTrue);

  bool CanBe(bool truth) const;
};

// The Boolean of the solver: false, true, both or neither.
class ZOR_EXPORT ZORVadSingleBoolean : public ZORVaDoBoolean {
  ZOR_DECLARE_NUMBER_CLASS(ZORVadSingleBoolean);

 public:
  ZORVadSingleBoolean() = default;
  explicit ZORVadSingleBoolean(ZORStreamableInit) {}

  ZOR_DECLARE_VALUE_OPERATIONS();
  int CalcUnequalValue(const ZORVaDoAny& other) override;
  int CalcInverseUnequalValue(ZORVaDoAny& target) const override;
  int CalcIsEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const override;
  int CalcIsLessOrEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const override;
  void SetNilValue() override;
  void SetUndefinedValue() override;
  int IsNil() const override;
  int IsUndefined() const override;
  unsigned long GetCardinality() const override;
  int CalcFalseValue() override;
  int CalcTrueValue() override;

 private:
  static constexpr unsigned kNone = 0, kFalse = 1, kTrue = 2, kEither = kFalse | kTrue;

  int Keep(unsigned truths);

  unsigned mTruths = kEither;
};

// A domain of 32-bit integers; Undefined is all of them. An Undefined operand of an order relation narrows nothing: it
// would only cut the ends off the full range, one number at a time.
class ZOR_EXPORT ZORVaDoInteger : public ZORVaDoScalar {
  ZOR_DECLARE_TYPE_TEST(ZORVaDoInteger);

 public:
  // Assign takes the smallest domain that the class can represent and that has every number of other. CalcMinValue()
  // and CalcMaxValue() keep the least and the greatest 32-bit number.
  ZOR_DECLARE_VALUE_OPERATIONS();
  int CalcUnequalValue(const ZORVaDoAny& other) override;
  int CalcInverseUnequalValue(ZORVaDoAny& target) const override;
  int CalcIsEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const override;
  int CalcIsLessOrEqual(const ZORVaDoAny& other, ZORVaDoBoolean& result) const override;

  // clang-format off
  int CalcLessValue          (const ZORVaDoScalar& other) override;
  int CalcInverseLessValue   (ZORVaDoScalar& target) const override;
  int CalcNotLessValue       (const ZORVaDoScalar& other) override;
  int CalcInverseNotLessValue(ZORVaDoScalar& target) const override;
  int CalcIsLess             (const ZORVaDoScalar& other, ZORVaDoBoolean& result) const override;
  int CalcNextValue          (const ZORVaDoScalar& other) override;
  int CalcInverseNextValue   (ZORVaDoScalar& target) const override;
  // clang-format on

  virtual void SetExactValue(ZORLong value);  // keeps value alone
  virtual ZORLong GetExactValue() const;      // the greatest number; sNC_INT_ANY if Nil or Undefined

  // The nearest number of the domain that is at least, at most value; beyond the 32-bit range when there is none.
  virtual std::int64_t FindAtLeast(std::int64_t value) const = 0;
  virtual std::int64_t FindAtMost(std::int64_t value) const = 0;

 protected:
  // What a class of integers implements. Keep intersects with allowed, which may be a view of *this, and returns
  // whether it changed *this. Join adds the numbers of other; neither side is Nil or Undefined. ...Known print, read
  // and store a value that is neither; when they read, *this is Nil.
  virtual int Keep(const ZORIntegerSet& allowed) = 0;
  virtual void Join(const ZORVaDoInteger& other) = 0;
  virtual void PrintKnown(ZORostrstream& out) const = 0;
  virtual void InputKnown(ZORistrstream& in) = 0;
  virtual void WriteKnown(ZORopstream& out) const = 0;
  virtual void ReadKnown(ZORipstream& in) = 0;

 private:
  int KeepEqual(const ZORVaDoInteger& other);
};

// The overrides of a class of integers.
#define ZOR_DECLARE_INTEGER_CLASS(Class)                       \
  ZOR_DECLARE_NUMBER_CLASS(Class);                             \
                                                               \
 public:                                                       \
  Class();                                                     \
  explicit Class(ZORStreamableInit);                           \
  void SetNilValue() override;                                 \
  void SetUndefinedValue() override;                           \
  int IsNil() const override;                                  \
  int IsUndefined() const override;                            \
  unsigned long GetCardinality() const override;               \
  std::int64_t FindAtLeast(std::int64_t value) const override; \
  std::int64_t FindAtMost(std::int64_t value) const override;  \
                                                               \
 protected:                                                    \
  int Keep(const ZORIntegerSet& allowed) override;             \
  void Join(const ZORVaDoInteger& other) override;             \
  void PrintKnown(ZORostrstream& out) const override;          \
  void InputKnown(ZORistrstream& in) override;                 \
  void WriteKnown(ZORopstream& out) const override;            \
  void ReadKnown(ZORipstream& in) override

// An integer domain with no number, one, or all.
class ZOR_EXPORT ZORVadSingleInteger : public ZORVaDoInteger {
  ZOR_DECLARE_INTEGER_CLASS(ZORVadSingleInteger);

 public:
  static const ZORLong sNC_INT_ANY;  // the least number; GetValue of a Nil or Undefined integer

  explicit ZORVadSingleInteger(ZORLong value);
  // Not from a number of another type, which may not fit, or from an enumeration.
  template <class Other>
  requires std::is_arithmetic_v<Other> || std::is_enum_v<Other>
  explicit ZORVadSingleInteger(Other) = delete;

  ZORLong GetValue() const { return mValue; }
  void SetExactValue(ZORLong value) override;  // replaces the value

 private:
  enum State { kExact, kAny, kNil };

  void Become(State state, ZORLong value);

  State mState = kAny;
  ZORLong mValue = sNC_INT_ANY;
};

// An integer domain with all numbers from a lower to an upper bound.
class ZOR_EXPORT ZORVadIntervalInteger : public ZORVaDoInteger {
  ZOR_DECLARE_INTEGER_CLASS(ZORVadIntervalInteger);

 public:
  ZORVadIntervalInteger(ZORLong lower, ZORLong upper);  // Nil when lower > upper

  ZORLong GetLower() const { return mLower; }
  ZORLong GetUpper() const { return mUpper; }

 private:
  void Become(std::int64_t lower, std::int64_t upper);

  ZORLong mLower = INT32_MIN;
  ZORLong mUpper = INT32_MAX;
};

// Distinct numbers in ascending order.
class ZOR_EXPORT ZORSVectorImp_SubIntBase {
 public:
  std::size_t Count() const { return mValues.size(); }
  std::vector<ZORLong>::const_iterator begin() const { return mValues.begin(); }
  std::vector<ZORLong>::const_iterator end() const { return mValues.end(); }
  std::vector<ZORLong>::const_iterator FindLowerBound(std::int64_t value) const;  // the first number >= value
  void Insert(ZORLong value);                                                     // unless it is there
  void Flush() { mValues.clear(); }

 private:
  std::vector<ZORLong> mValues;
};

// An integer domain that lists up to kListLimit numbers. Insert adds a number, also to a Nil value, and one number more
// than the limit makes the value Undefined; an Undefined one stays. IntersectInverse narrows target.
class ZOR_EXPORT ZORVadEnumInteger : public ZORVaDoInteger {
  ZOR_DECLARE_INTEGER_CLASS(ZORVadEnumInteger);

 public:
  static constexpr std::size_t kListLimit = 4096;

  using ZORVaDoInteger::Intersect;
  void Insert(ZORLong value);
  int Intersect(const ZORVadEnumInteger& other);
  int IntersectInverse(ZORVadSingleInteger& target) const;
  int IntersectInverse(ZORVadIntervalInteger& target) const;

 private:
  int List(const ZORIntegerSet& allowed);

  bool mAny = true;
  ZORSVectorImp_SubIntBase mValues;
};
