#include "network/semantics.h"

#include <algorithm>
#include <array>

namespace zornet {

namespace {

ZORString Slice(const ZORString& text, std::int64_t from, std::int64_t to) {
  const std::int64_t last = std::min<std::int64_t>(to, text.GetLengthInChar() - 1);
  if (from < 0 || from > last) return {};
  return text.SubString(static_cast<std::size_t>(from), static_cast<std::size_t>(last - from + 1));
}

bool EndsWithSpace(const ZORString& text) { return ToView(text).ends_with(' '); }

}  // namespace

Semantics::Semantics(const Types& types)
    : mX(types, Sort::Text), mY(types, Sort::Text), mZ(types, Sort::Text), mLength(types, Sort::Integer) {
  for (int i = 0; i < kSorts; ++i) mForms.emplace_back(types, static_cast<Sort>(i));
}

// Operands are Exact, the greatest text too: the module would fold a Max by its state.
bool Semantics::Compute(const Kind& kind, const Exact* inputs, Answer& result) {
  if (kind.meaning == Meaning::TextForm) return ComputeTextForm(inputs[0], result);
  if (kind.meaning == Meaning::Slice) {
    result.text = Slice(*inputs[0].text, inputs[1].number, inputs[2].number);
    return true;
  }
  mX.Text().SetExactValue(*inputs[0].text);
  if (kind.Inputs() == 2) mY.Text().SetExactValue(*inputs[1].text);
  mZ.Reset();
  switch (kind.meaning) {
    case Meaning::Concatenation:
      mZ.Text().CalcConcatenation(mX.Text(), mY.Text());
      break;
    case Meaning::Lower:
      mZ.Text().CalcLowerValue(mX.Text());
      break;
    case Meaning::Upper:
      mZ.Text().CalcUpperValue(mX.Text());
      break;
    case Meaning::Successor:
      mZ.Text().CalcNextValue(mX.Text());
      break;
    case Meaning::Maximum:
      mZ.Text().CalcMaxValue(mX.Text(), mY.Text());
      break;
    case Meaning::Minimum:
      if (inputs[0].text->GetLengthInChar() == 0 || inputs[1].text->GetLengthInChar() == 0) {
        mZ.Text().SetExactValue(ZORString());
      } else {
        mZ.Text().CalcMinValue(mX.Text(), mY.Text());
      }
      break;
    case Meaning::Length:
      mLength.Reset();
      mX.Text().CalcLength(mLength.Integer());
      result.number = mLength.Integer().GetExactValue();
      return true;
    default:
      return false;
  }
  result.text = mZ.Text().GetLowerBound();
  return !mZ.IsNil();
}

bool Semantics::ComputeTextForm(const Exact& value, Answer& result) {
  Value& form = FormOf(value.sort);
  if (!IsText(value.sort)) {
    form.SetNumber(value.number);
  } else if (*value.text == GreatestText()) {
    form.Text().CalcMaxValue();
  } else {
    form.SetText(*value.text);
  }
  mZ.Text().CalcStringRepresentation(form.Any());
  result.text = mZ.Text().GetLowerBound();
  return ToView(result.text).size() <= kTextLimit;
}

// A number has one text form, whatever its sort; the module would put a set of one number in braces.
Value& Semantics::FormOf(Sort sort) { return mForms[static_cast<std::size_t>(IsInteger(sort) ? Sort::Integer : sort)]; }

bool Semantics::CanInvert(const Kind& kind, int position) {
  return position < kind.Inputs() && kind.meaning != Meaning::Slice;
}

std::optional<std::vector<Answer>> Semantics::Invert(const Kind& kind, int position, const Exact* values) {
  const Exact& result = values[kind.Inputs()];
  const Exact& other = values[kind.Inputs() == 2 ? 1 - position : 0];
  std::vector<Answer> proposals;
  proposals.reserve(2);
  switch (kind.meaning) {
    case Meaning::Concatenation:
      if (*result.text == GreatestText()) return std::nullopt;  // every text that is too long gives it
      break;
    case Meaning::Minimum:
    case Meaning::Maximum:
      if (*result.text == *other.text) return std::nullopt;  // so does everything beyond it
      break;
    case Meaning::Lower:
    case Meaning::Upper:  // a folded text is its own fold, and others may fold to it
      if (Gives(kind, position, {*result.text, 0}, values)) return std::nullopt;
      return proposals;
    case Meaning::Length:
      if (result.number > 0 && result.number <= static_cast<ZORLong>(kTextLimit)) return std::nullopt;
      break;
    default:
      break;
  }
  Propose(kind, position, values, proposals);
  std::vector<Answer> found;
  found.reserve(proposals.size());
  for (Answer& proposal : proposals) {
    const bool again = std::find(found.begin(), found.end(), proposal) != found.end();
    if (!again && Gives(kind, position, proposal, values)) found.push_back(std::move(proposal));
  }
  return found;
}

// Whether this input gives the result with the others.
bool Semantics::Gives(const Kind& kind, int position, const Answer& input, const Exact* values) {
  std::array<Exact, kMostArguments> exact{};
  std::copy_n(values, kind.arity, exact.begin());
  exact[static_cast<std::size_t>(position)].text = &input.text;
  exact[static_cast<std::size_t>(position)].number = input.number;
  return Holds(kind, exact.data());
}

// The module's inverse, and the inputs that it misses.
void Semantics::Propose(const Kind& kind, int position, const Exact* values, std::vector<Answer>& proposals) {
  const Exact& result = values[kind.Inputs()];
  const Exact& other = values[kind.Inputs() == 2 ? 1 - position : 0];
  if (kind.meaning == Meaning::TextForm) return ProposeByTextForm(values[0], *result.text, proposals);
  if (kind.meaning == Meaning::Length) return proposals.push_back({});  // the one text without characters
  const ZORString& z = *result.text;
  mZ.Text().SetExactValue(z);
  mX.Reset();
  switch (kind.meaning) {
    case Meaning::Concatenation:
      mY.Text().SetExactValue(*other.text);
      if (position == 0) {
        mZ.Text().CalcFirstInverseConcatenation(mX.Text(), mY.Text());
        Take(proposals, mX);  // the module takes the first place of the second text, which may not be the end
        if (z.GetLengthInChar() >= other.text->GetLengthInChar()) {
          proposals.push_back({Slice(z, 0, z.GetLengthInChar() - other.text->GetLengthInChar() - 1), 0});
        }
      } else {
        mZ.Text().CalcSecondInverseConcatenation(mY.Text(), mX.Text());
        Take(proposals, mX);
      }
      break;
    case Meaning::Minimum:
      mY.Text().SetExactValue(*other.text);
      mZ.Text().CalcFirstInverseMinValue(mX.Text(), mY.Text());
      Take(proposals, mX);
      proposals.push_back({z, 0});  // the module refuses it at one space
      break;
    case Meaning::Maximum:
      mY.Text().SetExactValue(*other.text);
      mZ.Text().CalcFirstInverseMaxValue(mX.Text(), mY.Text());
      Take(proposals, mX);
      proposals.push_back({z, 0});
      break;
    case Meaning::Successor:
      mZ.Text().CalcInverseNextValue(mX.Text());
      Take(proposals, mX);  // of 255 characters; a shorter text with a space behind it is possible too
      if (EndsWithSpace(z)) proposals.push_back({Slice(z, 0, z.GetLengthInChar() - 2), 0});
      if (z == GreatestText()) proposals.push_back({z, 0});
      break;
    default:
      break;
  }
}

// The module reads a text up to its second quote; the form ends at the last.
void Semantics::ProposeByTextForm(const Exact& value, const ZORString& form, std::vector<Answer>& proposals) {
  Value& read = FormOf(value.sort);
  mZ.Text().SetExactValue(form);
  mZ.Text().CalcInverseStringRepresentation(read.Any());
  Take(proposals, read);
  const int length = form.GetLengthInChar();
  if (IsText(value.sort) && length >= 2) proposals.push_back({Slice(form, 1, length - 2), 0});
}

void Semantics::Take(std::vector<Answer>& proposals, const Value& target) {
  if (IsText(target.Sort()) && target.Text().IsFull()) return proposals.push_back({GreatestText(), 0});
  if (!target.IsOne()) return;
  const bool text = IsText(target.Sort());
  proposals.push_back(text ? Answer{target.LowestText(), 0} : Answer{ZORString(), target.LowestNumber()});
}

bool Semantics::Relates(Meaning meaning, const ZORString& x, const ZORString& y) {
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

bool Semantics::Holds(const Kind& kind, const Exact* values) {
  if (kind.IsRelation()) {
    const Exact& x = values[kind.mirrored ? 1 : 0];
    const Exact& y = values[kind.mirrored ? 0 : 1];
    const bool holds = Relates(kind.meaning, *x.text, *y.text);
    return kind.reified ? holds == (values[2].number != 0) : holds;
  }
  Answer answer;
  if (!Compute(kind, values, answer)) return false;
  const Exact& result = values[kind.Inputs()];
  return result.text != nullptr ? answer.text == *result.text : answer.number == result.number;
}

}  // namespace zornet
