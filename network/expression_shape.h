// What a regular expression forces on the texts that match it.
#pragma once

#include <string_view>

#include "network/shape.h"

namespace zornet {

// Admits every text that matches the whole expression. Where it holds what this does not read, such as flags, anchors
// inside or classes by name, anything.
Shape ShapeOfExpression(std::string_view expression);

}  // namespace zornet
