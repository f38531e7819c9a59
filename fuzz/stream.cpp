// Stored networks from any bytes: the values by themselves, objects by value and by pointer, and what they refer to.
#include <memory>

#include "fuzz/support.h"

namespace {

using namespace zor::fuzz;

// An object that refers to others, itself among them.
class Node : public ZORStreamable {
 public:
  const char* CastableID() const override { return "Node"; }
  void Write(ZORopstream& out) const override {
    for (const ZORStreamable* object : mObjects) out.WriteObjectPointer(object);
  }
  void Read(ZORipstream& in) override {
    for (ZORStreamable*& object : mObjects) object = in.ReadObjectPointer();
  }

 private:
  ZORStreamable* mObjects[2] = {};
};
const ZORStreamableClass kNodeRecord(
    "Node", [](ZORStreamable* o) { return o != nullptr ? o : new Node; }, 0);

// Objects are asked for their type as a reader of networks does.
void CheckObject(ZORStreamable* object) {
  const auto* const value = ZORVaDoString::DynamicCast(ZORVaDoBase::FromStream(object));
  if (value != nullptr) Check(*value);
}

// A value is written as it was read.
template <class Value>
void Rewrite(const Value& value) {
  Check(value);
  ZORopstream out;
  value.Write(out);
  ZORipstream in(out.Bytes());
  Value again;
  again.Read(in);
  if (Form(again) != Form(value) || in.Fail() || in.Left() != 0) Fail(Form(value) + " comes back as " + Form(again));
}

template <class Value>
void ReadAlone(ZORipstream& in) {
  Value value;
  value.Read(in);
  Rewrite(value);
}

template <class Value>
void ReadByReference(ZORipstream& in) {
  Value value;
  Value::readRef(in, value);
  Check(value);
}

template <class Value>
void ReadByPointer(ZORipstream& in) {
  Value* value = nullptr;
  Value::readPtr(in, value);
  if (value != nullptr) Check(*value);
}

void ReadObject(ZORipstream& in) {
  ZORStreamable* object = nullptr;
  in.ReadObject(object);
  CheckObject(object);
  delete object;
}

void ReadObjectPointer(ZORipstream& in) { CheckObject(in.ReadObjectPointer()); }

constexpr void (*kReaders[])(ZORipstream& in) = {
    ReadAlone<ZORVadSingleString>,
    ReadAlone<ZORVadEnumString>,
    ReadObject,
    ReadByReference<ZORVadSingleString>,
    ReadObjectPointer,
    ReadByReference<ZORVadEnumString>,
    ReadByPointer<ZORVadSingleString>,
    ReadByPointer<ZORVadEnumString>,
    ReadByPointer<ZORVaDoString>,
};

// The bytes of a network, which has the same objects in the same order when it is read back from them.
std::string Stored(const std::vector<ZORStreamable*>& objects) {
  ZORopstream out;
  for (const ZORStreamable* object : objects) out.WriteObjectPointer(object);
  return out.Bytes();
}

void Delete(const ZORipstream& in) {
  for (ZORStreamable* object : in.Objects()) delete object;
}

void Restore(const std::vector<ZORStreamable*>& objects) {
  const std::string bytes = Stored(objects);
  ZORipstream in(bytes);
  for (std::size_t i = 0; i < objects.size(); ++i) in.ReadObjectPointer();
  if (in.Fail() || in.Left() != 0 || in.Objects().size() != objects.size()) Fail("a stored network cannot be read");
  if (Stored(in.Objects()) != bytes) Fail("a stored network reads as another one");
  Delete(in);
}

}  // namespace

// The input: how many reads, which, and behind them the stream.
int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const ModuleInUse kModule;
  Bytes bytes(data, size);
  Bytes reads(bytes);
  const std::size_t count = reads.Below(16);
  bytes.Take(count + 1);
  ZORipstream in(bytes.Rest());
  for (std::size_t i = 0; i < count; ++i) kReaders[reads.Below(std::size(kReaders))](in);
  if (!in.Fail()) Restore(in.Objects());
  Delete(in);
  return 0;
}
