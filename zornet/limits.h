// The limits that were met, in words.
#pragma once

#include <map>
#include <optional>
#include <set>
#include <string>
#include <string_view>

#include "network/ZORNetwork.h"

namespace zornet {

std::string_view NameOf(Limit limit);

// "480 texts exceed the 256 that a set holds"
std::string Describe(const LimitMet& met, Sort sort);

// The limit that ended a run, if one did.
std::optional<Limit> EndOf(Outcome outcome);

using LimitsByVariable = std::multimap<int, LimitMet>;
LimitsByVariable LimitsOf(const Network& network);

// All that a run with that outcome met.
std::set<Limit> LimitsOf(const Network& network, Outcome outcome);

}  // namespace zornet
