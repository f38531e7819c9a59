#include "zornet/limits.h"

#include <fmt/core.h>

namespace zornet {

namespace {

std::string DescribeSet(const LimitMet& met, Sort sort) {
  const std::string_view values = IsText(sort) ? "texts" : "numbers";
  const std::string_view holder = sort == Sort::Integer ? "an int keeps" : "a set holds";
  if (met.count == 0) return fmt::format("more {} are possible than the {} that {}", values, met.most, holder);
  return fmt::format("{} {} exceed the {} that {}", met.count, values, met.most, holder);
}

std::string DescribeBudget(const LimitMet& met) {
  if (met.count == 0) return fmt::format("the combinations exceed the budget of {}", met.most);
  return fmt::format("{} combinations exceed the budget of {}", met.count, met.most);
}

}  // namespace

std::string_view NameOf(Limit limit) {
  switch (limit) {
    case Limit::Set:
      return "set";
    case Limit::Budget:
      return "budget";
    case Limit::Narrowings:
      return "narrowings";
    case Limit::Steps:
      return "steps";
    case Limit::Time:
      return "time";
    case Limit::Stop:
      return "interrupt";
  }
  return "";
}

std::string Describe(const LimitMet& met, Sort sort) {
  switch (met.limit) {
    case Limit::Set:
      return DescribeSet(met, sort);
    case Limit::Budget:
      return DescribeBudget(met);
    case Limit::Narrowings:
      return fmt::format("narrowed {} times in a row, and no further", met.most);
    case Limit::Steps:
      return fmt::format("the limit of {} steps came first", met.most);
    case Limit::Time:
      return "the time limit came first";
    case Limit::Stop:
      return "the run was interrupted first";
  }
  return "";
}

std::optional<Limit> EndOf(Outcome outcome) {
  switch (outcome) {
    case Outcome::StepLimit:
      return Limit::Steps;
    case Outcome::TimeLimit:
      return Limit::Time;
    case Outcome::Stopped:
      return Limit::Stop;
    default:
      return std::nullopt;
  }
}

LimitsByVariable LimitsOf(const Network& network) {
  LimitsByVariable limits;
  for (const LimitMet& met : network.LimitsMet()) limits.emplace(met.variable.index, met);
  return limits;
}

std::set<Limit> LimitsOf(const Network& network, Outcome outcome) {
  std::set<Limit> limits;
  for (const LimitMet& met : network.LimitsMet()) limits.insert(met.limit);
  if (const auto end = EndOf(outcome)) limits.insert(*end);
  return limits;
}

}  // namespace zornet
