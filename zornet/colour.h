// Colours for a terminal.
#pragma once

#include <string>
#include <string_view>

namespace zornet {

enum class Style { Plain, Bold, Faint, Error, Note, Caret, Name, Known, Open };

// Puts text into a style, or leaves it alone when colours are off.
class Paint {
 public:
  explicit Paint(bool on) : mOn(on) {}
  std::string operator()(Style style, std::string text) const;

 private:
  bool mOn;
};

// "auto": when the stream is a terminal and NO_COLOR is not set; "always"; "never".
bool WantsColour(std::string_view when, int fileDescriptor);

}  // namespace zornet
