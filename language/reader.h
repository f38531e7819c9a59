// Reads a model: declarations `var TYPE: name [= VALUE];`, `constraint name(args);`, `output names;`, comments behind
// a percent sign. Names may be used ahead of their declaration.
#pragma once

#include "language/diagnostics.h"
#include "language/source.h"
#include "network/ZORModel.h"

namespace zornet {

// Where the parts of a model stand in its source: of a variable its name or constant, of a constraint all from its name
// to its closing parenthesis.
struct Places {
  std::vector<Extent> variables;
  std::vector<Extent> constraints;
};

// The model is good when diagnostics has not failed.
struct ReadModel {
  Model model;
  Places places;
};
ReadModel Read(const Source& source, Diagnostics& diagnostics);

}  // namespace zornet
