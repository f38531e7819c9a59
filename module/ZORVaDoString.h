// The abstract domain of a string variable.
//
// Its elements are the texts of at most 255 characters from the space (32) to z (122), in the order of ZORString. Texts
// are not checked: any other is stored and compared like these.
#pragma once

#include <cstdint>

#include "host/ZORNumbers.h"
#include "host/ZORSolver.h"
#include "host/ZORText.h"
#include "module/ZORStringClass.h"

// What ZORVadSingleString and ZORVadEnumString have in common: what each operation means, and on the right what it
// narrows. What it does with each state is said in the two classes.
class ZOR_EXPORT ZORVaDoString : public ZORVaDoScalar {
  ZOR_DECLARE_STRING_CLASS(ZORVaDoString);

 public:
  enum ZORStringStateTag : std::int32_t {
    ZorStringExact,  // the listed text or texts
    ZorStringAny,    // Undefined: every text
    ZorStringNil,    // contradiction: no text
    ZorStringMax,    // the greatest text, and the listed ones
  };

  // Texts with a meaning, all empty until InitStrings.
  static ZORString ZorVaDoStringMin;  // the least text, one space
  static ZORString ZorVaDoStringMax;  // the greatest, 255 times z
  static ZORString ZorVaDoStringNil;  // the text of a Nil value, always empty
  static ZORString ZorVaDoStringAny;  // the text of an Undefined single value, 256 times z: not in the domain

  ZORVaDoString() = default;                  // Undefined, unless the derived class sets the state
  explicit ZORVaDoString(ZORStreamableInit);  // for Read
  ZORVaDoString(const ZORVaDoString& other);
  ZORVaDoString& operator=(const ZORVaDoString& other);  // copies the state
  ~ZORVaDoString() override;

  ZORStringStateTag GetState() const { return mState; }

  // Make the value Nil, Undefined. Return 0 when it is so already, else 1.
  int Nil();
  int Any();

  // Unequal: when other has only one text, removes it from *this; a Nil other makes *this Nil, an Undefined one changes
  // nothing. The inverse is the same with the operands exchanged.
  // Reified: result becomes Undefined when an operand is, else Nil when one is Nil or not a string (CalcIsLess tests
  // for a string first). It narrows to true or false when the states and bounds of the operands decide, else it stays.
  // clang-format off
  int CalcUnequalValue       (const ZORVaDoAny& other) override;
  int CalcInverseUnequalValue(ZORVaDoAny& target) const override;
  int CalcIsEqual            (const ZORVaDoAny& other, ZORVaDoBoolean& result) const override;
  int CalcIsLessOrEqual      (const ZORVaDoAny& other, ZORVaDoBoolean& result) const override;
  int CalcIsLess             (const ZORVaDoScalar& other, ZORVaDoBoolean& result) const override;

  // The least value, Min, and the greatest, Max: IsEmpty and IsFull test for them. The other two are CalcMinValue() and
  // CalcMaxValue() by another name.
  virtual int CalcEmptyValue();
  virtual int IsEmpty() const = 0;
  virtual int CalcFullValue();
  virtual int IsFull() const = 0;

  // SetExactValue makes text the only one, InsertExactValue adds it, RemoveExactValue drops it and returns 1 if it was
  // there. The bounds are the least and the greatest text; GetNextExactValue and GetPrevExactValue look for the nearest
  // text from text on, upwards and downwards. Texts are copied.
  virtual void      SetExactValue    (const ZORString& text) = 0;
  virtual void      InsertExactValue (const ZORString& text) = 0;
  virtual int       RemoveExactValue (const ZORString& text) = 0;
  virtual ZORString GetLowerBound    () const = 0;
  virtual ZORString GetUpperBound    () const = 0;
  virtual ZORString GetNextExactValue(const ZORString& text) const = 0;
  virtual ZORString GetPrevExactValue(const ZORString& text) const = 0;

  // n = length of *this, in characters.
  virtual int CalcLength       (ZORVaDoInteger& n) const = 0;        // n
  virtual int CalcInverseLength(const ZORVaDoInteger& n) = 0;        // *this

  // *this = the text form of x.
  virtual int CalcStringRepresentation       (const ZORVaDoAny& x) = 0;        // *this
  virtual int CalcInverseStringRepresentation(ZORVaDoAny& x) const = 0;        // x

  // *this = x in lower case, in upper case.
  virtual int CalcLowerValue       (const ZORVaDoString& x) = 0;     // *this
  virtual int CalcInverseLowerValue(ZORVaDoString& x) const = 0;     // x
  virtual int CalcUpperValue       (const ZORVaDoString& x) = 0;     // *this
  virtual int CalcInverseUpperValue(ZORVaDoString& x) const = 0;     // x

  // *this = x + y.
  virtual int CalcConcatenation             (const ZORVaDoString& x, const ZORVaDoString& y) = 0;  // *this
  virtual int CalcFirstInverseConcatenation (ZORVaDoString& x, const ZORVaDoString& y) const = 0;  // x
  virtual int CalcSecondInverseConcatenation(const ZORVaDoString& x, ZORVaDoString& y) const = 0;  // y

  // *this = x[start .. end], positions from 0, both included.
  virtual int CalcSubString             (const ZORVaDoString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) = 0;  // *this
  virtual int CalcFirstInverseSubString (ZORVaDoString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) const = 0;  // x
  virtual int CalcSecondInverseSubString(const ZORVaDoString& x, ZORVaDoInteger& start, const ZORVaDoInteger& end) const = 0;  // start
  virtual int CalcThirdInverseSubString (const ZORVaDoString& x, const ZORVaDoInteger& start, ZORVaDoInteger& end) const = 0;  // end
  // clang-format on

 protected:
  // Settle on Min, Max: an Undefined value becomes that extreme, a value that is it stays, any other becomes Nil.
  int MeetLeast();
  int MeetGreatest();

  ZORStringStateTag mState = ZorStringAny;
};
