// Text and stream forms of sets of texts.
#include "enum/ZORVadEnumString.h"
#include "module/textform.h"

void ZORVadEnumString::PrintOn(ZORostrstream& out) const {
  if (zor::PrintWord(*this, out)) return;
  if (Count() == 1 && mState != ZorStringMax) {
    out << '"' << First().CastToCharPtr() << '"';
    return;
  }
  out << "{ \"" << First().CastToCharPtr();
  for (unsigned int i = 1; i < mVector.Count(); ++i) out << "\", \"" << mVector[i]->CastToCharPtr();
  out << (mState == ZorStringMax ? "\", Max }" : "\" }");
}

void ZORVadEnumString::InputValue(ZORistrstream& in) {
  Flush();
  in >> ws;
  const int next = in.Peek();
  if (zor::BeginsWord(next)) {
    zor::InputWord(*this, in);
  } else if (next == '"') {
    in.Ignore();
    SetExactValue(zor::InputQuoted(in));
  } else if (next == '{') {
    in.Ignore();
    InputSet(in);
  } else {
    SetNilValue();
  }
}

// Texts in quotes with commas between them, up to the closing brace; in any order, and equal ones stay.
void ZORVadEnumString::InputSet(ZORistrstream& in) {
  mState = ZorStringExact;
  char next = '\0';
  do {
    in >> ws >> next;
    if (next != '"') return SetNilValue();
    auto* const text = new ZORString(zor::InputQuoted(in));
    Store(text, CountUpTo(*text));
    in >> ws >> next;
  } while (next == ',');
  if (next != '}') SetNilValue();
}

void ZORVadEnumString::Write(ZORopstream& out) const {
  out << static_cast<ZORLong>(mState);
  if (mState != ZorStringExact) return;
  out << static_cast<ZORLong>(Count());
  for (ZORISVectorIteratorImp_String text(mVector); text; ++text) out.WriteString(text.Current()->CastToCharPtr());
}

// A state that is none, an empty set and a text that is missing give Nil. Nothing is made for a count alone.
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
    auto* const text = new ZORString(characters);
    delete[] characters;
    Store(text, CountUpTo(*text));
    mState = ZorStringExact;
  }
}
