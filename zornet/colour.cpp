#include "zornet/colour.h"

#include <unistd.h>

#include <cstdlib>

namespace zornet {

namespace {

std::string_view Code(Style style) {
  switch (style) {
    case Style::Plain:
      return "";
    case Style::Bold:
      return "1";
    case Style::Faint:
      return "2";
    case Style::Error:
      return "1;31";
    case Style::Note:
      return "1;36";
    case Style::Caret:
      return "1;32";
    case Style::Name:
      return "1";
    case Style::Known:
      return "32";
    case Style::Open:
      return "33";
  }
  return "";
}

}  // namespace

std::string Paint::operator()(Style style, std::string text) const {
  const std::string_view code = Code(style);
  if (!mOn || code.empty()) return text;
  return "\x1b[" + std::string(code) + "m" + text + "\x1b[0m";
}

bool WantsColour(std::string_view when, int fileDescriptor) {
  if (when != "auto") return when == "always";
  const char* refused = std::getenv("NO_COLOR");
  return (refused == nullptr || *refused == '\0') && isatty(fileDescriptor) != 0;
}

}  // namespace zornet
