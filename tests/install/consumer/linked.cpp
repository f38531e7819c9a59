// Links the module and narrows with its typed operations.
#include <initializer_list>
#include <iostream>

#include "enum/ZORVadEnumString.h"
#include "host/ZORPrint.h"
#include "module/InitModule.h"
#include "single/ZORVadSingleString.h"

// Where the debugger looks at the values, to show the same.
extern "C" __attribute__((noinline)) void Show(const ZORVaDoObject& value) { std::cout << value << '\n'; }

int main() {
  InitStrings();
  const ZORString text("abc");
  const ZORVadSingleString one(text), least(" "), outside("above thirty-one characters"), run(ZORString('z', 255));
  ZORVadSingleString any, nil, greatest, joined;
  nil.SetNilValue();
  greatest.CalcMaxValue();
  joined.CalcConcatenation(one, outside);

  const ZORVadEnumString alone(text), empty(ZORString(""));
  ZORVadEnumString set(ZORString("b")), full, open, unknown, contradiction;
  set.InsertExactValue("a");
  full.CalcMaxValue();
  open.CalcMaxValue();
  open.Append(set);
  contradiction.SetNilValue();

  for (const ZORVaDoObject* value :
       std::initializer_list<const ZORVaDoObject*>{&one, &least, &run, &any, &nil, &greatest, &joined, &alone, &empty,
                                                   &set, &full, &open, &unknown, &contradiction})
    Show(*value);
}
