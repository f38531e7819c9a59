// The limits of the domain.
#pragma once

#include <cstddef>

namespace zor {

constexpr int kLengthLimit = 255;       // characters of the longest text
constexpr std::size_t kSetLimit = 256;  // texts of a set that grows through InsertExactValue

}  // namespace zor
