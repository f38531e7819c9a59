// A small host. Loads the module, narrows z = x + y, stores z and reads it back.
#include <iostream>
#include <memory>

#include "host/ZORPrint.h"
#include "module/ZORVaDoString.h"

// A value of any string type, in memory that the host provides.
class Value {
 public:
  explicit Value(const ZORVaDoObjectDescriptor* type)
      : mType(type),
        mPlace(::operator new(type->GetObjectSize())),
        mString(static_cast<ZORVaDoString*>(type->CreateObject(mPlace))) {}
  ~Value() {
    mType->DestroyObject(mString);
    ::operator delete(mPlace);
  }
  Value(const Value&) = delete;
  Value& operator=(const Value&) = delete;

  ZORVaDoString& operator*() const { return *mString; }
  ZORVaDoString* operator->() const { return mString; }

  void Input(const char* text) const {
    ZORistrstream in(text, 0);
    mString->InputValue(in);
  }

 private:
  const ZORVaDoObjectDescriptor* mType;
  void* mPlace;
  ZORVaDoString* mString;
};

static void Print(const char* name, const ZORVaDoObject& value) { std::cout << name << " = " << value << '\n'; }

int main() {
  ZORVaDoModuleManager manager;  // destroyed last: after the values and what was read
  const ZORVaDoModule* const module = manager.OpenModule("ZORVadStrings");
  if (module == nullptr) {
    std::cerr << manager.GetFailure() << '\n';
    return 1;
  }
  const ZORVaDoObjectDescriptor* const set = module->FindDescriptor("enum string");

  const Value x(set), y(set), z(set);  // each Any
  x.Input("{ \"north-\", \"south-\" }");
  y.Input("\"7\"");
  z.Input("{ \"north-7\", \"north-8\" }");
  std::cout << "answer " << z->CalcConcatenation(*x, *y) << ", again " << z->CalcConcatenation(*x, *y) << '\n';
  Print("z", *z);

  ZORopstream out;
  out.WriteObjectPointer(&*z);
  ZORipstream in(out.Bytes());
  const std::unique_ptr<ZORStreamable> read(in.ReadObjectPointer());
  ZORVaDoBase* const object = ZORVaDoBase::FromStream(read.get());
  if (in.Fail() || !ZORVaDoBase::IsKindOf(object, ZORVaDoObject::sIdent)) return 1;
  Print("read", *static_cast<ZORVaDoObject*>(object));
}
