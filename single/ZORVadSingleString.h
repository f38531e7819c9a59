// A string variable that holds at most one text.
#pragma once

#include <utility>

#include "module/ZORVaDoString.h"
#include "module/texts.h"

// The state and, beside it, a text that the value owns. Exact: the text, of any length and any characters. Max: the
// greatest text. Undefined and Nil: the text means nothing; a copy takes such a state and leaves the text behind.
// Min is the Exact value of one space. 255 times z may also be Exact, since Max is a state.
//
// An operation stands here in its typed form. Its entry in the solver's table takes the abstract types and answers 0,
// nothing changed, when a string operand is missing or no single string; Assign, Intersect and Unite make the value
// Nil then. Operands may be one and the same object. Above 255 characters a concatenation is Max.
class ZOR_EXPORT ZORVadSingleString : public ZORVaDoString {
  ZOR_DECLARE_STRING_CLASS(ZORVadSingleString);

 public:
  ZOR_DECLARE_STRING_OPERATIONS();
  static ZORVadSingleString* Build(ZORStreamable* object);  // null: a new value for Read, or null without memory

  ZORVadSingleString();                       // Undefined
  ZORVadSingleString(const ZORString& text);  // NOLINT(google-explicit-constructor)
  ZORVadSingleString(const void* text);       // NOLINT(google-explicit-constructor): zero-ended
  ZORVadSingleString(const ZORVadSingleString& other);
  explicit ZORVadSingleString(ZORStreamableInit);  // for Read
  ~ZORVadSingleString() override;

  // Copies; of an Undefined or Nil value the state alone. Copy answers whether a text was copied, Assign 1.
  // clang-format off
  ZORVadSingleString& operator=(const ZORVadSingleString& other);
  ZORVadSingleString& operator=(const char* text);
  int Assign(const ZORVadSingleString& other);
  int Copy  (const ZORVadSingleString& other);
  int Copy  (const ZORString& text);

  // Set operations. Min and Max replace the value that meets them. A union that one text cannot hold is Undefined.
  int  Intersect     (const ZORVadSingleString& other);
  int  CalcEqualValue(const ZORVadSingleString& other);
  void Unite         (const ZORVadSingleString& other);

  // Relations of *this, left, and x, right. They test known values; what fails makes the target Nil. Narrows:
  int CalcLessValue                    (const ZORVadSingleString& x);        // *this
  int CalcInverseLessValue             (      ZORVadSingleString& x) const;  // x
  int CalcLessOrEqualValue             (const ZORVadSingleString& x);        // *this
  int CalcInverseLessOrEqualValue      (      ZORVadSingleString& x) const;  // x
  int CalcNotLessValue                 (const ZORVadSingleString& x);        // *this
  int CalcInverseNotLessValue          (      ZORVadSingleString& x) const;  // x
  int CalcNotLessAndUnequalValue       (const ZORVadSingleString& x);        // *this
  int CalcInverseNotLessAndUnequalValue(      ZORVadSingleString& x) const;  // x

  // *this = min(x, y), max(x, y); an Undefined operand makes a forward target Undefined. *this = successor of x.
  int CalcMinValue            (const ZORVadSingleString& x, const ZORVadSingleString& y);        // *this
  int CalcFirstInverseMinValue(      ZORVadSingleString& x, const ZORVadSingleString& y) const;  // x
  int CalcMaxValue            (const ZORVadSingleString& x, const ZORVadSingleString& y);        // *this
  int CalcFirstInverseMaxValue(      ZORVadSingleString& x, const ZORVadSingleString& y) const;  // x
  int CalcNextValue           (const ZORVadSingleString& x);                                     // *this
  int CalcInverseNextValue    (      ZORVadSingleString& x) const;                               // x

  // *this = x + y. An Undefined operand makes the target Undefined. An inverse cuts at the first occurrence of the
  // other operand and does not ask whether the result would come out.
  int CalcConcatenation             (const ZORVadSingleString& x, const ZORVadSingleString& y);        // *this
  int CalcFirstInverseConcatenation (      ZORVadSingleString& x, const ZORVadSingleString& y) const;  // x
  int CalcSecondInverseConcatenation(const ZORVadSingleString& x,       ZORVadSingleString& y) const;  // y

  // *this = x[start .. end], positions from 0, both ends in; what lies outside x is cut. Integers must be there.
  int CalcSubString             (const ZORVadSingleString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end);        // *this
  int CalcFirstInverseSubString (      ZORVadSingleString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) const;  // x
  int CalcSecondInverseSubString(const ZORVadSingleString& x,       ZORVaDoInteger& start, const ZORVaDoInteger& end) const;  // start
  int CalcThirdInverseSubString (const ZORVadSingleString& x, const ZORVaDoInteger& start,       ZORVaDoInteger& end) const;  // end

  // *this = lower or upper case of x. The inverse only tests: many texts fold to one.
  int CalcLowerValue       (const ZORVadSingleString& x);        // *this
  int CalcInverseLowerValue(      ZORVadSingleString& x) const;  // x
  int CalcUpperValue       (const ZORVadSingleString& x);        // *this
  int CalcInverseUpperValue(      ZORVadSingleString& x) const;  // x
  // clang-format on

 private:
  using Single = ZORVadSingleString;

  int Become(ZORStringStateTag state, const ZORString& text);
  template <class Text>
  int Settle(Text&& text);

  static int NarrowOrder(const Single& a, const Single& b, Single& target, bool strict);
  int TestChoice(Single& x, const Single& y, const ZORString& chosen) const;
  int CalcFoldValue(const Single& x, zor::Fold fold);
  int CalcInverseFoldValue(Single& x, zor::Fold fold) const;
  int NarrowPosition(const Single& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end, ZORVaDoInteger& target,
                     bool targetIsStart) const;

  ZORString mText;
};

ZOR_EXPORT inline int ZORVadSingleString::IsFull() const { return mState == ZorStringMax; }

// The common end of the forward operations: an Undefined value takes the text, an equal text stays, any other is a
// contradiction.
template <class Text>
int ZORVadSingleString::Settle(Text&& text) {
  if (IsUndefined()) {
    mText = std::forward<Text>(text);
    mState = ZorStringExact;
    return 1;
  }
  if (mText == text) return 0;
  return Nil();
}
