// The entry through which the solver takes this module into use.
#pragma once

#include "host/ZORSolver.h"

extern "C" {

// Opens "ZORVadNumbers", hands the descriptors of the single and of the enumerated string to module, in this order,
// and gives the text constants their values. Answers 1, or 0 with nothing registered when an argument is null or the
// numbers cannot be had.
ZOR_EXPORT int InitModule(ZORVaDoModule* module, ZORVaDoModuleManager* manager);

// Tells this module from others. Answers 1.
ZOR_EXPORT int TARVOS_WORKSHOP_BDK2_INTERNAL_ZORVadStrings();
}

// Gives ZorVaDoStringMin, ZorVaDoStringMax and ZorVaDoStringAny their texts. May be called again.
ZOR_EXPORT void InitStrings();
