// Reads a model: declarations `var TYPE: name [= VALUE];`, `constraint name(args);`, `output names;`, comments behind
// a percent sign. Names may be used ahead of their declaration.
#pragma once

#include "language/diagnostics.h"
#include "language/source.h"
#include "network/model.h"

namespace zornet {

// A model and where its parts stand in the source: of a variable its name or constant, of a constraint all from its
// name to its closing parenthesis.
struct ReadModel {
  Model model;
  std::vector<Extent> variables;
  std::vector<Extent> constraints;
};

// The model is good when diagnostics has not failed.
ReadModel Read(const Source& source, Diagnostics& diagnostics);

}  // namespace zornet
