// Reads a model: declarations `var TYPE: name [= VALUE];`, `constraint name(args);`, `output names;`, comments behind
// a percent sign. Names may be used ahead of their declaration.
#pragma once

#include "runner/diagnostics.h"
#include "runner/model.h"
#include "runner/source.h"

namespace zornet {

// The model is good when diagnostics has not failed.
Model Read(const Source& source, Diagnostics& diagnostics);

}  // namespace zornet
