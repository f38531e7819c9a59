// Text and stream forms of single strings.
#include "module/textform.h"
#include "single/ZORVadSingleString.h"

void ZORVadSingleString::PrintOn(ZORostrstream& out) const {
  if (!zor::PrintWord(*this, out)) out << '"' << mText.CastToCharPtr() << '"';
}

void ZORVadSingleString::InputValue(ZORistrstream& in) { zor::InputWordOrText(*this, in); }

// Answers 1 also when the text is the one that was there.
int ZORVadSingleString::CalcStringRepresentation(const ZORVaDoAny& x) {
  ZORostrstream out;
  x.PrintOn(out);
  out << '\0';
  const ZORString text = out.Str(0);
  out.Freeze(0);
  return Become(ZorStringExact, text);
}

int ZORVadSingleString::CalcInverseStringRepresentation(ZORVaDoAny& x) const {
  ZORistrstream in(mText.CastToCharPtr(), 0);
  x.InputValue(in);
  return 1;
}

void ZORVadSingleString::Write(ZORopstream& out) const {
  out << static_cast<ZORLong>(mState);
  if (mState == ZorStringExact) out.WriteString(mText.CastToCharPtr());
}

// A state that is none, like a text that is missing, gives Nil. The text of an Undefined or Nil value stays.
void ZORVadSingleString::Read(ZORipstream& in) {
  ZORLong state = ZorStringNil;
  in >> state;
  if (state == ZorStringAny || state == ZorStringNil) {
    mState = static_cast<ZORStringStateTag>(state);
    return;
  }
  if (state == ZorStringMax) {
    Become(ZorStringMax, ZorVaDoStringMax);
    return;
  }
  char* const text = state == ZorStringExact ? in.ReadString() : nullptr;
  if (text == nullptr) return SetNilValue();
  SetExactValue(text);
  delete[] text;
}
