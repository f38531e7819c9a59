// What the constraints mean on exact values: the one place that defines a solution. Narrowing is sound and complete
// with respect to it.
//
// The module's forward operation on fresh single values computes a function. Where the module answers by state instead
// of by text (one space) or in sums that wrap (slices), the texts decide. Equality and order are those of the texts.
//
//   concatenation  of more than 255 characters: the greatest text
//   slice          positions from 0, both ends in; an end behind the text is the last character; empty when it begins
//                  below 0, behind the text, or behind its own end
//   successor      of the greatest text: itself
//   text form      of more than 255 characters: none
//   position       of the empty text: 0
//   replacement    of the empty text: it stands before the first character and, where all are replaced, nowhere; of
//                  more than 255 characters: the greatest text
//   sum, product   outside the 32-bit integers: none
#pragma once

#include <optional>
#include <span>
#include <vector>

#include "network/ZORModel.h"
#include "network/values.h"

namespace zornet {

// One text, number or truth value. The text is not owned.
struct Exact {
  const ZORString* text = nullptr;
  ZORLong number = 0;
  Sort sort = Sort::Text;  // of its variable, which decides the text form
};

// The same with a text of its own.
struct Answer {
  ZORString text;
  ZORLong number = 0;

  bool operator==(const Answer& other) const { return number == other.number && text == other.text; }
};

class Semantics {
 public:
  explicit Semantics(const Types& types);

  // The value of a function, or the truth of what is reified; false when there is none.
  bool Compute(const Constraint& constraint, std::span<const Exact> inputs, Answer& result);

  // All values of one input that give the result with the other inputs; nothing when they are too many to be listed.
  // Ignores values[position].
  std::optional<std::vector<Answer>> Invert(const Constraint& constraint, std::size_t position,
                                            std::span<const Exact> values);

  // Whether Invert ever lists something for an argument.
  static bool CanInvert(const Kind& kind, std::size_t position);

  // Whether an argument that Invert does not list has many values, rather than all but some.
  static bool IsManifold(const Kind& kind, std::size_t position);

  template <class T>
  static bool Relates(Meaning meaning, const T& x, const T& y);
  bool Holds(const Constraint& constraint, std::span<const Exact> values);

 private:
  using Answers = std::optional<std::vector<Answer>>;

  bool IsTrue(const Constraint& constraint, std::span<const Exact> values);
  static bool RelatesTexts(const Constraint& constraint, std::span<const Exact> values);
  bool ComputeFunction(const Kind& kind, std::span<const Exact> inputs, Answer& result);
  static bool ComputeNumber(const Kind& kind, std::span<const Exact> inputs, Answer& result);
  Answers InvertTrue(const Constraint& constraint, std::size_t position, std::span<const Exact> values);
  Answers InvertReplacement(const Constraint& constraint, std::size_t position, std::span<const Exact> values);
  static Answers InvertNumber(const Kind& kind, std::size_t position, std::span<const Exact> values);
  Answers Filter(const Constraint& constraint, std::size_t position, std::span<const Exact> values,
                 std::vector<Answer> proposals);
  bool ComputeTextForm(const Exact& value, Answer& result);
  static ZORString Joined(const ZORString& x, const ZORString& y);
  ZORString Fold(Meaning meaning, const ZORString& x, const ZORString& y);
  ZORString FoldOthers(Meaning meaning, std::span<const Exact> inputs, std::size_t except);
  Value& FormOf(Sort sort);
  bool Gives(const Constraint& constraint, std::size_t position, const Answer& input, std::span<const Exact> values);
  static Answers InvertSlice(std::span<const Exact> values);
  Answers Between(const ZORString& lowest, const ZORString& highest);
  void Propose(const Kind& kind, std::size_t position, std::span<const Exact> values, std::vector<Answer>& proposals);
  void ProposeByTextForm(const Exact& value, const ZORString& form, std::vector<Answer>& proposals);
  void Take(std::vector<Answer>& proposals, const Value& target);

  Value mX, mY, mZ;           // single texts
  Value mLength;              // a single integer
  std::vector<Value> mForms;  // one of each sort, for text forms
  std::vector<Exact> mGiven;  // what Gives looks at
};

template <class T>
bool Semantics::Relates(Meaning meaning, const T& x, const T& y) {
  switch (meaning) {
    case Meaning::Equal:
      return x == y;
    case Meaning::Unequal:
      return !(x == y);
    case Meaning::LessOrEqual:
      return x <= y;
    case Meaning::Less:
      return x < y;
    default:
      return false;
  }
}

}  // namespace zornet
