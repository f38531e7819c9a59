// The least and the greatest character as static objects of the file that includes this, built before its other static
// objects: none of them depends on the initialisation order of files.
#pragma once

#include "module/texts.h"

static const ZORChar ZorVaDoCharMin(zor::kLeastCharacter);
static const ZORChar ZorVaDoCharMax(zor::kGreatestCharacter);
