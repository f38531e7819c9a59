#include "network/semantics.h"

#include <algorithm>
#include <limits>
#include <set>
#include <string>
#include <string_view>

#include "network/expression.h"
#include "network/tables.h"

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
  found.reserve(variants.size());
  for (const std::string& variant : variants) found.push_back({ToZor(variant), 0});
  return found;
}

std::int32_t PositionOf(std::string_view text, std::string_view part) {
  const std::size_t at = text.find(part);
  return at == std::string_view::npos ? -1 : static_cast<std::int32_t>(at);
}

std::size_t CountReplaced(std::string_view text, std::string_view from, Meaning meaning) {
  if (meaning == Meaning::ReplaceFirst) return text.find(from) == std::string_view::npos ? 0 : 1;
  std::size_t count = 0;
  for (std::size_t at = text.find(from); !from.empty() && at != std::string_view::npos;
       at = text.find(from, at + from.size()))
    ++count;
  return count;
}

ZORString Replace(std::string_view text, std::string_view from, std::string_view to, Meaning meaning) {
  std::string replaced;
  for (std::size_t count = CountReplaced(text, from, meaning); count > 0; --count) {
    const std::size_t at = text.find(from);
    replaced.append(text.substr(0, at)).append(to);
    text.remove_prefix(at + from.size());
  }
  replaced.append(text);
  return replaced.size() > kTextLimit ? GreatestText() : ToZor(replaced);
}

// All beginnings or all ends of a text.
std::vector<Answer> Ends(std::string_view text, Meaning meaning) {
  std::vector<Answer> found;
  for (std::size_t length = 0; length <= text.size(); ++length)
    found.push_back({ToZor(text.substr(meaning == Meaning::Prefix ? 0 : text.size() - length, length)), 0});
  return found;
}

// What begins there.
std::vector<Answer> Starts(std::string_view text, std::int64_t from) {
  if (from < 0 || from > static_cast<std::int64_t>(text.size())) return {};
  return Ends(text.substr(static_cast<std::size_t>(from)), Meaning::Prefix);
}

std::optional<std::vector<Answer>> Parts(std::string_view text) {
  std::set<std::string_view> parts{std::string_view()};
  for (std::size_t from = 0; from < text.size(); ++from) {
    for (std::size_t length = 1; length <= text.size() - from; ++length) parts.insert(text.substr(from, length));
    if (parts.size() > zor::kSetLimit) return std::nullopt;
  }
  std::vector<Answer> found;
  found.reserve(parts.size());
  for (const std::string_view part : parts) found.push_back({ToZor(part), 0});
  return found;
}

bool AreDifferent(std::span<const Exact> values) {
  std::set<std::string_view> texts;
  return std::all_of(values.begin(), values.end(),
                     [&](const Exact& value) { return texts.insert(ToView(*value.text)).second; });
}

bool EndsWithSpace(const ZORString& text) { return ToView(text).ends_with(' '); }

}  // namespace

Semantics::Semantics(const Types& types)
    : mX(types, Sort::Text), mY(types, Sort::Text), mZ(types, Sort::Text), mLength(types, Sort::Integer) {
  for (int i = 0; i < kSorts; ++i) mForms.emplace_back(types, static_cast<Sort>(i));
}

bool Semantics::Compute(const Constraint& constraint, std::span<const Exact> inputs, Answer& result) {
  if (!constraint.kind->reified) return ComputeFunction(*constraint.kind, inputs, result);
  result.number = IsTrue(constraint, inputs) ? 1 : 0;
  return true;
}

// Operands are Exact, the greatest text too: the module would fold a Max by its state.
bool Semantics::ComputeFunction(const Kind& kind, std::span<const Exact> inputs, Answer& result) {
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
    case Meaning::Position:
      result.number = PositionOf(ToView(x), ToView(*inputs[1].text));
      return true;
    case Meaning::ReplaceFirst:
    case Meaning::ReplaceAll:
      result.text = Replace(ToView(x), ToView(*inputs[1].text), ToView(*inputs[2].text), kind.meaning);
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
// As the module does it, for nothing is tried more often.
ZORString Semantics::Joined(const ZORString& x, const ZORString& y) {
  return x.View().size() + y.View().size() > kTextLimit ? GreatestText() : ZORString::Concatenation(x, y);
}

ZORString Semantics::Fold(Meaning meaning, const ZORString& x, const ZORString& y) {
  if (meaning == Meaning::Concatenation) return Joined(x, y);
  mX.Text().SetExactValue(x);
  mY.Text().SetExactValue(y);
  mZ.Reset();
  if (meaning == Meaning::Maximum) {
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

bool Semantics::CanInvert(const Kind& kind, std::size_t position) {
  switch (kind.meaning) {
    case Meaning::Slice:
    case Meaning::Prefix:
    case Meaning::Suffix:
      return position == 0;
    case Meaning::Contains:
      return position == 1;
    case Meaning::Position:
    case Meaning::ReplaceAll:
      return position > 0;
    case Meaning::Matches:
      return false;
    default:
      return true;
  }
}

bool Semantics::IsManifold(const Kind& kind, std::size_t position) {
  const bool isFold = kind.meaning == Meaning::Lower || kind.meaning == Meaning::Upper;
  return position == 0 ? isFold && !kind.reified : kind.meaning == Meaning::Contains && !kind.reified;
}

Semantics::Answers Semantics::Invert(const Constraint& constraint, std::size_t position,
                                     std::span<const Exact> values) {
  if (!constraint.kind->reified) return InvertTrue(constraint, position, values);
  if (values.back().number == 0) return std::nullopt;
  return InvertTrue(constraint, position, values.first(values.size() - 1));
}

// Of what is true.
Semantics::Answers Semantics::InvertTrue(const Constraint& constraint, std::size_t position,
                                         std::span<const Exact> values) {
  const Kind& kind = *constraint.kind;
  const Exact& result = values.back();
  std::vector<Answer> proposals;
  if (!kind.IsRelation() && position + 1 == values.size()) {
    proposals.emplace_back();
    if (!ComputeFunction(kind, values.first(position), proposals.back())) proposals.clear();
    return proposals;
  }
  if (kind.IsOfNumbers()) return InvertNumber(kind, position, values);
  proposals.reserve(2);
  switch (kind.meaning) {
    case Meaning::Prefix:
    case Meaning::Suffix:
      return Ends(ToView(*values[1].text), kind.meaning);
    case Meaning::Contains:
      return Parts(ToView(*values[0].text));
    case Meaning::Position:
      if (result.number == -1) return std::nullopt;
      proposals = Starts(ToView(*values[0].text), result.number);
      return Filter(constraint, position, values, std::move(proposals));
    case Meaning::ReplaceFirst:
    case Meaning::ReplaceAll:
      return InvertReplacement(constraint, position, values);
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
      if (!Gives(constraint, position, {*result.text, 0}, values)) return proposals;
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
  return Filter(constraint, position, values, std::move(proposals));
}

// Those of the proposals that give the result, each once.
Semantics::Answers Semantics::Filter(const Constraint& constraint, std::size_t position, std::span<const Exact> values,
                                     std::vector<Answer> proposals) {
  auto found = proposals.begin();
  for (Answer& proposal : proposals) {
    const bool again = std::find(proposals.begin(), found, proposal) != found;
    if (!again && Gives(constraint, position, proposal, values)) std::swap(*found++, proposal);
  }
  proposals.erase(found, proposals.end());
  return proposals;
}

// What is replaced stood where the replacement stands now, or nowhere.
Semantics::Answers Semantics::InvertReplacement(const Constraint& constraint, std::size_t position,
                                                std::span<const Exact> values) {
  const ZORString& result = *values[3].text;
  const std::string_view z = ToView(result);
  if (result == GreatestText()) return std::nullopt;  // every text that is too long gives it
  std::vector<Answer> proposals;
  if (position == 0) {
    const std::string_view from = ToView(*values[1].text), to = ToView(*values[2].text);
    proposals.push_back({result, 0});
    for (std::size_t at = z.find(to); at != std::string_view::npos; at = z.find(to, at + 1)) {
      if (z.size() - to.size() + from.size() <= kTextLimit)
        proposals.push_back({ToZor(std::string(z.substr(0, at)).append(from).append(z.substr(at + to.size()))), 0});
    }
    return Filter(constraint, position, values, std::move(proposals));
  }
  const std::string_view x = ToView(*values[0].text);
  if (position == 1) {
    if (x == z) return std::nullopt;
    auto parts = Parts(x);
    if (!parts) return std::nullopt;
    proposals = std::move(*parts);
  } else {
    const std::string_view from = ToView(*values[1].text);
    const std::size_t count = CountReplaced(x, from, constraint.kind->meaning);
    if (count == 0) return x == z ? std::nullopt : std::optional(proposals);
    const std::size_t rest = x.size() - count * from.size();
    if (z.size() < rest) return proposals;
    proposals.push_back({ToZor(z.substr(x.find(from), (z.size() - rest) / count)), 0});
  }
  return Filter(constraint, position, values, std::move(proposals));
}

// The texts from one to another, both included.
Semantics::Answers Semantics::Between(const ZORString& lowest, const ZORString& highest) {
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
Semantics::Answers Semantics::InvertSlice(std::span<const Exact> values) {
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
bool Semantics::Gives(const Constraint& constraint, std::size_t position, const Answer& input,
                      std::span<const Exact> values) {
  mGiven.assign(values.begin(), values.end());
  mGiven[position].text = &input.text;
  mGiven[position].number = input.number;
  return IsTrue(constraint, mGiven);
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

// Of what is neither equality nor order.
bool Semantics::RelatesTexts(const Constraint& constraint, std::span<const Exact> values) {
  const std::string_view x = ToView(*values[0].text);
  const auto y = [&] { return ToView(*values[1].text); };
  switch (constraint.kind->meaning) {
    case Meaning::Prefix:
      return y().starts_with(x);
    case Meaning::Suffix:
      return y().ends_with(x);
    case Meaning::Contains:
      return x.find(y()) != std::string_view::npos;
    case Meaning::Matches:
      return constraint.expression->Matches(x);
    case Meaning::AllDifferent:
      return AreDifferent(values);
    default:
      return constraint.table->Has(values);
  }
}

// Whether the relation holds, or the function gives its last value.
bool Semantics::IsTrue(const Constraint& constraint, std::span<const Exact> values) {
  const Kind& kind = *constraint.kind;
  if (kind.IsComparison()) {
    const Exact &x = values[kind.mirrored ? 1 : 0], &y = values[kind.mirrored ? 0 : 1];
    return kind.IsOfNumbers() ? Relates(kind.meaning, x.number, y.number) : Relates(kind.meaning, *x.text, *y.text);
  }
  if (kind.IsRelation()) return RelatesTexts(constraint, values);
  Answer answer;
  if (!ComputeFunction(kind, values.first(values.size() - 1), answer)) return false;
  const Exact& result = values.back();
  return IsText(result.sort) ? answer.text == *result.text : answer.number == result.number;
}

bool Semantics::Holds(const Constraint& constraint, std::span<const Exact> values) {
  if (!constraint.kind->reified) return IsTrue(constraint, values);
  return IsTrue(constraint, values.first(values.size() - 1)) == (values.back().number != 0);
}

}  // namespace zornet
