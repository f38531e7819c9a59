// The module's bare operations, for those who study them: each constraint of the file in turn, each of its operations
// once, straight on the variables. The answers are the module's, and not sound.
#pragma once

#include <functional>

#include "zornet/report.h"

namespace zornet {

// Leaves the values of the network as the operations left them.
void RunRaw(Network& network, const Names& names, const std::function<void(const RawCall&)>& told);

}  // namespace zornet
