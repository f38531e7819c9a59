// Looking at the characters of a text where they are.
#pragma once

#include <string_view>

#include "host/ZORText.h"

namespace zor {

// Orders like the text itself; valid as long as the text stays as it is.
inline std::string_view View(const ZORString& text) {
  return {text.CastToCharPtr(), static_cast<std::size_t>(text.GetLengthInChar())};
}

}  // namespace zor
