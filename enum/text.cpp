// Text and stream forms of sets of texts.
#include "enum/ZORVadEnumString.h"
#include "module/textform.h"

void ZORVadEnumString::PrintOn(ZORostrstream& out) const {
  if (zor::PrintWord(*this, out)) return;
  if (Count() == 1 && mState != ZorStringMax) {
    out << '"' << mTexts.First().CastToCharPtr() << '"';
    return;
  }
  out << "{ \"" << mTexts.First().CastToCharPtr();
  for (unsigned int i = 1; i < mTexts.Count(); ++i) out << "\", \"" << mTexts[i].CastToCharPtr();
  out << (mState == ZorStringMax ? "\", Max }" : "\" }");
}

void ZORVadEnumString::InputValue(ZORistrstream& in) {
  in >> ws;
  if (in.Peek() != '{') return zor::InputWordOrText(*this, in);
  in.Ignore();
  InputSet(in);
}

// Quoted texts separated by commas, in any order, up to the closing brace. Equal texts are kept.
void ZORVadEnumString::InputSet(ZORistrstream& in) {
  Become(ZorStringExact);
  char next = '\0';
  do {
    in >> ws >> next;
    if (next != '"') return SetNilValue();
    mTexts.Insert(zor::InputQuoted(in), Texts::Equals::Accepted);
    in >> ws >> next;
  } while (next == ',');
  if (next != '}') SetNilValue();
}

int ZORVadEnumString::CalcStringRepresentation(const ZORVaDoAny&) { return 0; }
int ZORVadEnumString::CalcInverseStringRepresentation(ZORVaDoAny&) const { return 0; }

void ZORVadEnumString::Write(ZORopstream& out) const {
  out << static_cast<ZORLong>(mState);
  if (mState != ZorStringExact) return;
  out << static_cast<ZORLong>(Count());
  for (const ZORString* const text : mTexts.All()) out.WriteString(text->CastToCharPtr());
}

// An unknown state, an empty set and a missing text give Nil. The stored count reserves nothing: it is not trusted.
void ZORVadEnumString::Read(ZORipstream& in) {
  ZORLong state = ZorStringNil;
  in >> state;
  if (state == ZorStringAny || state == ZorStringMax) {
    Become(static_cast<ZORStringStateTag>(state));
    return;
  }
  SetNilValue();
  if (state != ZorStringExact) return;
  ZORLong count = 0;
  in >> count;
  for (; count > 0; --count) {
    char* const characters = in.ReadString();
    if (characters == nullptr) return SetNilValue();
    mTexts.Insert(ZORString(characters), Texts::Equals::Accepted);
    delete[] characters;
    mState = ZorStringExact;
  }
}
