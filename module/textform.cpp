#include "module/textform.h"

#include "module/texts.h"

namespace {

constexpr unsigned int kWordLength = 3;

// At most kLimit characters, up to the delimiter.
template <unsigned int kLimit>
ZORString InputLine(ZORistrstream& in, char delimiter) {
  char line[kLimit + 1];
  line[0] = '\0';
  in.GetLine(line, kLimit, delimiter);
  return line;
}

void InputWord(ZORVaDoString& value, ZORistrstream& in) {
  const ZORString word = InputLine<kWordLength>(in, '\n');
  if (word == "Min") {
    value.CalcMinValue();
  } else if (word == "Max") {
    value.CalcMaxValue();
  } else if (word == "Any") {
    value.SetUndefinedValue();
  } else {
    value.SetNilValue();
  }
}

}  // namespace

bool zor::PrintWord(const ZORVaDoString& value, ZORostrstream& out) {
  const char* const word = value.IsNil()         ? "Nil"
                           : value.IsUndefined() ? "Any"
                           : value.IsFull()      ? "Max"
                           : value.IsEmpty()     ? "Min"
                                                 : nullptr;
  if (word != nullptr) out << word;
  return word != nullptr;
}

ZORString zor::InputQuoted(ZORistrstream& in) { return InputLine<zor::kReadableLimit>(in, '"'); }

void zor::InputWordOrText(ZORVaDoString& value, ZORistrstream& in) {
  in >> ws;
  const int next = in.Peek();
  if (next == 'M' || next == 'N' || next == 'A') return InputWord(value, in);
  if (next != '"') return value.SetNilValue();
  in.Ignore();
  value.SetExactValue(InputQuoted(in));
}
