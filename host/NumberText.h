// Words and numbers in the text forms of numbers and truth values.
#pragma once

#include <optional>
#include <string>

#include "host/ZORText.h"

namespace zorhost {

inline constexpr char kNilWord[] = "Nil";
inline constexpr char kAnyWord[] = "Any";

std::string ReadWord(ZORistrstream& in);               // skips white space, then takes the letters
std::optional<ZORLong> ReadNumber(ZORistrstream& in);  // none unless a 32-bit number follows
void PrintNumber(ZORostrstream& out, ZORLong value);

}  // namespace zorhost
