// Folds of texts, lower case and upper case: one algorithm with the fold as its parameter.
#pragma once

#include "host/ZORText.h"

namespace zor {

using Fold = void (ZORString::*)();

inline ZORString Folded(ZORString text, Fold fold) {
  (text.*fold)();
  return text;
}

// A text with a letter in the other case cannot be a fold.
inline bool IsFolded(const ZORString& text, Fold fold) { return text == Folded(text, fold); }

}  // namespace zor
