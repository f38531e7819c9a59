// The domain of a string variable that holds at most one text.
#pragma once

#include <utility>

#include "module/ZORVaDoString.h"
#include "module/texts.h"

// A state and a text that the value owns. Exact: the text, of any length and with any characters. Max: the greatest
// text. Undefined, Nil: the text has no meaning, and copies do not take it. Min is the Exact value of one space. 255
// times z can also be Exact, since Max is a state.
//
// These are the typed forms. A virtual form returns 0 and changes nothing when a string operand is missing or is not a
// single string; Assign, Intersect and Unite then make *this Nil. Integers and the operand of a text form are not
// checked. Operands may be the same object. Unless stated otherwise an operation returns 1 for a change, else 0.
//
// "Settles on t": an Undefined target becomes Exact with t, a target with the text t stays, any other becomes Nil.
class ZOR_EXPORT ZORVadSingleString : public ZORVaDoString {
  ZOR_DECLARE_STRING_CLASS(ZORVadSingleString);

 public:
  // Those without a typed form:
  //   PrintOn, InputValue    Nil, Any, Max, Min, or the text in double quotes; any other input gives Nil
  //   Write, Read            the state, and the text of an Exact value; broken input gives Nil
  //   GetCardinality         Nil 0, Undefined 255, else 1
  //   IsIntersected          0 if either value is Nil, else 1 if either is Undefined, else whether the texts are equal
  //   Bisect                 makes *this Nil
  //   GetLowerBound, GetUpperBound, GetNextExactValue, GetPrevExactValue   the text, whatever the state
  //   SetExactValue, SetLowerBound, SetUpperBound   make *this Exact with the text
  //   InsertExactValue       a Nil value takes the text; one with another text becomes Undefined
  //   RemoveExactValue       makes a value with that text Nil
  //   CalcLength             n becomes Nil or Undefined with *this, else equal to the length
  //   CalcInverseLength      Nil if n is Nil, negative, not a single integer, or not the length of a known text; an
  //                          Undefined n changes nothing
  //   CalcStringRepresentation         becomes Exact with the text form of x, returns 1
  //   CalcInverseStringRepresentation  x takes the value of which the text is the text form, returns 1
  ZOR_DECLARE_STRING_OPERATIONS();
  static ZORVadSingleString* Build(ZORStreamable* object);  // stream factory; null when out of memory

  ZORVadSingleString();                       // Undefined
  ZORVadSingleString(const ZORString& text);  // NOLINT(google-explicit-constructor)
  ZORVadSingleString(const void* text);       // NOLINT(google-explicit-constructor): zero-terminated
  ZORVadSingleString(const ZORVadSingleString& other);
  explicit ZORVadSingleString(ZORStreamableInit);  // for Read
  ~ZORVadSingleString() override;

  // These copy a value, of an Undefined or Nil one only the state. Copy returns whether a text was copied, Assign 1.
  // clang-format off
  ZORVadSingleString& operator=(const ZORVadSingleString& other);
  ZORVadSingleString& operator=(const char* text);
  int Assign(const ZORVadSingleString& other);
  int Copy  (const ZORVadSingleString& other);
  int Copy  (const ZORString& text);

  // Intersect and CalcEqualValue do the same: settle on the text of other, but take a Min or Max other whatever the
  // text of *this. A Nil other makes *this Nil; a Nil *this and an Undefined other change nothing.
  // Unite: a Nil other changes nothing, a Nil *this takes the text of other. Texts that differ make *this Undefined, as
  // do an Undefined other and a Min or Max with anything but its like.
  int  Intersect     (const ZORVadSingleString& other);
  int  CalcEqualValue(const ZORVadSingleString& other);
  void Unite         (const ZORVadSingleString& other);

  // *this < x, <= x, >= x, > x. A relation that does not hold makes the target Nil, as does a Nil operand; an Undefined
  // operand changes nothing. Min and Max are compared by their state.
  int CalcLessValue                    (const ZORVadSingleString& x);        // *this
  int CalcInverseLessValue             (      ZORVadSingleString& x) const;  // x
  int CalcLessOrEqualValue             (const ZORVadSingleString& x);        // *this
  int CalcInverseLessOrEqualValue      (      ZORVadSingleString& x) const;  // x
  int CalcNotLessValue                 (const ZORVadSingleString& x);        // *this
  int CalcInverseNotLessValue          (      ZORVadSingleString& x) const;  // x
  int CalcNotLessAndUnequalValue       (const ZORVadSingleString& x);        // *this
  int CalcInverseNotLessAndUnequalValue(      ZORVadSingleString& x) const;  // x

  // *this = min(x, y), max(x, y). Forward: a Nil operand makes *this Nil, an Undefined one Undefined; else it settles
  // on the lesser or greater text. The minimum of Max and Max makes *this Max whatever it was.
  // Inverse: an Undefined y changes nothing. A known x becomes Undefined with an Undefined *this, and Nil unless the
  // lesser or greater text of x and y is that of *this. An Undefined x copies *this where y permits it, else it is Nil;
  // it stays where *this, as the maximum, has the text of y.
  // *this = the successor of x. An Undefined source changes nothing, a Nil one makes the target Nil, and so does a Max
  // x; else the target settles on the successor or predecessor, as module/texts.h defines them. A text without a
  // successor makes an Undefined *this Max. One without a predecessor, the empty text or Min, makes x Nil.
  int CalcMinValue            (const ZORVadSingleString& x, const ZORVadSingleString& y);        // *this
  int CalcFirstInverseMinValue(      ZORVadSingleString& x, const ZORVadSingleString& y) const;  // x
  int CalcMaxValue            (const ZORVadSingleString& x, const ZORVadSingleString& y);        // *this
  int CalcFirstInverseMaxValue(      ZORVadSingleString& x, const ZORVadSingleString& y) const;  // x
  int CalcNextValue           (const ZORVadSingleString& x);                                     // *this
  int CalcInverseNextValue    (      ZORVadSingleString& x) const;                               // x

  // *this = x + y. Forward: a Nil value among the three makes *this Nil; an Undefined operand makes it Undefined, even
  // if it was known; a Max operand, or more than 255 characters, makes it Max; else it settles on the text.
  // Inverse: a Nil source makes the target Nil, an Undefined or Max one Undefined. If the other operand occurs in the
  // text of *this, x settles on what precedes the first occurrence of y, and y on what remains after as many characters
  // as x has; else the target becomes Nil. The result need not satisfy the relation.
  int CalcConcatenation             (const ZORVadSingleString& x, const ZORVadSingleString& y);        // *this
  int CalcFirstInverseConcatenation (      ZORVadSingleString& x, const ZORVadSingleString& y) const;  // x
  int CalcSecondInverseConcatenation(const ZORVadSingleString& x,       ZORVadSingleString& y) const;  // y

  // *this = x[start .. end], positions from 0, both included. An end beyond x means its last character; a slice that
  // begins outside x or after its end is empty. Counts have 32 bits and wrap.
  // An Undefined operand makes the target Undefined, a Nil one Nil; before that, a Min x makes *this Min. Forward:
  // settles on the slice. Inverse: an Undefined target x stays; with both positions known the target becomes Nil unless
  // the slice is the text of *this. An unknown position settles where a slice of that length matches: at the known
  // position, or at the first occurrence when both are unknown.
  int CalcSubString             (const ZORVadSingleString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end);        // *this
  int CalcFirstInverseSubString (      ZORVadSingleString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) const;  // x
  int CalcSecondInverseSubString(const ZORVadSingleString& x,       ZORVaDoInteger& start, const ZORVaDoInteger& end) const;  // start
  int CalcThirdInverseSubString (const ZORVadSingleString& x, const ZORVaDoInteger& start,       ZORVaDoInteger& end) const;  // end

  // *this = x in lower case, in upper case. Forward: settles on the folded text, or on Min or Max if x is that; an
  // Undefined x makes *this Nil if its text has a letter in the other case. The inverse only tests x, because many
  // texts fold to one: Nil if x folds to another text, or if an Undefined x cannot fold to the text of *this. Min fits
  // only Min, and Max only Max, whatever the text.
  int CalcLowerValue       (const ZORVadSingleString& x);        // *this
  int CalcInverseLowerValue(      ZORVadSingleString& x) const;  // x
  int CalcUpperValue       (const ZORVadSingleString& x);        // *this
  int CalcInverseUpperValue(      ZORVadSingleString& x) const;  // x
  // clang-format on

 private:
  using Single = ZORVadSingleString;

  int Become(ZORStringStateTag state, const ZORString& text);
  template <class Text>
  ZOR_INTERNAL int Settle(Text&& text);

  static int NarrowOrder(const Single& a, const Single& b, Single& target, bool strict);
  int TestChoice(Single& x, const Single& y, const ZORString& chosen) const;
  int CalcFoldValue(const Single& x, zor::Fold fold);
  int CalcInverseFoldValue(Single& x, zor::Fold fold) const;
  int NarrowPosition(const Single& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end, ZORVaDoInteger& target,
                     bool targetIsStart) const;

  ZORString mText;
};

inline int ZORVadSingleString::IsFull() const { return mState == ZorStringMax; }

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
