// The entry point of this module.
#pragma once

#include "host/ZORSolver.h"

extern "C" {

// Called by the module manager. Opens "ZORVadNumbers", registers the descriptors "single string" and "enum string" with
// module, in this order, and calls InitStrings. Returns 1, or 0 with nothing registered when an argument is null or
// "ZORVadNumbers" cannot be opened.
ZOR_EXPORT int InitModule(ZORVaDoModule* module, ZORVaDoModuleManager* manager);

// Identifies this module. Returns 1.
ZOR_EXPORT int TARVOS_WORKSHOP_BDK2_INTERNAL_ZORVadStrings();
}

// Sets ZorVaDoStringMin, ZorVaDoStringMax and ZorVaDoStringAny. A program that links the module calls this before it
// makes a value; further calls do no harm.
ZOR_EXPORT void InitStrings();
