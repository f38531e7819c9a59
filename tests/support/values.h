// Values as the tables of the tests write them: plain, printable, and made into values of the module for each call.
#pragma once

#include <gtest/gtest.h>

#include <climits>
#include <ostream>
#include <string>

#include "host/ZORNumbers.h"
#include "single/ZORVadSingleString.h"

namespace zor::test {

using Tag = ZORVaDoString::ZORStringStateTag;
constexpr Tag kExact = ZORVaDoString::ZorStringExact, kAnyTag = ZORVaDoString::ZorStringAny,
              kNilTag = ZORVaDoString::ZorStringNil, kMaxTag = ZORVaDoString::ZorStringMax;

inline std::string Plain(const ZORString& text) {
  return {text.CastToCharPtr(), static_cast<std::size_t>(text.GetLengthInChar())};
}
inline ZORString Packed(const std::string& text) { return {text.data(), text.size()}; }

inline std::ostream& PrintValue(std::ostream& out, Tag tag, const std::string& text) {
  out << (tag == kExact ? "" : tag == kAnyTag ? "Any:" : tag == kNilTag ? "Nil:" : tag == kMaxTag ? "Max:" : "?:");
  if (text.size() <= 24) return out << '\'' << text << '\'';
  return out << '\'' << text.substr(0, 4) << "..." << text.substr(text.size() - 4) << "' (" << text.size() << ')';
}

// A single string.
struct Str {
  using Held = struct HeldSingle;
  Tag tag;
  std::string text;
  bool operator==(const Str&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Str& v) { return PrintValue(out, v.tag, v.text); }
};

inline Str Text(const std::string& text) { return {kExact, text}; }
inline Str Times(int count, char c, const std::string& tail = "") { return Text(std::string(count, c) + tail); }
inline const Str kNil{kNilTag, ""}, kAny{kAnyTag, std::string(256, 'z')}, kMax{kMaxTag, std::string(255, 'z')},
    kMin{kExact, " "};

struct HeldSingle {
  explicit HeldSingle(const Str& v) : value(Packed(v.text)) {
    ZORVadSingleString state;
    if (v.tag == kMaxTag) value.CalcMaxValue();
    if (v.tag == kNilTag) state.SetNilValue();
    if (v.tag == kNilTag || v.tag == kAnyTag) value = state;  // which leaves the text as it is
  }
  Str Now() const { return {value.GetState(), Plain(value.GetLowerBound())}; }
  ZORVadSingleString& Typed() { return value; }
  ZORVaDoString& Abstract() { return value; }
  ZORVadSingleString value;
};

// A single integer.
struct Int {
  using Held = struct HeldInteger;
  Tag tag;
  ZORLong value = 0;
  bool operator==(const Int&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Int& v) {
    return v.tag == kExact ? out << v.value : out << (v.tag == kNilTag ? "Nil" : "Any");
  }
};

inline Int Number(ZORLong value) { return {kExact, value}; }
constexpr Int kNoNumber{kNilTag}, kAnyNumber{kAnyTag};

struct HeldInteger {
  explicit HeldInteger(const Int& v) {
    if (v.tag == kExact) value.SetExactValue(v.value);
    if (v.tag == kNilTag) value.SetNilValue();
  }
  Int Now() const {
    if (value.IsNil() || value.IsUndefined()) return value.IsNil() ? kNoNumber : kAnyNumber;
    return Number(value.GetValue());
  }
  ZORVaDoInteger& Typed() { return value; }
  ZORVaDoInteger& Abstract() { return value; }
  ZORVadSingleInteger value;
};

// A truth value, by its text form.
struct Truth {
  using Held = struct HeldBoolean;
  std::string form;
  bool operator==(const Truth&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Truth& v) { return out << v.form; }
};

struct HeldBoolean {
  explicit HeldBoolean(const Truth& v) {
    ZORistrstream in(v.form.c_str(), 0);
    value.InputValue(in);
  }
  Truth Now() const {
    ZORostrstream out;
    value.PrintOn(out);
    return {std::string(out.View())};
  }
  ZORVaDoBoolean& Typed() { return value; }
  ZORVaDoBoolean& Abstract() { return value; }
  ZORVadSingleBoolean value;
};

// A reference to nothing, as a caller passes it where an operand is missing.
template <class Value>
Value& Missing() {
  Value* volatile nothing = nullptr;
  return *nothing;
}

}  // namespace zor::test
