// The descriptors of the value types, made where their classes are defined: the entry names no folder above its own.
#pragma once

#include "host/ZORSolver.h"

namespace zor {

const ZORVaDoObjectDescriptor* MakeSingleDescriptor();
const ZORVaDoObjectDescriptor* MakeEnumDescriptor();

}  // namespace zor
