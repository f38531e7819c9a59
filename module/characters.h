// The ends of the alphabet. Each source file that includes this has a pair of its own, built before the rest of its
// static objects, so that none of them depends on the order in which files come to life.
#pragma once

#include "module/texts.h"

static const ZORChar ZorVaDoCharMin(zor::kLeastCharacter);
static const ZORChar ZorVaDoCharMax(zor::kGreatestCharacter);
