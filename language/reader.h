// Reads a model, as docs/language.md describes it.
#pragma once

#include "language/diagnostics.h"
#include "language/files.h"
#include "language/inclusion.h"
#include "language/source.h"
#include "network/ZORModel.h"

namespace zornet {

// Where the parts of a model stand in its source: of a variable its name or constant, of a constraint all from its name
// to its closing parenthesis; and where it names files.
struct Places {
  std::vector<Extent> variables;
  std::vector<Extent> constraints;
  std::vector<Embedded> embedded;
};

// Adds the files that the model names to the source. The model is good when diagnostics has not failed.
struct ReadModel {
  Model model;
  Places places;
};
ReadModel Read(Source& source, Diagnostics& diagnostics, const Files& files = NoFiles());

}  // namespace zornet
