// The network as a graph in the language of Graphviz: variables with their values, constraints between them.
#pragma once

#include <string>

#include "zornet/report.h"

namespace zornet {

// Functions point from their arguments to their results; what became Nil is red. Constants stand in the labels of
// constraints, and a function of one variable is an edge. With an explanation only what takes part in it is drawn.
std::string Graph(const Network& network, const Names& names, const Explanation* explanation = nullptr);

}  // namespace zornet
