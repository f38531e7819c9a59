// The abstract string value: what is still possible for a string variable of the solver.
//
// The domain is every text of at most 255 characters over the alphabet from the space (32) to z (122), in the order
// of ZORString. A text from outside it is stored and compared like any other.
#pragma once

#include <cstdint>

#include "host/ZORNumbers.h"
#include "host/ZORSolver.h"
#include "host/ZORText.h"
#include "module/ZORStringClass.h"

class ZOR_EXPORT ZORVaDoString : public ZORVaDoScalar {
  ZOR_DECLARE_STRING_CLASS(ZORVaDoString);

 public:
  enum ZORStringStateTag : std::int32_t {
    ZorStringExact,  // the value has defined content
    ZorStringAny,    // Undefined: any text is possible
    ZorStringNil,    // contradiction: no text is possible
    ZorStringMax,    // the greatest text is in the value
  };

  // Texts with a meaning, empty until InitStrings.
  static ZORString ZorVaDoStringMin;  // the least text, one space
  static ZORString ZorVaDoStringMax;  // the greatest, 255 times z
  static ZORString ZorVaDoStringNil;  // of a Nil value, stays empty
  static ZORString ZorVaDoStringAny;  // of an Undefined single value, 256 times z: longer than any text of the domain

  ZORVaDoString() = default;                  // the concrete class gives the state
  explicit ZORVaDoString(ZORStreamableInit);  // for Read, which gives the state
  ZORVaDoString(const ZORVaDoString& other);
  ZORVaDoString& operator=(const ZORVaDoString& other);  // copies the state
  ~ZORVaDoString() override;

  ZORStringStateTag GetState() const { return mState; }

  // Bring the value to that state. Answer 0 when it is there already.
  int Nil();
  int Any();

  // The relations into a Boolean, from the states and bounds of both values; an open relation leaves it untouched.
  // A Nil operand or one that is no string makes it Nil, an Undefined one Undefined.
  // CalcUnequalValue removes the text of an other that has but one.
  // clang-format off
  int CalcUnequalValue       (const ZORVaDoAny& other) override;
  int CalcInverseUnequalValue(ZORVaDoAny& target) const override;
  int CalcIsEqual            (const ZORVaDoAny& other, ZORVaDoBoolean& result) const override;
  int CalcIsLessOrEqual      (const ZORVaDoAny& other, ZORVaDoBoolean& result) const override;
  int CalcIsLess             (const ZORVaDoScalar& other, ZORVaDoBoolean& result) const override;

  // The extremes: IsEmpty tells the least value, IsFull the greatest; the other two make them.
  virtual int CalcEmptyValue();
  virtual int IsEmpty() const = 0;
  virtual int CalcFullValue();
  virtual int IsFull() const = 0;

  // Texts of the value, one at a time. Texts are copied.
  virtual void      SetExactValue    (const ZORString& text) = 0;
  virtual void      InsertExactValue (const ZORString& text) = 0;
  virtual int       RemoveExactValue (const ZORString& text) = 0;
  virtual ZORString GetLowerBound    () const = 0;
  virtual ZORString GetUpperBound    () const = 0;
  virtual ZORString GetNextExactValue(const ZORString& text) const = 0;
  virtual ZORString GetPrevExactValue(const ZORString& text) const = 0;

  // n = length(*this), in characters.
  virtual int CalcLength       (ZORVaDoInteger& n) const = 0;        // n
  virtual int CalcInverseLength(const ZORVaDoInteger& n) = 0;        // *this

  // *this = text form of x.
  virtual int CalcStringRepresentation       (const ZORVaDoAny& x) = 0;        // *this
  virtual int CalcInverseStringRepresentation(ZORVaDoAny& x) const = 0;        // x

  // *this = lower or upper case of x.
  virtual int CalcLowerValue       (const ZORVaDoString& x) = 0;     // *this
  virtual int CalcInverseLowerValue(ZORVaDoString& x) const = 0;     // x
  virtual int CalcUpperValue       (const ZORVaDoString& x) = 0;     // *this
  virtual int CalcInverseUpperValue(ZORVaDoString& x) const = 0;     // x

  // *this = x + y.
  virtual int CalcConcatenation             (const ZORVaDoString& x, const ZORVaDoString& y) = 0;  // *this
  virtual int CalcFirstInverseConcatenation (ZORVaDoString& x, const ZORVaDoString& y) const = 0;  // x
  virtual int CalcSecondInverseConcatenation(const ZORVaDoString& x, ZORVaDoString& y) const = 0;  // y

  // *this = x[start .. end], positions from 0, both ends in.
  virtual int CalcSubString             (const ZORVaDoString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) = 0;  // *this
  virtual int CalcFirstInverseSubString (ZORVaDoString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) const = 0;  // x
  virtual int CalcSecondInverseSubString(const ZORVaDoString& x, ZORVaDoInteger& start, const ZORVaDoInteger& end) const = 0;  // start
  virtual int CalcThirdInverseSubString (const ZORVaDoString& x, const ZORVaDoInteger& start, ZORVaDoInteger& end) const = 0;  // end
  // clang-format on

 protected:
  // An operand at an extreme decides: an Undefined value takes it, one that is elsewhere becomes Nil.
  int MeetLeast();
  int MeetGreatest();

  ZORStringStateTag mState = ZorStringAny;
};
