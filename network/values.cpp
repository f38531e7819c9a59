#include "network/values.h"

#include <fmt/format.h>

#include <limits>
#include <memory>
#include <new>
#include <stdexcept>
#include <utility>

namespace zornet {

namespace {

const char* TypeName(Sort sort) {
  switch (sort) {
    case Sort::Text:
      return "single string";
    case Sort::TextSet:
      return "enum string";
    case Sort::Integer:
      return "single integer";
    case Sort::Interval:
      return "interval integer";
    case Sort::IntegerSet:
      return "enum integer";
    case Sort::Boolean:
      return "single boolean";
  }
  return "";
}

}  // namespace

Types::Types(const ZORVaDoModule& strings, const ZORVaDoModule& numbers) {
  for (int i = 0; i < kSorts; ++i) {
    const auto sort = static_cast<Sort>(i);
    const ZORVaDoModule& module = IsText(sort) ? strings : numbers;
    const auto* descriptor = module.FindDescriptor(TypeName(sort));
    if (descriptor == nullptr) {
      throw std::runtime_error(fmt::format("module {} has no type '{}'", ToView(module.GetName()), TypeName(sort)));
    }
    mDescriptors[static_cast<std::size_t>(i)] = descriptor;
  }
}

Value::Value(const Types& types, zornet::Sort sort) : Value(&types[sort], sort) {}

Value::Value(const ZORVaDoObjectDescriptor* descriptor, zornet::Sort sort)
    : mDescriptor(descriptor), mMemory(::operator new(descriptor->GetObjectSize())), mSort(sort) {
  mValue = static_cast<ZORVaDoAny*>(mDescriptor->CreateObject(mMemory));
}

Value::Value(const Value& other) : Value(other.mDescriptor, other.mSort) { mValue->Assign(*other.mValue); }

Value::~Value() {
  if (mMemory == nullptr) return;
  mDescriptor->DestroyObject(mValue);
  ::operator delete(mMemory);
}

Value::Value(Value&& other) noexcept
    : mDescriptor(other.mDescriptor),
      mMemory(std::exchange(other.mMemory, nullptr)),
      mValue(other.mValue),
      mSort(other.mSort) {}

Value& Value::operator=(Value other) noexcept {
  std::swap(mDescriptor, other.mDescriptor);
  std::swap(mMemory, other.mMemory);
  std::swap(mValue, other.mValue);
  std::swap(mSort, other.mSort);
  return *this;
}

bool Value::IsOne() const {
  if (mSort == Sort::Text) return IsKnown();
  return IsKnown() && mValue->GetCardinality() == 1;
}

void Value::Input(const std::string& textForm) {
  ZORistrstream in(textForm.data(), static_cast<int>(textForm.size()));
  mValue->InputValue(in);
}

void Value::SetText(const ZORString& text) {
  if (mSort == Sort::Text && text == GreatestText()) {
    Text().CalcMaxValue();
  } else {
    Text().SetExactValue(text);
  }
}

// By way of the stream form, which has no limit of texts and takes those of 255 characters, too long for the text form.
void Value::SetTexts(const std::vector<ZORString>& texts) {
  ZORopstream out;
  out << static_cast<ZORLong>(ZORVaDoString::ZorStringExact) << static_cast<ZORLong>(texts.size());
  for (const ZORString& text : texts) out.WriteString(text.CastToCharPtr());
  ZORipstream in(out.Bytes());
  mValue->Read(in);
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
  if (numbers.front() == numbers.back()) return SetNumber(numbers.front());
  if (mSort == Sort::Interval) return Input(fmt::format("{}..{}", numbers.front(), numbers.back()));
  if (mSort == Sort::IntegerSet) return Input(fmt::format("{{ {} }}", fmt::join(numbers, ", ")));
  Reset();
}

// The bounds of a set of "" alone are told as one space, as if it were a single value.
ZORString Value::LowestText() const {
  return mSort == Sort::TextSet && Text().IsEmpty() ? ZORString() : Text().GetLowerBound();
}

ZORString Value::HighestText() const {
  return mSort == Sort::TextSet && Text().IsEmpty() ? ZORString() : Text().GetUpperBound();
}

std::vector<ZORString> Value::Texts() const {
  std::vector<ZORString> texts;
  if (mSort == Sort::Text) return {LowestText()};
  ZORopstream out;
  mValue->Write(out);
  ZORipstream in(out.Bytes());
  ZORLong tag = 0, count = 0;
  in >> tag >> count;
  texts.reserve(static_cast<std::size_t>(count));
  for (ZORLong i = 0; i < count; ++i) {
    const std::unique_ptr<char[]> text(in.ReadString());
    texts.emplace_back(text.get());
  }
  return texts;
}

ZORLong Value::LowestNumber() const {
  if (mSort == Sort::Boolean) return mValue->IsUndefined() || Show() == "false" ? 0 : 1;
  return static_cast<ZORLong>(Integer().FindAtLeast(std::numeric_limits<ZORLong>::min()));
}

ZORLong Value::HighestNumber() const {
  if (mSort == Sort::Boolean) return mValue->IsUndefined() || Show() == "true" ? 1 : 0;
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
  ZORostrstream out;
  mValue->PrintOn(out);
  return std::string(out.View());
}

// A set that lists the greatest text shows it as Max: it is printed as the union of the greatest value and the rest.
std::string Value::Show() const {
  if (mSort != Sort::TextSet || !IsKnown() || HighestText() != GreatestText()) return Print();
  Value shown(*this), rest(*this);
  shown.Text().CalcMaxValue();
  rest.Text().RemoveExactValue(GreatestText());
  shown.Any().Unite(rest.Any());
  return shown.Print();
}

}  // namespace zornet
