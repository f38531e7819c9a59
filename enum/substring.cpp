// Substrings of sets of texts, which narrow nothing.
#include "enum/ZORVadEnumString.h"

// clang-format off
int ZORVadEnumString::CalcSubString             (const Enum&, const ZORVaDoInteger&, const ZORVaDoInteger&) { return 0; }
int ZORVadEnumString::CalcFirstInverseSubString (Enum&, const ZORVaDoInteger&, const ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcSecondInverseSubString(const Enum&, ZORVaDoInteger&, const ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcThirdInverseSubString (const Enum&, const ZORVaDoInteger&, ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcSubString             (const ZORVaDoString&, const ZORVaDoInteger&, const ZORVaDoInteger&) { return 0; }
int ZORVadEnumString::CalcFirstInverseSubString (ZORVaDoString&, const ZORVaDoInteger&, const ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcSecondInverseSubString(const ZORVaDoString&, ZORVaDoInteger&, const ZORVaDoInteger&) const { return 0; }
int ZORVadEnumString::CalcThirdInverseSubString (const ZORVaDoString&, const ZORVaDoInteger&, ZORVaDoInteger&) const { return 0; }
// clang-format on
