// Text and stream forms of single strings.
#include "module/textform.h"
#include "single/ZORVadSingleString.h"

void ZORVadSingleString::PrintOn(ZORostrstream& out) const {
  if (!zor::PrintWord(*this, out)) out << '"' << mText.CastToCharPtr() << '"';
}

void ZORVadSingleString::InputValue(ZORistrstream& in) { zor::InputWordOrText(*this, in); }

// Returns 1 even if the text is the same as before.
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

// An unknown state and a missing text give Nil. Reading Undefined or Nil keeps the text.
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
