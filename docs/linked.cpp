// Links the module and narrows host = site + number.
#include <iostream>

#include "enum/ZORVadEnumString.h"
#include "host/ZORPrint.h"
#include "module/InitModule.h"

static void Print(const char* what, int answer, const ZORVaDoObject& value) {
  std::cout << what << ": " << answer << ", " << value << '\n';
}

int main() {
  InitStrings();  // a solver does this through InitModule
  ZORVadEnumString site(ZORString("north-")), number(ZORString("7")), host, machines(ZORString("north-7"));
  number.InsertExactValue("12");
  machines.InsertExactValue("south-7");

  Print("host = site + number", host.CalcConcatenation(site, number), host);
  Print("the same again", host.CalcConcatenation(site, number), host);
  Print("host = machines", host.CalcEqualValue(machines), host);
  Print("host = site", host.CalcEqualValue(site), host);
}
