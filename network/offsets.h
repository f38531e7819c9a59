// Integers that differ by a constant, as x + 1 = y says. Narrowing would count through all integers where such
// constraints contradict each other: x + 1 = y and y + 1 = x.
#pragma once

#include "network/ZORModel.h"

namespace zornet {

// A posted constraint that two integers at the distance given by others do not satisfy: its number, or kNone. In time
// nearly linear in the model (disjoint sets with offsets).
int FindOffsetConflict(const Model& model);

}  // namespace zornet
