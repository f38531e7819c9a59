// The module's bare operations, for those who study them: each constraint of the file in turn, each of its operations
// once, straight on the variables, with what it answers. Nothing is made sound here.
#pragma once

#include <functional>

#include "network/values.h"
#include "zornet/report.h"

namespace zornet {

// Leaves the values in the store as the operations left them.
void RunRaw(Store& store, const Names& names, const std::function<void(const RawCall&)>& told);

}  // namespace zornet
