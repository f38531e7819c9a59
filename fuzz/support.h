// What the fuzz targets share: bytes that make choices, what is in a value, and the invariants that hold for it.
#pragma once

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "module/InitModule.h"
#include "tests/support/values.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

namespace zor::fuzz {

[[noreturn]] inline void Fail(const std::string& what) {
  std::fprintf(stderr, "fuzz: %s\n", what.c_str());
  std::abort();
}

// A fuzz target keeps one of these for all its inputs.
class ModuleInUse {
 public:
  ModuleInUse() {
    if (InitModule(&mModule, &mManager) != 1) Fail("the module cannot be taken into use");
  }

 private:
  ZORVaDoModuleManager mManager;
  ZORVaDoModule mModule{ZORString("ZORVadStrings")};
};

// The input as a run of choices; behind its end every choice is 0.
class Bytes {
 public:
  Bytes(const std::uint8_t* data, std::size_t size) : mNext(data), mEnd(data + size) {}

  bool Ended() const { return mNext == mEnd; }
  unsigned Next() { return Ended() ? 0 : *mNext++; }
  std::size_t Below(std::size_t count) { return Next() % count; }
  std::string Take(std::size_t count) {
    const std::size_t taken = std::min(count, static_cast<std::size_t>(mEnd - mNext));
    mNext += taken;
    return {mNext - taken, mNext};
  }
  std::string Rest() { return Take(static_cast<std::size_t>(mEnd - mNext)); }

 private:
  const std::uint8_t* mNext;
  const std::uint8_t* mEnd;
};

inline std::string Form(const ZORVaDoObject& value) {
  std::ostringstream out;
  out << value;
  return out.str();
}

// What is wrong with a value, empty when nothing is: its tests and bounds must be those of its state and texts.
template <class String>
std::string FaultOf(const String& value) {
  const auto plain = test::Of(value);
  if (plain.tag < test::kExact || plain.tag > test::kMaxTag) return "a state that is none";
  const bool isOpen = test::model::IsNil(plain) || test::model::IsAny(plain);
  if constexpr (requires { plain.texts; }) {
    if (isOpen != plain.texts.empty() && plain.tag != test::kMaxTag) return "texts where none belong, or none";
    if (!std::is_sorted(plain.texts.begin(), plain.texts.end())) return "texts out of order";
  } else if (plain.tag == test::kMaxTag && plain.text != test::model::kGreatestText) {
    return "a Max with another text";
  }
  const bool isRight =
      (value.IsNil() != 0) == test::model::IsNil(plain) && (value.IsUndefined() != 0) == test::model::IsAny(plain) &&
      (value.IsEmpty() != 0) == test::model::IsMin(plain) && (value.IsFull() != 0) == test::model::IsMax(plain) &&
      test::Plain(value.GetLowerBound()) == test::model::Lower(plain) &&
      test::Plain(value.GetUpperBound()) == test::model::Upper(plain);
  return isRight ? "" : "tests or bounds that its state and texts belie";
}

inline void Check(const ZORVaDoObject& value) {
  const auto* const single = ZORVadSingleString::DynamicCast(&value);
  const auto* const set = ZORVadEnumString::DynamicCast(&value);
  const std::string fault = single != nullptr ? FaultOf(*single) : set != nullptr ? FaultOf(*set) : "";
  if (!fault.empty()) Fail(fault + ": " + Form(value));
}

}  // namespace zor::fuzz
