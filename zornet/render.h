// Errors of a model as people read them: file:line:column, the message, the line and a caret below it.
#pragma once

#include <string>

#include "language/diagnostics.h"

namespace zornet {

// Characters that are marked below the line: at least one, and no more than stand in it.
std::size_t MarkedLength(const Source& source, Extent extent);

// Of a long line the neighbourhood of what is marked. Control characters are shown as question marks.
std::string Render(const Source& source, const Diagnostics& diagnostics, bool colour);

}  // namespace zornet
