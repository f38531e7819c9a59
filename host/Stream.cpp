#include <algorithm>
#include <memory>
#include <new>
#include <utility>

#include "host/ZORText.h"

namespace {

constexpr int kBytes = sizeof(ZORLong);
constexpr int kNestingLimit = 1000;  // of objects in each other; a stored text must not exhaust the stack

constinit ZORStreamableClass* sFirstRecord = nullptr;
constinit ZORStreamableClass::Watcher sWatcher = nullptr;

enum ReferenceKind : ZORLong { kNullReference = 0, kFirstReference = 1 };

bool SameText(const char* a, const char* b) { return std::strcmp(a, b) == 0; }

}  // namespace

ZORStreamable::~ZORStreamable() = default;
void ZORStreamable::Write(ZORopstream&) const {}
void ZORStreamable::Read(ZORipstream&) {}

ZORStreamableClass::ZORStreamableClass(const char* text, Factory factory, int kind)
    : mText(text), mFactory(factory), mKind(kind), mNext(sFirstRecord) {
  sFirstRecord = this;
  if (sWatcher != nullptr) sWatcher(*this, true);
}

ZORStreamableClass::~ZORStreamableClass() {
  ZORStreamableClass** link = &sFirstRecord;
  while (*link != this) link = &(*link)->mNext;
  *link = mNext;
  if (sWatcher != nullptr) sWatcher(*this, false);
}

const ZORStreamableClass* ZORStreamableClass::Find(const char* text) {
  const ZORStreamableClass* record = sFirstRecord;
  while (record != nullptr && !SameText(record->mText, text)) record = record->mNext;
  return record;
}

void ZORStreamableClass::Watch(Watcher watcher) { sWatcher = watcher; }

ZORopstream::ZORopstream() = default;
ZORopstream::~ZORopstream() = default;

ZORopstream& ZORopstream::operator<<(ZORLong value) {
  auto bits = static_cast<std::uint32_t>(value);
  for (int i = 0; i < kBytes; ++i, bits >>= 8) mBytes.push_back(static_cast<char>(bits & 0xff));
  return *this;
}

void ZORopstream::WriteString(const char* text) {
  const std::string_view view = text != nullptr ? text : "";
  *this << static_cast<ZORLong>(view.size());
  mBytes.append(view);
}

void ZORopstream::WriteObject(const ZORStreamable* object) {
  WriteString(object != nullptr ? object->CastableID() : nullptr);
  if (object != nullptr) object->Write(*this);
}

void ZORopstream::WriteObjectPointer(const ZORStreamable* object) {
  if (object == nullptr) {
    *this << kNullReference;
    return;
  }
  const auto number = static_cast<ZORLong>(mObjects.size()) + kFirstReference;
  const auto [place, isNew] = mObjects.emplace(object, number);
  *this << place->second;
  if (isNew) WriteObject(object);
}

ZORipstream::ZORipstream(std::string bytes) : mBytes(std::move(bytes)) {}
ZORipstream::~ZORipstream() = default;

ZORipstream& ZORipstream::operator>>(ZORLong& value) {
  value = 0;
  if (mFail || Left() < kBytes) {
    mFail = true;
    return *this;
  }
  std::uint32_t bits = 0;
  for (int i = 0; i < kBytes; ++i) bits |= std::uint32_t{static_cast<unsigned char>(mBytes[mPosition++])} << (8 * i);
  value = static_cast<ZORLong>(bits);
  return *this;
}

char* ZORipstream::ReadString() {
  ZORLong length;
  *this >> length;
  if (length < 0 || static_cast<std::size_t>(length) > Left()) mFail = true;
  if (mFail) return nullptr;
  const auto count = static_cast<std::size_t>(length);
  char* text = new (std::nothrow) char[count + 1];
  if (text == nullptr) {
    mFail = true;
    return nullptr;
  }
  text[mBytes.copy(text, count, mPosition)] = '\0';
  mPosition += count;
  return text;
}

void ZORipstream::ReadObject(ZORStreamable*& object) {
  const std::unique_ptr<char[]> text(ReadString());
  if (text == nullptr) return;
  if (object == nullptr) object = Build(text.get());
  if (object == nullptr || !SameText(object->CastableID(), text.get())) {
    mFail = true;
    return;
  }
  ReadContent(*object);
}

ZORStreamable* ZORipstream::ReadObjectPointer() {
  ZORLong number;
  *this >> number;
  const auto known = static_cast<ZORLong>(mObjects.size());
  if (mFail || number == kNullReference) return nullptr;
  if (number < kFirstReference || number > known + kFirstReference) {
    mFail = true;
    return nullptr;
  }
  if (number < known + kFirstReference) return mObjects[static_cast<std::size_t>(number - kFirstReference)];
  const std::unique_ptr<char[]> text(ReadString());
  ZORStreamable* object = text != nullptr ? Build(text.get()) : nullptr;
  mObjects.push_back(object);  // before it is read: it may refer to itself
  if (object != nullptr) ReadContent(*object);
  return object;
}

ZORStreamable* ZORipstream::Build(const char* text) {
  const ZORStreamableClass* record = ZORStreamableClass::Find(text);
  ZORStreamable* object = record != nullptr ? record->Build() : nullptr;
  if (object == nullptr) mFail = true;
  return object;
}

void ZORipstream::ReadContent(ZORStreamable& object) {
  if (mNesting == kNestingLimit) mFail = true;
  ++mNesting;
  object.Read(*this);  // even after a failure: an object is not initialised before Read
  --mNesting;
}

char* ZORpstream::Str(int) { return mBuffer.data(); }

ZORostrstream::ZORostrstream() = default;
ZORostrstream::~ZORostrstream() = default;

ZORostrstream& ZORostrstream::operator<<(const char* text) {
  if (text != nullptr) mBuffer.append(text);
  return *this;
}

ZORostrstream& ZORostrstream::operator<<(char c) {
  mBuffer.push_back(c);
  return *this;
}

ZORistrstream::ZORistrstream(const char* text, int size)
    : mNext(text != nullptr ? text : ""),
      mEnd(mNext + (text != nullptr && size > 0 ? static_cast<std::size_t>(size) : std::strlen(mNext))) {}

ZORistrstream& ZORistrstream::operator>>(char& c) {
  c = mNext != mEnd ? *mNext++ : '\0';
  return *this;
}

int ZORistrstream::Peek() const { return mNext != mEnd ? static_cast<unsigned char>(*mNext) : kNoCharacter; }

void ZORistrstream::Ignore() {
  if (mNext != mEnd) ++mNext;
}

void ZORistrstream::GetLine(char* line, unsigned int limit, char delimiter) {
  if (line == nullptr || limit == 0) return;
  const char* stop = std::find(mNext, mNext + std::min<std::size_t>(limit, Left()), delimiter);
  *std::copy(mNext, stop, line) = '\0';
  mNext = stop;
  if (mNext != mEnd && *mNext == delimiter) ++mNext;
}

ZORistrstream& ws(ZORistrstream& in) {
  while (in.Peek() == ' ' || (in.Peek() >= '\t' && in.Peek() <= '\r')) in.Ignore();
  return in;
}
