// What is wrong with a model, and where.
#pragma once

#include <string>
#include <vector>

#include "language/source.h"

namespace zornet {

struct Diagnostic {
  enum Severity { Error, Note };

  Severity severity;
  Extent extent;
  std::string message;
};

// Errors in the order in which they were found, each followed by its notes.
class Diagnostics {
 public:
  static constexpr std::size_t kErrorLimit = 20;

  // The middle of a long message is left out.
  void Error(Extent extent, std::string message);  // ignored beyond the limit
  void Note(Extent extent, std::string message);   // to the last error
  void Sort();                                     // into the order of their places
  bool Failed() const { return mErrors != 0; }
  bool Stopped() const { return mErrors > kErrorLimit; }  // there was an error beyond the limit
  const std::vector<Diagnostic>& All() const { return mAll; }

 private:
  std::vector<Diagnostic> mAll;
  std::size_t mErrors = 0;
};

}  // namespace zornet
