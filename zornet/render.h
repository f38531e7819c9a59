// Errors of a model as people read them: file:line:column, the message, the line and a caret below it.
#pragma once

#include <string>
#include <string_view>

#include "language/diagnostics.h"

namespace zornet {

// Characters that are marked below the line: at least one, and no more than stand in it.
std::size_t MarkedLength(const Source& source, Extent extent);

// Control characters, also those that turn the direction of text, and stray bytes are shown as question marks: whoever
// names a file or writes a model must not act on a terminal.
std::string Harmless(std::string_view text);

// Of a long line the neighbourhood of what is marked.
std::string Render(const Source& source, const Diagnostics& diagnostics, bool colour);

}  // namespace zornet
