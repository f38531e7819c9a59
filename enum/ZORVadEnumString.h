// A string variable that holds an ordered, finite set of the texts that are still possible.
#pragma once

#include "enum/TextSet.h"
#include "module/ZORVaDoString.h"
#include "module/texts.h"
#include "single/ZORVadSingleString.h"
#include "vector/ZORISVectorImp_String.h"

// The state and, beside it, the listed texts in ascending order, each an object of this value's own.
//   Exact  the texts, one or more. Min is the Exact value that lists "" alone; one space is an ordinary text here.
//   Any    nothing is known; no texts.
//   Nil    contradiction; no texts.
//   Max    the texts and the greatest text, which the state holds. Without texts the value is full: the greatest
//          and nothing else.
// An Exact value never keeps an empty set: an operation that would leave one makes the value Nil.
//
// Texts are copied in and stay the caller's. Equal texts stand side by side only after InputValue and Read, and where
// Insert or Append add to an Any or Nil value, which compares nothing. There is no limit on their length, and one of
// 256 texts only where InsertExactValue is at work: the 257th turns the value into Any. Memory that cannot be had
// ends the process, since a lost text would be a wrong answer.
//
// An operation stands here in its typed forms, some with a single string as operand. Its entry in the solver's table
// goes to the form that fits after these tests: an operand that is missing or fits no form changes nothing, 0 (Assign,
// Intersect, Unite and Bisect make the value Nil); a Nil target stays, 0; a Nil source makes the target Nil; an
// Undefined source tells nothing, 0. Operands may be one and the same object. Substring and text representation tell a
// set nothing: both forms answer 0.
class ZOR_EXPORT ZORVadEnumString : public ZORVaDoString {
  ZOR_DECLARE_STRING_CLASS(ZORVadEnumString);

 public:
  ZOR_DECLARE_STRING_OPERATIONS();
  static ZORVadEnumString* Build(ZORStreamable* object);  // null: a new value for Read, or null without memory

  ZORVadEnumString();  // Any
  ZORVadEnumString(const ZORVadEnumString& other);
  ZORVadEnumString(const ZORVadSingleString& other);  // NOLINT(google-explicit-constructor)
  ZORVadEnumString(const ZORString& text);            // NOLINT(google-explicit-constructor)
  ZORVadEnumString(const void* text);                 // NOLINT(google-explicit-constructor): zero-ended
  explicit ZORVadEnumString(ZORStreamableInit);       // for Read
  ~ZORVadEnumString() override;

  // Copies. Of a set Copy answers what Append does; of a single value that is Any, Nil or Max comes the state alone.
  // clang-format off
  ZORVadEnumString& operator=(const ZORVadEnumString& other);
  int Assign(const ZORVadEnumString& other);    // 1
  int Assign(const ZORVadSingleString& other);  // 1
  int Copy  (const ZORVadEnumString& other);
  int Copy  (const ZORVadSingleString& other);  // 1

  // Membership. Contains: the position from 1 where the text is listed, 0 when it is not, -1 of a full value.
  // Insert and Append leave the state; Append answers 1 when every text was new, for a set without texts 0.
  int        Contains(const ZORString& text) const;
  int        Contains(const ZORString* text) const;
  int        Insert  (const ZORString& text);
  int        Append  (const ZORVadEnumString& other);
  int        Append  (const ZORISVectorImp_String& texts);
  int        Count   () const;
  ZORString& GetValue(int position) const;             // from 0, below Count(); still the value's
  int        CutLower(const ZORString& bound);         // drops the texts below bound, answers Count()
  int        CutUpper(const ZORString& bound);         // drops those above and, bound being below the greatest, the Max

  // Set operations. Intersect keeps the texts that both list; the Max of a state takes no part. A single value
  // leaves its text alone, or nothing. Bisect splits no set.
  int  Intersect            (const ZORVadEnumString& other);
  int  Intersect            (const ZORISVectorImp_String& texts);
  int  Intersect            (const ZORVadSingleString& other);        // 1 also when the text was alone before
  int  IntersectInverse     (ZORVadSingleString& target) const;       // target
  int  CalcEqualValue       (const ZORVadEnumString& other);
  int  CalcEqualValue       (const ZORVadSingleString& other);
  int  CalcInverseEqualValue(ZORVadEnumString& target) const;         // target
  int  CalcInverseEqualValue(ZORVadSingleString& target) const;       // target
  void Unite                (const ZORVadEnumString& other);
  void Unite                (const ZORVadSingleString& other);

  // Relations of *this, left, and x, right. The lesser side of <= is cut; the greater side is set to a bound, which is
  // listed afterwards whether or not it was. The strict ones compare the greatest texts and cut nothing. Narrows:
  int CalcLessOrEqualValue             (const ZORVadEnumString& x);          // *this
  int CalcLessOrEqualValue             (const ZORVadSingleString& x);        // *this
  int CalcInverseLessOrEqualValue      (      ZORVadEnumString& x) const;    // x
  int CalcInverseLessOrEqualValue      (      ZORVadSingleString& x) const;  // x
  int CalcLessValue                    (const ZORVadEnumString& x);          // *this
  int CalcInverseLessValue             (      ZORVadEnumString& x) const;    // x
  int CalcNotLessValue                 (const ZORVadEnumString& x);          // *this
  int CalcInverseNotLessValue          (      ZORVadEnumString& x) const;    // x
  int CalcInverseNotLessValue          (      ZORVadSingleString& x) const;  // x
  int CalcNotLessAndUnequalValue       (const ZORVadEnumString& x);          // *this
  int CalcInverseNotLessAndUnequalValue(      ZORVadEnumString& x) const;    // x
  int CalcInverseNotLessAndUnequalValue(      ZORVadSingleString& x) const;  // x

  // *this = min(x, y), max(x, y), the successor of x. The forward forms add to what a target lists, or replace it,
  // and answer 1 without comparing. The inverses of minimum and maximum compare bounds.
  int CalcMinValue            (const ZORVadEnumString& x, const ZORVadEnumString& y);        // *this
  int CalcFirstInverseMinValue(      ZORVadEnumString& x, const ZORVadEnumString& y) const;  // x
  int CalcMaxValue            (const ZORVadEnumString& x, const ZORVadEnumString& y);        // *this
  int CalcFirstInverseMaxValue(      ZORVadEnumString& x, const ZORVadEnumString& y) const;  // x
  int CalcNextValue           (const ZORVadEnumString& x);                                   // *this
  int CalcInverseNextValue    (      ZORVadEnumString& x) const;                             // x

  // *this = x + y, over all pairs, met with what *this holds. More than 256 results tell nothing. The typed inverses
  // answer 0; their entries pass a contradiction on.
  int CalcConcatenation             (const ZORVadEnumString& x, const ZORVadEnumString& y);        // *this
  int CalcFirstInverseConcatenation (      ZORVadEnumString& x, const ZORVadEnumString& y) const;  // nothing
  int CalcSecondInverseConcatenation(const ZORVadEnumString& x,       ZORVadEnumString& y) const;  // nothing
  int CalcSubString             (const ZORVadEnumString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end);        // nothing
  int CalcFirstInverseSubString (      ZORVadEnumString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) const;  // nothing
  int CalcSecondInverseSubString(const ZORVadEnumString& x,       ZORVaDoInteger& start, const ZORVaDoInteger& end) const;  // nothing
  int CalcThirdInverseSubString (const ZORVadEnumString& x, const ZORVaDoInteger& start,       ZORVaDoInteger& end) const;  // nothing

  // *this = lower or upper case of x: the folds, met with what *this holds; against a single x the first text of
  // *this alone is compared. The inverses test x text by text and narrow nothing.
  int CalcLowerValue       (const ZORVadEnumString& x);          // *this
  int CalcLowerValue       (const ZORVadSingleString& x);        // *this
  int CalcInverseLowerValue(      ZORVadEnumString& x) const;    // x
  int CalcInverseLowerValue(      ZORVadSingleString& x) const;  // x
  int CalcUpperValue       (const ZORVadEnumString& x);          // *this
  int CalcUpperValue       (const ZORVadSingleString& x);        // *this
  int CalcInverseUpperValue(      ZORVadEnumString& x) const;    // x
  int CalcInverseUpperValue(      ZORVadSingleString& x) const;  // x
  // clang-format on

 private:
  using Enum = ZORVadEnumString;
  using Single = ZORVadSingleString;
  using Texts = zor::TextSet;

  explicit ZORVadEnumString(ZORStringStateTag state);

  // Replace state and texts, 1.
  int Become(ZORStringStateTag state);
  int Become(ZORStringStateTag state, const ZORString& text);
  int Become(ZORStringStateTag state, Texts&& texts);

  // Insert compares nothing while the value is open. Include is InsertExactValue.
  Texts::Equals OfEquals() const { return IsUndefined() || IsNil() ? Texts::Equals::Accepted : Texts::Equals::Refused; }
  bool CanMark(std::size_t candidates) const { return !IsUndefined() && mTexts.CanMark(candidates); }
  template <class Wanted>
  int Keep(const Wanted& wanted);
  int Narrow(Texts&& candidates);
  void InputSet(ZORistrstream& in);

  template <class X>
  int CalcFoldValue(const X& x, zor::Fold fold);
  int MeetFolds(const Enum& x, zor::Fold fold);
  int MeetFolds(const Single& x, zor::Fold fold);

  Texts mTexts;
};

// Keeps the texts that are wanted, a vector or marks; without a text the value is Nil.
template <class Wanted>
int ZORVadEnumString::Keep(const Wanted& wanted) {
  if (!mTexts.Keep(wanted)) return 0;
  return mTexts.Count() > 0 ? 1 : Nil();
}
