// Circles of orders: a < b <= c < a. Narrowing would walk round them step by step, or not at all where nothing is
// known.
#pragma once

#include "network/ZORModel.h"

namespace zornet {

// A posted strict order whose two sides are ordered the other way round by others, so that nothing satisfies it: its
// number, or kNone. In time linear in the model (strong components by Tarjan).
int FindOrderCycle(const Model& model);

}  // namespace zornet
