// The network as a graph in the language of Graphviz: variables with their values, constraints between them.
#pragma once

#include <string>

#include "zornet/report.h"

namespace zornet {

// Functions point from their arguments to their results; what became Nil is red.
std::string Graph(const Network& network, const Names& names);

}  // namespace zornet
