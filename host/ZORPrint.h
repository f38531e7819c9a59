// Texts and values on a std::ostream.
#pragma once

#include <ostream>

#include "host/ZORSolver.h"

// The characters, without quotes.
inline std::ostream& operator<<(std::ostream& out, const ZORString& text) { return out << text.View(); }

// The text form: a text in quotes, Any, { 1, 2 }.
inline std::ostream& operator<<(std::ostream& out, const ZORVaDoObject& value) {
  ZORostrstream form;
  value.PrintOn(form);
  return out << form.View();
}
