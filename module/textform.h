// Text forms of both string classes: the words of the states, and texts in double quotes.
#pragma once

#include "module/ZORVaDoString.h"

namespace zor {

// Writes Nil, Any, Max or Min if value is one of them, and returns whether it is.
bool PrintWord(const ZORVaDoString& value, ZORostrstream& out);

// Skips white space and sets value to the word or the quoted text that follows, or to Nil when there is neither.
void InputWordOrText(ZORVaDoString& value, ZORistrstream& in);

// Reads the text after an opening quote, up to the closing one but at most kReadableLimit characters. There are no
// escapes; a zero character ends the text, too.
ZORString InputQuoted(ZORistrstream& in);

}  // namespace zor
