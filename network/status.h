#pragma once

namespace zornet {

// What a pass over a constraint leaves to do.
enum class Status {
  Subsumed,  // nothing: it holds whatever values are left
  Fixpoint,  // nothing until another constraint changes one of its variables
  Again,     // another pass after every change of its variables, its own changes included
};

}  // namespace zornet
