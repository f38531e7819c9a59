// Words and numbers in the text form of the number types.
#pragma once

#include <optional>
#include <string>

#include "host/ZORText.h"

namespace zorhost {

inline constexpr char kNilWord[] = "Nil";
inline constexpr char kAnyWord[] = "Any";

std::string ReadWord(ZORistrstream& in);               // the letters that come next behind white space
std::optional<ZORLong> ReadNumber(ZORistrstream& in);  // none when no number of 32 bits comes next
void PrintNumber(ZORostrstream& out, ZORLong value);

}  // namespace zorhost
