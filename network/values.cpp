#include "network/values.h"

#include <fmt/format.h>

#include <algorithm>
#include <limits>
#include <memory>
#include <new>
#include <utility>

namespace zornet {

Types::Types(const ZORVaDoModule& strings, const ZORVaDoModule& numbers) {
  for (int i = 0; i < kSorts; ++i) {
    const auto sort = static_cast<Sort>(i);
    const ZORVaDoModule& module = IsText(sort) ? strings : numbers;
    const std::string name(NamesOf(sort).solver);
    const auto* descriptor = module.FindDescriptor(name.c_str());
    if (descriptor == nullptr)
      throw ModuleFailure(fmt::format("module {} has no type '{}'", ToView(module.GetName()), name));
    mDescriptors[static_cast<std::size_t>(i)] = descriptor;
  }
}

Value::Value(const Types& types, zornet::Sort sort) : Value(&types[sort], sort) {}

Value::Value(const ZORVaDoObjectDescriptor* descriptor, zornet::Sort sort)
    : mDescriptor(descriptor),
      mValue(static_cast<ZORVaDoAny*>(descriptor->CreateObject(::operator new(descriptor->GetObjectSize())))),
      mSort(sort) {}

Value::Value(const Value& other) : Value(other.mDescriptor, other.mSort) { mValue->Assign(*other.mValue); }

Value::~Value() {
  if (mValue == nullptr) return;
  void* const memory = dynamic_cast<void*>(mValue);  // where the whole object begins
  mDescriptor->DestroyObject(mValue);
  ::operator delete(memory);
}

Value::Value(Value&& other) noexcept
    : mDescriptor(other.mDescriptor), mValue(std::exchange(other.mValue, nullptr)), mSort(other.mSort) {}

Value& Value::operator=(Value other) noexcept {
  std::swap(mDescriptor, other.mDescriptor);
  std::swap(mValue, other.mValue);
  std::swap(mSort, other.mSort);
  return *this;
}

bool Value::IsOne() const {
  if (mSort == Sort::Text) return IsKnown();
  return IsKnown() && mValue->GetCardinality() == 1;
}

void Value::SetText(const ZORString& text) {
  if (mSort == Sort::Text && text == GreatestText()) {
    Text().CalcMaxValue();
  } else {
    Text().SetExactValue(text);
  }
}

// Filled text by text, a set becomes Any beyond zor::kSetLimit texts: larger sets are united from parts.
void Value::SetTexts(std::span<const ZORString> texts) {
  const auto fill = [](ZORVaDoString& value, std::span<const ZORString> part) {
    value.SetExactValue(part.front());
    for (const ZORString& text : part.subspan(1)) value.InsertExactValue(text);
  };
  const auto take = [&] {
    const auto part = texts.first(std::min(texts.size(), zor::kSetLimit));
    texts = texts.subspan(part.size());
    return part;
  };
  fill(Text(), take());
  while (!texts.empty()) {
    Value part(mDescriptor, mSort);
    fill(part.Text(), take());
    Any().Unite(part.Any());
  }
}

void Value::SetNumber(ZORLong number) {
  Reset();
  if (mSort == Sort::Boolean) {
    number != 0 ? Boolean().CalcTrueValue() : Boolean().CalcFalseValue();
  } else {
    Integer().SetExactValue(number);
  }
}

void Value::SetNumbers(const std::vector<ZORLong>& numbers) {
  if (numbers.empty()) return mValue->SetNilValue();
  if (mSort != Sort::IntegerSet || numbers.front() == numbers.back()) return SetRange(numbers.front(), numbers.back());
  ZORVadEnumInteger listed;
  listed.SetNilValue();
  for (const ZORLong number : numbers) listed.Insert(number);
  Any().Assign(listed);
}

void Value::SetRange(ZORLong lowest, ZORLong highest) {
  if (lowest == highest) return SetNumber(lowest);
  if (mSort == Sort::Interval) return Any().Assign(ZORVadIntervalInteger(lowest, highest));
  Reset();
}

// The module answers one space for the bounds of a set that lists "" alone.
ZORString Value::TextOfBound(ZORString bound) const {
  return mSort == Sort::TextSet && IsLeastSomewhere(bound) && Text().IsEmpty() ? ZORString() : std::move(bound);
}

ZORString Value::LowestText() const { return TextOfBound(Text().GetLowerBound()); }
ZORString Value::HighestText() const { return TextOfBound(Text().GetUpperBound()); }

// A text followed by a character less than the alphabet lies between that text and the next listed one, so asking from
// there gives the next. The last text comes from the upper bound: a set never answers it as the next one.
void Value::AddTexts(std::vector<ZORString>& texts) const {
  const std::size_t count = mSort == Sort::Text ? 1 : mValue->GetCardinality();
  const std::size_t end = texts.size() + count;
  texts.reserve(end);
  texts.push_back(LowestText());
  static const ZORString kBelowAlphabet("\x01");
  ZORString between;
  while (texts.size() + 1 < end) {
    between.Concatenate(texts.back(), kBelowAlphabet);
    texts.push_back(Text().GetNextExactValue(between));
  }
  if (count > 1) texts.push_back(HighestText());
}

std::vector<ZORString> Value::Texts() const {
  std::vector<ZORString> texts;
  AddTexts(texts);
  return texts;
}

ZORLong Value::LowestNumber() const {
  if (mSort == Sort::Boolean) return Boolean().CanBe(false) ? 0 : 1;
  return static_cast<ZORLong>(Integer().FindAtLeast(std::numeric_limits<ZORLong>::min()));
}

ZORLong Value::HighestNumber() const {
  if (mSort == Sort::Boolean) return Boolean().CanBe(true) ? 1 : 0;
  return static_cast<ZORLong>(Integer().FindAtMost(std::numeric_limits<ZORLong>::max()));
}

std::vector<ZORLong> Value::Numbers() const {
  std::vector<ZORLong> numbers;
  const std::int64_t last = HighestNumber();
  for (std::int64_t n = LowestNumber(); n <= last; n = Integer().FindAtLeast(n + 1)) {
    numbers.push_back(static_cast<ZORLong>(n));
  }
  return numbers;
}

std::string Value::Print() const {
  constexpr std::size_t kMarks = 4, kMost = 1 << 16;  // the quotes of a text, comma and space
  ZORostrstream out;
  if (IsText(mSort) && IsKnown())
    out.Reserve(std::min(kMost, kMarks + (LowestText().View().size() + kMarks) * Any().GetCardinality()));
  mValue->PrintOn(out);
  return out.Take();
}

std::string Value::Show() const {
  if (mSort == Sort::IntegerSet && IsOne()) return fmt::to_string(LowestNumber());
  if (!IsText(mSort) || !IsKnown()) return Print();
  const bool greatest = mSort == Sort::TextSet && HighestText() == GreatestText();
  std::string shown = greatest ? ShowWithMax() : Print();
  const std::size_t quoted = (mSort == Sort::Text ? 1 : mValue->GetCardinality()) - (greatest ? 1 : 0);
  const auto quotes = static_cast<std::size_t>(std::count(shown.begin(), shown.end(), '"'));
  if (quotes > 2 * quoted || shown.find('\\') != std::string::npos) return ShowEscaped();
  return shown;
}

// Prints the greatest text of a set as Max: the union of the greatest value and the rest.
std::string Value::ShowWithMax() const {
  Value shown(*this), rest(*this);
  shown.Text().CalcMaxValue();
  rest.Text().RemoveExactValue(GreatestText());
  shown.Any().Unite(rest.Any());
  return shown.Print();
}

// The module prints no escapes.
std::string Value::ShowEscaped() const {
  std::string shown;
  for (const ZORString& text : Texts())
    shown += (shown.empty() ? "" : ", ") + (text == GreatestText() ? "Max" : Quoted(ToView(text)));
  return IsOne() ? shown : "{ " + shown + " }";
}

}  // namespace zornet
