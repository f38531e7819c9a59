// What the text forms of both string classes share: four words, texts in double quotes and the limit of input.
#pragma once

#include "module/ZORVaDoString.h"

namespace zor {

// Prints the word of a value that has one: Nil, Any, Min or Max. Answers whether it had.
bool PrintWord(const ZORVaDoString& value, ZORostrstream& out);

// Skips white space, reads a word or a text in quotes, and makes value what it says; Nil when there is neither.
void InputWordOrText(ZORVaDoString& value, ZORistrstream& in);

// Reads what follows an opening quote up to the closing one, at most 254 characters; there are no escapes, and a zero
// character ends the text too.
ZORString InputQuoted(ZORistrstream& in);

}  // namespace zor
