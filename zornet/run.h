// One run of the program, from its options to its exit code.
#pragma once

#include "zornet/options.h"

namespace zornet {

int Run(const Options& options);

}  // namespace zornet
