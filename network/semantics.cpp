#include "network/semantics.h"

#include <algorithm>
#include <limits>
#include <string>

namespace zornet {

namespace {

ZORString Slice(const ZORString& text, std::int64_t from, std::int64_t to) {
  const std::int64_t last = std::min<std::int64_t>(to, text.GetLengthInChar() - 1);
  if (from < 0 || from > last) return {};
  return text.SubString(static_cast<std::size_t>(from), static_cast<std::size_t>(last - from + 1));
}

std::vector<Answer> WithCharacterBefore(const ZORString& text) {
  std::vector<Answer> found;
  for (char c = zor::kLeastCharacter; c <= zor::kGreatestCharacter; ++c)
    found.push_back({ToZor(c + std::string(ToView(text))), 0});
  return found;
}

bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }

// The text with each of its letters in both cases.
std::optional<std::vector<Answer>> CaseVariants(const ZORString& text) {
  const std::string_view view = ToView(text);
  const auto letters = static_cast<std::size_t>(std::count_if(view.begin(), view.end(), IsLetter));
  if (letters >= std::numeric_limits<std::size_t>::digits || std::size_t{1} << letters > zor::kSetLimit)
    return std::nullopt;
  std::vector<std::string> variants{std::string(view)};
  for (std::size_t i = 0; i < view.size(); ++i) {
    if (!IsLetter(view[i])) continue;
    const std::size_t count = variants.size();
    for (std::size_t v = 0; v < count; ++v) {
      variants.push_back(variants[v]);
      variants.back()[i] = static_cast<char>(view[i] ^ ('a' ^ 'A'));
    }
  }
  std::vector<Answer> found;
  for (const std::string& variant : variants) found.push_back({ToZor(variant), 0});
  return found;
}

bool EndsWithSpace(const ZORString& text) { return ToView(text).ends_with(' '); }

}  // namespace

Semantics::Semantics(const Types& types)
    : mX(types, Sort::Text), mY(types, Sort::Text), mZ(types, Sort::Text), mLength(types, Sort::Integer) {
  for (int i = 0; i < kSorts; ++i) mForms.emplace_back(types, static_cast<Sort>(i));
}

// Operands are Exact, the greatest text too: the module would fold a Max by its state.
bool Semantics::Compute(const Kind& kind, std::span<const Exact> inputs, Answer& result) {
  if (kind.IsOfNumbers()) return ComputeNumber(kind, inputs, result);
  if (kind.meaning == Meaning::TextForm) return ComputeTextForm(inputs[0], result);
  const ZORString& x = *inputs[0].text;
  switch (kind.meaning) {
    case Meaning::Slice:
      result.text = Slice(x, inputs[1].number, inputs[2].number);
      return true;
    case Meaning::Concatenation:
    case Meaning::Minimum:
    case Meaning::Maximum:
      result.text = inputs.size() == 1 ? x : Fold(kind.meaning, x, *inputs[1].text);
      for (std::size_t i = 2; i < inputs.size(); ++i) result.text = Fold(kind.meaning, result.text, *inputs[i].text);
      return true;
    default:
      break;
  }
  mX.Text().SetExactValue(x);
  mZ.Reset();
  switch (kind.meaning) {
    case Meaning::Lower:
      mZ.Text().CalcLowerValue(mX.Text());
      break;
    case Meaning::Upper:
      mZ.Text().CalcUpperValue(mX.Text());
      break;
    case Meaning::Successor:
      mZ.Text().CalcNextValue(mX.Text());
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

// Of two texts what a list of inputs gives from its beginning on.
ZORString Semantics::Fold(Meaning meaning, const ZORString& x, const ZORString& y) {
  mX.Text().SetExactValue(x);
  mY.Text().SetExactValue(y);
  mZ.Reset();
  if (meaning == Meaning::Concatenation) {
    mZ.Text().CalcConcatenation(mX.Text(), mY.Text());
  } else if (meaning == Meaning::Maximum) {
    mZ.Text().CalcMaxValue(mX.Text(), mY.Text());
  } else if (x.GetLengthInChar() == 0 || y.GetLengthInChar() == 0) {
    return {};
  } else {
    mZ.Text().CalcMinValue(mX.Text(), mY.Text());
  }
  return mZ.Text().GetLowerBound();
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

std::optional<std::vector<Answer>> Semantics::Invert(const Kind& kind, std::size_t position,
                                                     std::span<const Exact> values) {
  if (kind.IsOfNumbers()) return InvertNumber(kind, position, values);
  const Exact& result = values.back();
  std::vector<Answer> proposals;
  proposals.reserve(2);
  switch (kind.meaning) {
    case Meaning::Concatenation:
      if (*result.text == GreatestText()) return std::nullopt;  // every text that is too long gives it
      break;
    case Meaning::Minimum:  // beside the same text stands everything beyond it
      if (values.size() > 2 && *result.text == FoldOthers(kind.meaning, values.first(values.size() - 1), position))
        return Between(*result.text, GreatestText());
      break;
    case Meaning::Maximum:
      if (values.size() > 2 && *result.text == FoldOthers(kind.meaning, values.first(values.size() - 1), position))
        return Between(ZORString(), *result.text);
      break;
    case Meaning::Lower:
    case Meaning::Upper:  // a folded text is its own fold, and others fold to it
      if (!Gives(kind, position, {*result.text, 0}, values)) return proposals;
      return CaseVariants(*result.text);
    case Meaning::Length:
      if (result.number == 1) return WithCharacterBefore(ZORString());
      if (result.number > 1 && result.number <= static_cast<ZORLong>(kTextLimit)) return std::nullopt;
      break;
    case Meaning::Slice:
      return InvertSlice(values);
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

// The texts from one to another, both included.
std::optional<std::vector<Answer>> Semantics::Between(const ZORString& lowest, const ZORString& highest) {
  constexpr int kFewBehind = static_cast<int>(kTextLimit) - 2;  // behind a shorter text there are more than a set lists
  const bool spaces = ToView(highest).find_first_not_of(' ') == std::string_view::npos;
  if (!spaces && lowest.GetLengthInChar() <= kFewBehind) return std::nullopt;
  std::vector<Answer> found{{lowest, 0}};
  while (!(found.back().text == highest)) {
    if (found.size() == zor::kSetLimit) return std::nullopt;
    mX.Text().SetExactValue(found.back().text);
    mZ.Reset();
    mZ.Text().CalcNextValue(mX.Text());
    found.push_back({mZ.Text().GetLowerBound(), 0});
  }
  return found;
}

// Where the slice ends before it should, it is the end of the text.
std::optional<std::vector<Answer>> Semantics::InvertSlice(std::span<const Exact> values) {
  const ZORString& slice = *values[3].text;
  const std::int64_t from = values[1].number, length = slice.GetLengthInChar();
  const std::int64_t wanted = std::int64_t{values[2].number} - from + 1;
  if (from < 0 || wanted <= 0) return length == 0 ? std::nullopt : std::optional(std::vector<Answer>());
  if (length > wanted || (length > 0 && from + length > static_cast<std::int64_t>(kTextLimit)))
    return std::vector<Answer>();
  if (length == wanted || from > 1) return std::nullopt;
  std::vector<Answer> found;
  if (from == 1) found = WithCharacterBefore(slice);
  if (from == 0 || length == 0) found.push_back({slice, 0});
  return found;
}

ZORString Semantics::FoldOthers(Meaning meaning, std::span<const Exact> inputs, std::size_t except) {
  const std::size_t first = except == 0 ? 1 : 0;
  ZORString folded = *inputs[first].text;
  for (std::size_t i = first + 1; i < inputs.size(); ++i) {
    if (i != except) folded = Fold(meaning, folded, *inputs[i].text);
  }
  return folded;
}

// Whether this input gives the result with the others.
bool Semantics::Gives(const Kind& kind, std::size_t position, const Answer& input, std::span<const Exact> values) {
  mGiven.assign(values.begin(), values.end());
  mGiven[position].text = &input.text;
  mGiven[position].number = input.number;
  return Holds(kind, mGiven);
}

// Inputs among which all are that give the result: of the module's inverses, and those that it misses.
void Semantics::Propose(const Kind& kind, std::size_t position, std::span<const Exact> values,
                        std::vector<Answer>& proposals) {
  if (kind.meaning == Meaning::TextForm) return ProposeByTextForm(values[0], *values[1].text, proposals);
  if (kind.meaning == Meaning::Length) return proposals.push_back({});  // the one text without characters
  const ZORString& z = *values.back().text;
  std::int64_t before = 0, behind = 0;
  switch (kind.meaning) {
    case Meaning::Concatenation:
      for (std::size_t i = 0; i + 1 < values.size(); ++i) {
        if (i != position) (i < position ? before : behind) += values[i].text->GetLengthInChar();
      }
      proposals.push_back({Slice(z, before, z.GetLengthInChar() - behind - 1), 0});
      break;
    case Meaning::Minimum:
    case Meaning::Maximum:
      proposals.push_back({z, 0});
      break;
    case Meaning::Successor:
      mZ.Text().SetExactValue(z);
      mX.Reset();
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

bool Semantics::Holds(const Kind& kind, std::span<const Exact> values) {
  if (kind.IsRelation()) {
    const Exact& x = values[kind.mirrored ? 1 : 0];
    const Exact& y = values[kind.mirrored ? 0 : 1];
    const bool holds =
        kind.IsOfNumbers() ? Relates(kind.meaning, x.number, y.number) : Relates(kind.meaning, *x.text, *y.text);
    return kind.reified ? holds == (values[2].number != 0) : holds;
  }
  Answer answer;
  if (!Compute(kind, values.first(values.size() - 1), answer)) return false;
  const Exact& result = values.back();
  return result.text != nullptr ? answer.text == *result.text : answer.number == result.number;
}

}  // namespace zornet
