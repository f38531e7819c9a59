// What the text forms of both string classes share: four words, texts in double quotes and the limit of input.
#pragma once

#include "module/ZORVaDoString.h"

namespace zor {

// Prints the word of a value that has one: Nil, Any, Min or Max. Answers whether it had.
bool PrintWord(const ZORVaDoString& value, ZORostrstream& out);

// Whether a word begins with this character, as Peek answers it.
bool BeginsWord(int character);

// Reads three characters and makes value what they say, Nil when they are none of the other words.
void InputWord(ZORVaDoString& value, ZORistrstream& in);

// Reads what follows an opening quote up to the closing one, at most 254 characters; there are no escapes, and a zero
// character ends the text too.
ZORString InputQuoted(ZORistrstream& in);

}  // namespace zor
