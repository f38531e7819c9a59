#include "zornet/raw.h"

#include <fmt/format.h>

#include <array>
#include <cstddef>
#include <deque>
#include <memory>

#include "host/ZORNumbers.h"
#include "module/ZORVaDoString.h"

namespace zornet {

namespace {

using Operands = std::array<ZORVaDoAny*, kMostArguments>;

struct Bare {
  Meaning meaning;
  bool mirrored, reified;
  std::string_view name;
  std::string_view form;  // argument positions: what it is called on, the arguments, behind the colon the target
  int (*call)(const Operands& v);
};

ZORVaDoString& S(ZORVaDoAny* value) { return static_cast<ZORVaDoString&>(*value); }
ZORVaDoInteger& I(ZORVaDoAny* value) { return static_cast<ZORVaDoInteger&>(*value); }
ZORVaDoBoolean& B(ZORVaDoAny* value) { return static_cast<ZORVaDoBoolean&>(*value); }
ZORVaDoAny& A(ZORVaDoAny* value) { return *value; }

// clang-format off
constexpr Bare kBare[] = {
  {Meaning::Equal, false, false, "CalcEqualValue",                   "01:0", [](const Operands& v) { return S(v[0]).CalcEqualValue(A(v[1])); }},
  {Meaning::Equal, false, false, "CalcInverseEqualValue",            "01:1", [](const Operands& v) { return S(v[0]).CalcInverseEqualValue(A(v[1])); }},
  {Meaning::Unequal, false, false, "CalcUnequalValue",               "01:0", [](const Operands& v) { return S(v[0]).CalcUnequalValue(A(v[1])); }},
  {Meaning::Unequal, false, false, "CalcInverseUnequalValue",        "01:1", [](const Operands& v) { return S(v[0]).CalcInverseUnequalValue(A(v[1])); }},
  {Meaning::Less, false, false, "CalcLessValue",                    "01:0", [](const Operands& v) { return S(v[0]).CalcLessValue(S(v[1])); }},
  {Meaning::Less, false, false, "CalcInverseLessValue",             "01:1", [](const Operands& v) { return S(v[0]).CalcInverseLessValue(S(v[1])); }},
  {Meaning::LessOrEqual, false, false, "CalcLessOrEqualValue",          "01:0", [](const Operands& v) { return S(v[0]).CalcLessOrEqualValue(A(v[1])); }},
  {Meaning::LessOrEqual, false, false, "CalcInverseLessOrEqualValue",   "01:1", [](const Operands& v) { return S(v[0]).CalcInverseLessOrEqualValue(A(v[1])); }},
  {Meaning::Less, true, false, "CalcNotLessAndUnequalValue",        "01:0", [](const Operands& v) { return S(v[0]).CalcNotLessAndUnequalValue(A(v[1])); }},
  {Meaning::Less, true, false, "CalcInverseNotLessAndUnequalValue", "01:1", [](const Operands& v) { return S(v[0]).CalcInverseNotLessAndUnequalValue(A(v[1])); }},
  {Meaning::LessOrEqual, true, false, "CalcNotLessValue",               "01:0", [](const Operands& v) { return S(v[0]).CalcNotLessValue(S(v[1])); }},
  {Meaning::LessOrEqual, true, false, "CalcInverseNotLessValue",        "01:1", [](const Operands& v) { return S(v[0]).CalcInverseNotLessValue(S(v[1])); }},

  {Meaning::Equal, false, true, "CalcIsEqual",                       "012:2", [](const Operands& v) { return S(v[0]).CalcIsEqual(A(v[1]), B(v[2])); }},
  {Meaning::Less, false, true, "CalcIsLess",                        "012:2", [](const Operands& v) { return S(v[0]).CalcIsLess(S(v[1]), B(v[2])); }},
  {Meaning::LessOrEqual, false, true, "CalcIsLessOrEqual",              "012:2", [](const Operands& v) { return S(v[0]).CalcIsLessOrEqual(A(v[1]), B(v[2])); }},

  {Meaning::Concatenation, false, false, "CalcConcatenation",              "201:2", [](const Operands& v) { return S(v[2]).CalcConcatenation(S(v[0]), S(v[1])); }},
  {Meaning::Concatenation, false, false, "CalcFirstInverseConcatenation",  "201:0", [](const Operands& v) { return S(v[2]).CalcFirstInverseConcatenation(S(v[0]), S(v[1])); }},
  {Meaning::Concatenation, false, false, "CalcSecondInverseConcatenation", "201:1", [](const Operands& v) { return S(v[2]).CalcSecondInverseConcatenation(S(v[0]), S(v[1])); }},
  {Meaning::Slice, false, false, "CalcSubString",              "3012:3", [](const Operands& v) { return S(v[3]).CalcSubString(S(v[0]), I(v[1]), I(v[2])); }},
  {Meaning::Slice, false, false, "CalcFirstInverseSubString",  "3012:0", [](const Operands& v) { return S(v[3]).CalcFirstInverseSubString(S(v[0]), I(v[1]), I(v[2])); }},
  {Meaning::Slice, false, false, "CalcSecondInverseSubString", "3012:1", [](const Operands& v) { return S(v[3]).CalcSecondInverseSubString(S(v[0]), I(v[1]), I(v[2])); }},
  {Meaning::Slice, false, false, "CalcThirdInverseSubString",  "3012:2", [](const Operands& v) { return S(v[3]).CalcThirdInverseSubString(S(v[0]), I(v[1]), I(v[2])); }},
  {Meaning::Length, false, false, "CalcLength",             "01:1", [](const Operands& v) { return S(v[0]).CalcLength(I(v[1])); }},
  {Meaning::Length, false, false, "CalcInverseLength",      "01:0", [](const Operands& v) { return S(v[0]).CalcInverseLength(I(v[1])); }},
  {Meaning::Lower, false, false, "CalcLowerValue",          "10:1", [](const Operands& v) { return S(v[1]).CalcLowerValue(S(v[0])); }},
  {Meaning::Lower, false, false, "CalcInverseLowerValue",   "10:0", [](const Operands& v) { return S(v[1]).CalcInverseLowerValue(S(v[0])); }},
  {Meaning::Upper, false, false, "CalcUpperValue",          "10:1", [](const Operands& v) { return S(v[1]).CalcUpperValue(S(v[0])); }},
  {Meaning::Upper, false, false, "CalcInverseUpperValue",   "10:0", [](const Operands& v) { return S(v[1]).CalcInverseUpperValue(S(v[0])); }},
  {Meaning::Minimum, false, false, "CalcMinValue",             "201:2", [](const Operands& v) { return S(v[2]).CalcMinValue(A(v[0]), A(v[1])); }},
  {Meaning::Minimum, false, false, "CalcFirstInverseMinValue", "201:0", [](const Operands& v) { return S(v[2]).CalcFirstInverseMinValue(A(v[0]), A(v[1])); }},
  {Meaning::Maximum, false, false, "CalcMaxValue",             "201:2", [](const Operands& v) { return S(v[2]).CalcMaxValue(A(v[0]), A(v[1])); }},
  {Meaning::Maximum, false, false, "CalcFirstInverseMaxValue", "201:0", [](const Operands& v) { return S(v[2]).CalcFirstInverseMaxValue(A(v[0]), A(v[1])); }},
  {Meaning::Successor, false, false, "CalcNextValue",          "10:1", [](const Operands& v) { return S(v[1]).CalcNextValue(S(v[0])); }},
  {Meaning::Successor, false, false, "CalcInverseNextValue",   "10:0", [](const Operands& v) { return S(v[1]).CalcInverseNextValue(S(v[0])); }},
  {Meaning::TextForm, false, false, "CalcStringRepresentation",        "10:1", [](const Operands& v) { return S(v[1]).CalcStringRepresentation(A(v[0])); }},
  {Meaning::TextForm, false, false, "CalcInverseStringRepresentation", "10:0", [](const Operands& v) { return S(v[1]).CalcInverseStringRepresentation(A(v[0])); }},
};
// clang-format on

std::size_t Position(char digit) { return static_cast<std::size_t>(digit - '0'); }

// A value of its own, so that a constant stays what it is.
class Copy {
 public:
  explicit Copy(const ZORVaDoAny& value)
      : mDescriptor(*value.GetDescriptor()),
        mMemory(std::make_unique<std::byte[]>(mDescriptor.GetObjectSize())),
        mValue(static_cast<ZORVaDoAny*>(mDescriptor.CreateObject(mMemory.get()))) {
    mValue->Assign(value);
  }
  ~Copy() { mDescriptor.DestroyObject(mValue); }
  Copy(const Copy&) = delete;
  Copy& operator=(const Copy&) = delete;

  ZORVaDoAny* Get() { return mValue; }

 private:
  const ZORVaDoObjectDescriptor& mDescriptor;
  std::unique_ptr<std::byte[]> mMemory;
  ZORVaDoAny* mValue;
};

std::string Print(const ZORVaDoAny& value) {
  ZORostrstream out;
  value.PrintOn(out);
  return std::string(out.View());
}

class RawRun {
 public:
  RawRun(Network& network, const Names& names) : mNetwork(network), mNames(names) {}

  RawCall Call(int number, const Bare& bare) {
    const Constraint& constraint = mNetwork.GetModel().Constraints()[static_cast<std::size_t>(number)];
    std::deque<Copy> constants;
    Operands operands{};
    for (int i = 0; i < constraint.kind->arity; ++i) {
      const auto at = static_cast<std::size_t>(i), variable = static_cast<std::size_t>(constraint.arguments[at]);
      operands[at] = &mNetwork.Bare({constraint.arguments[at]});
      if (mNetwork.GetModel().Variables()[variable].constant)
        operands[at] = constants.emplace_back(*operands[at]).Get();
    }
    const std::size_t colon = bare.form.find(':');
    const std::size_t target = Position(bare.form[colon + 1]);
    RawCall call{number, Write(constraint, bare), 0, NameOf(constraint, target), Print(*operands[target]), "", false};
    call.answer = bare.call(operands);
    call.failed = operands[target]->IsNil() != 0;
    call.after = Print(*operands[target]);
    return call;
  }

 private:
  std::string NameOf(const Constraint& constraint, std::size_t position) const {
    return mNames.OfVariable(constraint.arguments[position]);
  }

  std::string Write(const Constraint& constraint, const Bare& bare) const {
    std::vector<std::string> arguments;
    const std::string_view operands = bare.form.substr(0, bare.form.find(':'));
    for (const char digit : operands.substr(1)) arguments.push_back(NameOf(constraint, Position(digit)));
    return fmt::format("{}.{}({})", NameOf(constraint, Position(operands.front())), bare.name,
                       fmt::join(arguments, ", "));
  }

  Network& mNetwork;
  const Names& mNames;
};

}  // namespace

void RunRaw(Network& network, const Names& names, const std::function<void(const RawCall&)>& told) {
  RawRun run(network, names);
  const std::vector<Constraint>& constraints = network.GetModel().Constraints();
  for (int c = 0; c < static_cast<int>(constraints.size()); ++c) {
    const Kind& kind = *constraints[static_cast<std::size_t>(c)].kind;
    for (const Bare& bare : kBare) {
      if (bare.meaning == kind.meaning && bare.mirrored == kind.mirrored && bare.reified == kind.reified)
        told(run.Call(c, bare));
    }
  }
}

}  // namespace zornet
