// The domain of a string variable as an ordered, finite set of texts.
#pragma once

#include "enum/TextSet.h"
#include "module/ZORVaDoString.h"
#include "module/texts.h"
#include "single/ZORVadSingleString.h"
#include "vector/ZORISVectorImp_String.h"

// A state and the listed texts in ascending order, all owned by the value.
//   Exact  one text or more. Min is the Exact value that lists "" alone; one space is an ordinary text here.
//   Any    Undefined; no texts.
//   Nil    contradiction; no texts.
//   Max    the listed texts and the greatest text, which the state stands for. Without texts the value is full.
// An operation that would leave an Exact value without texts makes it Nil.
//
// Texts are copied. Equal texts occur only after InputValue and Read, and where Insert or Append add to an Any or Nil
// value, which they do without comparing. The number of texts is limited, to kSetLimit, only in InsertExactValue,
// CalcInverseLength and where concatenation or case build candidates. Running out of memory ends the process: a lost
// text would be a wrong answer.
//
// These are the typed forms, some of them with a single string. A virtual form first checks its operands: a missing one
// or one of another class changes nothing, 0, but makes *this Nil in Assign, Intersect, Unite and Bisect. In orders,
// minimum, maximum, successor, case and concatenation a Nil target then stays Nil, a Nil source makes it Nil, and an
// Undefined source changes nothing. Then it calls the typed form. Operands may be the same object. Unless stated
// otherwise an operation returns 1 for a change, else 0.
class ZOR_EXPORT ZORVadEnumString : public ZORVaDoString {
  ZOR_DECLARE_STRING_CLASS(ZORVadEnumString);

 public:
  // Those without a typed form:
  //   PrintOn, InputValue    Nil, Any, Max, Min, one text in double quotes, or { "a", "b" }. Texts in the state Max are
  //                          printed as { "a", Max }, which cannot be read; any other input gives Nil
  //   Write, Read            the state, and the texts of an Exact value; broken input gives Nil
  //   GetCardinality         Nil 0, Undefined 256, else Count()
  //   IsIntersected          0 if either value is Nil, else 1 if either is Undefined, else whether *this lists a text
  //                          of the other, or for a full *this, whether the other is Max. The other may be a single
  //   Bisect                 changes nothing, except that a wrong operand or selection makes *this Nil
  //   GetLowerBound          Nil: "". Any, Min: one space. Full: the greatest text. Else the first text
  //   GetUpperBound          Nil: "". Min: one space. Any, Max: the greatest text. Else the last text
  //   GetNextExactValue      the first text >= the argument; the argument itself if that is the last text or none
  //   GetPrevExactValue      the last text <= the argument; the argument itself if that is the last text or none
  //   SetExactValue          makes *this Exact with that text alone
  //   InsertExactValue       adds the text and makes *this Exact; a set of 256 texts becomes Any. Any and full stay
  //   RemoveExactValue       drops the text; an Exact value without texts is Nil
  //   SetLowerBound          drops the texts up to the bound and lists it; Nil and Any stay
  //   SetUpperBound          drops the texts from the bound on and lists it; Max if it is the greatest text, else Exact
  //   CalcLength             n becomes Nil or Undefined with *this, 1, else is intersected with the lengths of the
  //                          listed texts, which makes it Nil for a full *this
  //   CalcInverseLength      keeps the texts whose length n allows, becomes Exact, 1; Nil if n is Nil or negative. An
  //                          Undefined n or *this changes nothing. With more than 256 texts left *this becomes Any
  //   CalcStringRepresentation and its inverse narrow nothing, 0
  ZOR_DECLARE_STRING_OPERATIONS();
  static ZORVadEnumString* Build(ZORStreamable* object);  // stream factory; null when out of memory

  ZORVadEnumString();  // Any
  ZORVadEnumString(const ZORVadEnumString& other);
  ZORVadEnumString(const ZORVadSingleString& other);  // NOLINT(google-explicit-constructor)
  ZORVadEnumString(const ZORString& text);            // NOLINT(google-explicit-constructor)
  ZORVadEnumString(const void* text);                 // NOLINT(google-explicit-constructor): zero-terminated
  explicit ZORVadEnumString(ZORStreamableInit);       // for Read
  ~ZORVadEnumString() override;

  // These copy a value, of a single that is Any, Nil or Max only the state. Copy of a set returns what Append does.
  // clang-format off
  ZORVadEnumString& operator=(const ZORVadEnumString& other);
  int Assign(const ZORVadEnumString& other);    // 1
  int Assign(const ZORVadSingleString& other);  // 1
  int Copy  (const ZORVadEnumString& other);
  int Copy  (const ZORVadSingleString& other);  // 1

  // Membership. Contains: the position of text, counted from 1; 0 when it is not listed, -1 for a full value. Insert
  // and Append keep the state and return 1 if every text was new; Append of a set without texts returns 0. CutLower and
  // CutUpper return Count().
  int        Contains(const ZORString& text) const;
  int        Contains(const ZORString* text) const;
  int        Insert  (const ZORString& text);
  int        Append  (const ZORVadEnumString& other);
  int        Append  (const ZORISVectorImp_String& texts);
  int        Count   () const;
  ZORString& GetValue(int position) const;             // 0 <= position < Count(); owned by *this
  int        CutLower(const ZORString& bound);         // drops the texts < bound
  int        CutUpper(const ZORString& bound);         // drops the texts > bound, and Max if bound is less

  // Intersect and CalcEqualValue do the same: keep the texts that both list, and the state even if it is Max. A Nil
  // other makes *this Nil, an Undefined one changes nothing; an Undefined *this copies other, and a full one becomes
  // Nil unless other is Max. A single other that is listed becomes the only text, else *this becomes Nil; a Max single
  // changes nothing. The inverse gives an Undefined single target the only text of *this, and makes a known one Nil
  // unless it is listed.
  // Unite adds the listed texts of other; a Nil *this copies other, and an Undefined side makes *this Undefined.
  int  Intersect            (const ZORVadEnumString& other);
  int  Intersect            (const ZORISVectorImp_String& texts);
  int  Intersect            (const ZORVadSingleString& other);        // 1 even if it was the only text
  int  IntersectInverse     (ZORVadSingleString& target) const;       // target
  int  CalcEqualValue       (const ZORVadEnumString& other);
  int  CalcEqualValue       (const ZORVadSingleString& other);
  int  CalcInverseEqualValue(ZORVadEnumString& target) const;         // target
  int  CalcInverseEqualValue(ZORVadSingleString& target) const;       // target
  void Unite                (const ZORVadEnumString& other);
  void Unite                (const ZORVadSingleString& other);

  // *this < x, <= x, >= x, > x. The lesser side of <= is cut to the upper bound of the other; the greater side gets
  // the lower bound of the other as its own, and lists it even if it did not before. Strict relations cut nothing: the
  // target becomes Nil unless the upper bound of the lesser side is less than that of the greater. A single x that gets
  // a bound becomes that text; in the other inverses it is compared with the last text of *this, or the greatest text
  // for a full one, and becomes Nil if the relation does not hold.
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

  // *this = min(x, y), max(x, y). Forward adds the texts of both operands to *this, cuts it at the lesser upper
  // (maximum: greater lower) bound of the two, and returns 1. A Min operand makes the minimum Min, a full one the
  // maximum full; a full operand of the minimum neither adds nor cuts, and two make it full. With an Undefined operand
  // the minimum cuts *this to the other, the maximum makes it Undefined.
  // Inverse: an Undefined *this makes x Undefined. An Undefined x copies *this if y is Undefined or has the same upper
  // (maximum: lower) bound; a known x becomes Nil if its bound and that of y rule *this out.
  // *this = the successor of x. Replaces the target by the successors or predecessors, as module/texts.h defines them,
  // and returns 1. A text without a successor is its own, and a full x makes *this full; "" has no predecessor. A full
  // *this makes x Max with the text before the greatest, a Min one makes it Min, an Undefined one Undefined.
  int CalcMinValue            (const ZORVadEnumString& x, const ZORVadEnumString& y);        // *this
  int CalcFirstInverseMinValue(      ZORVadEnumString& x, const ZORVadEnumString& y) const;  // x
  int CalcMaxValue            (const ZORVadEnumString& x, const ZORVadEnumString& y);        // *this
  int CalcFirstInverseMaxValue(      ZORVadEnumString& x, const ZORVadEnumString& y) const;  // x
  int CalcNextValue           (const ZORVadEnumString& x);                                   // *this
  int CalcInverseNextValue    (      ZORVadEnumString& x) const;                             // x

  // *this = x + y: keeps the texts that are a text of x followed by one of y; an Undefined *this takes all of these.
  // More than kSetLimit results change nothing. A full operand makes *this full. The inverses narrow nothing, 0, except
  // that their virtual forms pass on Nil. Substrings narrow nothing, 0.
  int CalcConcatenation             (const ZORVadEnumString& x, const ZORVadEnumString& y);        // *this
  int CalcFirstInverseConcatenation (      ZORVadEnumString& x, const ZORVadEnumString& y) const;  // nothing
  int CalcSecondInverseConcatenation(const ZORVadEnumString& x,       ZORVadEnumString& y) const;  // nothing
  int CalcSubString             (const ZORVadEnumString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end);        // nothing
  int CalcFirstInverseSubString (      ZORVadEnumString& x, const ZORVaDoInteger& start, const ZORVaDoInteger& end) const;  // nothing
  int CalcSecondInverseSubString(const ZORVadEnumString& x,       ZORVaDoInteger& start, const ZORVaDoInteger& end) const;  // nothing
  int CalcThirdInverseSubString (const ZORVadEnumString& x, const ZORVaDoInteger& start,       ZORVaDoInteger& end) const;  // nothing

  // *this = x in lower case, in upper case: keeps the texts that are a folded text of x; an Undefined *this takes all
  // of these. For a single x only the first text of *this is compared. The inverses only test x: the texts of a known x
  // must fold, one by one, to those of *this; for an Undefined x, *this must list a folded text; else x becomes Nil.
  // Min fits only Min, and a full value only a full one.
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

  // Replace state and texts; return 1.
  int Become(ZORStringStateTag state);
  int Become(ZORStringStateTag state, const ZORString& text);
  int Become(ZORStringStateTag state, Texts&& texts);

  // An Any or Nil value accepts equal texts.
  Texts::Equals OfEquals() const { return IsUndefined() || IsNil() ? Texts::Equals::Accepted : Texts::Equals::Refused; }
  bool CanMark(std::size_t candidates) const { return !IsUndefined() && mTexts.CanMark(candidates); }
  template <class Wanted>
  ZOR_INTERNAL int Keep(const Wanted& wanted);
  int Narrow(Texts&& candidates);
  void InputSet(ZORistrstream& in);

  template <class X>
  ZOR_INTERNAL int CalcFoldValue(const X& x, zor::Fold fold);
  int MeetFolds(const Enum& x, zor::Fold fold);
  int MeetFolds(const Single& x, zor::Fold fold);

  Texts mTexts;
};

// Keeps the wanted texts, given by a vector or by marks; Nil if none is left.
template <class Wanted>
int ZORVadEnumString::Keep(const Wanted& wanted) {
  if (!mTexts.Keep(wanted)) return 0;
  return mTexts.Count() > 0 ? 1 : Nil();
}
