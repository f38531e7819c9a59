#include "zornet/raw.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <deque>
#include <memory>

#include "module/operations.h"

namespace zornet {

namespace {

using Operands = std::array<ZORVaDoAny*, kMostArguments>;

// An operation that a constraint stands for.
struct Row {
  Meaning meaning;
  bool mirrored, reified;
  std::string_view order;  // the constraint's argument for each operand: first what it is called on
  std::string_view name;
};

// clang-format off
constexpr Row kRows[] = {
  {Meaning::Equal,          false, false, "01",   "CalcEqualValue"},
  {Meaning::Equal,          false, false, "01",   "CalcInverseEqualValue"},
  {Meaning::Unequal,        false, false, "01",   "CalcUnequalValue"},
  {Meaning::Unequal,        false, false, "01",   "CalcInverseUnequalValue"},
  {Meaning::Less,           false, false, "01",   "CalcLessValue"},
  {Meaning::Less,           false, false, "01",   "CalcInverseLessValue"},
  {Meaning::LessOrEqual,    false, false, "01",   "CalcLessOrEqualValue"},
  {Meaning::LessOrEqual,    false, false, "01",   "CalcInverseLessOrEqualValue"},
  {Meaning::Less,           true,  false, "01",   "CalcNotLessAndUnequalValue"},
  {Meaning::Less,           true,  false, "01",   "CalcInverseNotLessAndUnequalValue"},
  {Meaning::LessOrEqual,    true,  false, "01",   "CalcNotLessValue"},
  {Meaning::LessOrEqual,    true,  false, "01",   "CalcInverseNotLessValue"},
  {Meaning::Equal,          false, true,  "012",  "CalcIsEqual"},
  {Meaning::Less,           false, true,  "012",  "CalcIsLess"},
  {Meaning::LessOrEqual,    false, true,  "012",  "CalcIsLessOrEqual"},
  {Meaning::Concatenation,  false, false, "201",  "CalcConcatenation"},
  {Meaning::Concatenation,  false, false, "201",  "CalcFirstInverseConcatenation"},
  {Meaning::Concatenation,  false, false, "201",  "CalcSecondInverseConcatenation"},
  {Meaning::Slice,          false, false, "3012", "CalcSubString"},
  {Meaning::Slice,          false, false, "3012", "CalcFirstInverseSubString"},
  {Meaning::Slice,          false, false, "3012", "CalcSecondInverseSubString"},
  {Meaning::Slice,          false, false, "3012", "CalcThirdInverseSubString"},
  {Meaning::Length,         false, false, "01",   "CalcLength"},
  {Meaning::Length,         false, false, "01",   "CalcInverseLength"},
  {Meaning::Lower,          false, false, "10",   "CalcLowerValue"},
  {Meaning::Lower,          false, false, "10",   "CalcInverseLowerValue"},
  {Meaning::Upper,          false, false, "10",   "CalcUpperValue"},
  {Meaning::Upper,          false, false, "10",   "CalcInverseUpperValue"},
  {Meaning::Minimum,        false, false, "201",  "CalcMinValue"},
  {Meaning::Minimum,        false, false, "201",  "CalcFirstInverseMinValue"},
  {Meaning::Maximum,        false, false, "201",  "CalcMaxValue"},
  {Meaning::Maximum,        false, false, "201",  "CalcFirstInverseMaxValue"},
  {Meaning::Successor,      false, false, "10",   "CalcNextValue"},
  {Meaning::Successor,      false, false, "10",   "CalcInverseNextValue"},
  {Meaning::TextForm,       false, false, "10",   "CalcStringRepresentation"},
  {Meaning::TextForm,       false, false, "10",   "CalcInverseStringRepresentation"},
};
// clang-format on

// Two operations share a name only with different numbers of operands.
const zor::Operation& OperationOf(const Row& row) {
  return *std::find_if(std::begin(zor::kOperations), std::end(zor::kOperations), [&](const zor::Operation& operation) {
    return operation.name == row.name && operation.operands == row.order.size();
  });
}

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

  RawCall Call(int number, const Row& row) {
    const Constraint& constraint = mNetwork.GetModel().Constraints()[static_cast<std::size_t>(number)];
    const zor::Operation& operation = OperationOf(row);
    std::deque<Copy> constants;
    Operands operands{};
    for (std::size_t i = 0; i < row.order.size(); ++i) {
      const int variable = constraint.arguments[Position(row.order[i])];
      operands[i] = &mNetwork.Bare({variable});
      if (mNetwork.GetModel().Variables()[static_cast<std::size_t>(variable)].constant)
        operands[i] = constants.emplace_back(*operands[i]).Get();
    }
    const ZORVaDoAny& target = *operands[operation.target];
    RawCall call{number, Write(constraint, row), 0, Name(constraint, row.order[operation.target]), Print(target), "",
                 false};
    call.answer = operation.call(operands.data());
    call.failed = target.IsNil() != 0;
    call.after = Print(target);
    return call;
  }

 private:
  std::string Name(const Constraint& constraint, char position) const {
    return mNames.OfVariable(constraint.arguments[Position(position)]);
  }

  std::string Write(const Constraint& constraint, const Row& row) const {
    std::vector<std::string> arguments;
    for (const char position : row.order.substr(1)) arguments.push_back(Name(constraint, position));
    return fmt::format("{}.{}({})", Name(constraint, row.order.front()), row.name, fmt::join(arguments, ", "));
  }

  Network& mNetwork;
  const Names& mNames;
};

}  // namespace

void RunRaw(Network& network, const Names& names, const std::function<void(const RawCall&)>& told) {
  RawRun run(network, names);
  const std::vector<Constraint>& constraints = network.GetModel().Constraints();
  for (int c = 0; c < static_cast<int>(constraints.size()); ++c) {
    const Constraint& constraint = constraints[static_cast<std::size_t>(c)];
    const Kind& kind = *constraint.kind;
    if (kind.IsOfNumbers()) continue;  // the module's operations are those of texts
    for (const Row& row : kRows) {
      if (row.meaning == kind.meaning && row.mirrored == kind.mirrored && row.reified == kind.reified &&
          row.order.size() == constraint.arguments.size())
        told(run.Call(c, row));
    }
  }
}

}  // namespace zornet
