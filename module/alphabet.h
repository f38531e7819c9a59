// Steps in the order of texts.
#pragma once

#include <optional>

#include "host/ZORText.h"
#include "module/limits.h"

namespace zor {

// The least text above this one: a text below the limit grows by a space, one at the limit drops its trailing z and
// raises the character before them. None for a text at the limit of nothing but z.
std::optional<ZORString> Successor(const ZORString& text);

// A text of at least one character steps down at its last character and is filled with z up to the limit.
ZORString Predecessor(const ZORString& text);

}  // namespace zor
