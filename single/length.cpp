// Length of single strings, in characters.
#include "single/ZORVadSingleString.h"

int ZORVadSingleString::CalcLength(ZORVaDoInteger& n) const {
  if (IsNil()) return n.IsNil() ? 0 : (n.SetNilValue(), 1);
  if (IsUndefined()) return n.IsUndefined() ? 0 : (n.SetUndefinedValue(), 1);
  ZORVadSingleInteger length;
  length.SetExactValue(mText.GetLengthInChar());
  return n.CalcEqualValue(length);
}

int ZORVadSingleString::CalcInverseLength(const ZORVaDoInteger& n) {
  const auto* const length = ZORVadSingleInteger::DynamicCast(&n);
  if (length == nullptr || length->IsNil()) return Nil();  // other classes of integers are contradictions here
  if (length->IsUndefined()) return 0;
  if (length->GetValue() < 0) return Nil();
  if (IsNil() || IsUndefined()) return 0;
  if (length->GetValue() == mText.GetLengthInChar()) return 0;
  return Nil();
}
