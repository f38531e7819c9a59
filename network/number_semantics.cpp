// What functions of integers and truth values are. 64 bits hold any sum of a list and any product of two.
#include <algorithm>
#include <limits>

#include "network/semantics.h"

namespace zornet {

namespace {

std::int64_t Combine(Meaning meaning, std::int64_t x, std::int64_t y) {
  switch (meaning) {
    case Meaning::Sum:
      return x + y;
    case Meaning::Product:
      return x * y;
    case Meaning::Minimum:
      return std::min(x, y);
    default:
      return std::max(x, y);
  }
}

bool IsInteger(std::int64_t number) {
  return number >= std::numeric_limits<ZORLong>::min() && number <= std::numeric_limits<ZORLong>::max();
}

std::vector<Answer> Only(std::int64_t number) {
  if (!IsInteger(number)) return {};
  return {{ZORString(), static_cast<ZORLong>(number)}};
}

}  // namespace

bool Semantics::ComputeNumber(const Kind& kind, std::span<const Exact> inputs, Answer& result) {
  std::int64_t number = inputs[0].number;
  for (const Exact& input : inputs.subspan(1)) number = Combine(kind.meaning, number, input.number);
  result.number = static_cast<ZORLong>(number);
  return IsInteger(number);
}

Semantics::Answers Semantics::InvertNumber(const Kind& kind, std::size_t position, std::span<const Exact> values) {
  const std::int64_t result = values.back().number;
  std::optional<std::int64_t> others;
  for (std::size_t i = 0; i + 1 < values.size(); ++i) {
    if (i != position) others = others ? Combine(kind.meaning, *others, values[i].number) : values[i].number;
  }
  if (!others) return Only(result);
  switch (kind.meaning) {
    case Meaning::Sum:
      return Only(result - *others);
    case Meaning::Product:
      if (*others == 0 && result == 0) return std::nullopt;
      return *others != 0 && result % *others == 0 ? Only(result / *others) : std::vector<Answer>();
    default:
      if (result == *others) return std::nullopt;  // and so does everything beyond it
      return Combine(kind.meaning, result, *others) == result ? Only(result) : std::vector<Answer>();
  }
}

}  // namespace zornet
