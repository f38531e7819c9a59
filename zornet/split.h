// Cuts a network into parts whose solutions are disjoint and together are all: each part is the model with some
// variables fixed.
#pragma once

#include <string>
#include <vector>

#include "network/ZORNetwork.h"

namespace zornet {

// The constraints that fix the variables of one part, each on a line, as models write them.
using Part = std::string;

// At least so many parts, or fewer when no more values can be told apart. None when there is no solution. Parts in
// which narrowing meets a contradiction are left out.
std::vector<Part> Split(const Model& model, const Limits& limits, const std::vector<std::string>& moduleFolders,
                        std::size_t parts);

}  // namespace zornet
