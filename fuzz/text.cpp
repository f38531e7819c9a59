// Text input of every value type from any text, again while there is something left, and the way back.
#include "fuzz/support.h"

namespace {

using namespace zor::fuzz;

constexpr int kMostReads = 8;

// What was read prints as a text that reads as the same value.
template <class Value>
void Reread(const Value& value) {
  const std::string form = Form(value);
  ZORistrstream in(form.c_str(), static_cast<int>(form.size()));
  Value again;
  again.InputValue(in);
  if (Form(again) != Form(value) || in.Left() != 0) Fail(form + " reads as " + Form(again));
}

// A value tells nothing of what it held before.
template <class Value>
void InputLike(const Value& value, std::size_t left, ZORistrstream in) {
  Value fresh;
  fresh.InputValue(in);
  if (Form(fresh) != Form(value) || in.Left() != left) Fail("read as " + Form(value) + " or " + Form(fresh));
}

template <class Value>
void Input(const char* text, int size) {
  ZORistrstream in(text, size);
  Value value;
  std::size_t left = in.Left() + 1;
  for (int reads = 0; reads < kMostReads && in.Left() < left && in.Left() > 0; ++reads) {
    const ZORistrstream before = in;
    left = in.Left();
    value.InputValue(in);
    Check(value);
    InputLike(value, in.Left(), before);
    Reread(value);
  }
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const ModuleInUse kModule;
  if (size == 0) return 0;
  constexpr void (*kInputs[])(const char* text, int size) = {
      Input<ZORVadSingleString>,    Input<ZORVadEnumString>,  Input<ZORVadSingleInteger>,
      Input<ZORVadIntervalInteger>, Input<ZORVadEnumInteger>, Input<ZORVadSingleBoolean>,
  };
  for (const auto& input : kInputs) input(reinterpret_cast<const char*>(data), static_cast<int>(size));
  return 0;
}
