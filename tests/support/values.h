// Values as the tables of the tests write them: plain, printable, and made into values of the module for each call.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <climits>
#include <ostream>
#include <string>
#include <string_view>
#include <vector>

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

// A text as tables write it: a*254z is 254 times a, then z.
inline std::string Unpacked(std::string_view text) {
  std::string plain;
  while (!text.empty()) {
    const std::size_t end = std::min(text.find('*'), text.size());
    plain += text.substr(0, end);
    text.remove_prefix(std::min(end + 1, text.size()));
    int count = 0;
    for (; !text.empty() && std::isdigit(text[0]) != 0; text.remove_prefix(1)) count = 10 * count + text[0] - '0';
    if (count > 0) plain.append(count - 1, plain.back());
  }
  return plain;
}

// A single string.
struct Str {
  using Held = struct HeldSingle;
  static Str Parse(const std::string& notation);  // Nil, Any, Max, Min or a text
  bool HasEquals() const { return false; }
  Tag tag;
  std::string text;
  bool operator==(const Str&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Str& v) { return PrintValue(out, v.tag, v.text); }
};

inline Str Text(const std::string& text) { return {kExact, text}; }
inline Str Times(int count, char c, const std::string& tail = "") { return Text(std::string(count, c) + tail); }
inline const Str kNil{kNilTag, ""}, kAny{kAnyTag, std::string(256, 'z')}, kMax{kMaxTag, std::string(255, 'z')},
    kMin{kExact, " "};
inline Str Str::Parse(const std::string& notation) {
  if (notation == "Nil" || notation == "Any") return notation == "Nil" ? kNil : kAny;
  if (notation == "Max" || notation == "Min") return notation == "Max" ? kMax : kMin;
  return Text(Unpacked(notation));
}

struct HeldSingle {
  explicit HeldSingle(const Str& v) : value(Packed(v.text)) {
    ZORVadSingleString state;
    if (v.tag == kMaxTag) value.CalcMaxValue();
    if (v.tag == kNilTag) state.SetNilValue();
    if (v.tag == kNilTag || v.tag == kAnyTag) value = state;  // which leaves the text as it is
  }
  Str Now() const { return {value.GetState(), Plain(value.GetLowerBound())}; }
  std::vector<const ZORString*> Objects() const { return {}; }  // its text is no object of its own
  ZORVadSingleString& Typed() { return value; }
  ZORVaDoString& Abstract() { return value; }
  ZORVadSingleString value;
};

// A single integer.
struct Int {
  using Held = struct HeldInteger;
  static Int Parse(const std::string& notation);  // Nil, Any or a number
  Tag tag;
  ZORLong value = 0;
  bool operator==(const Int&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Int& v) {
    return v.tag == kExact ? out << v.value : out << (v.tag == kNilTag ? "Nil" : "Any");
  }
};

inline Int Number(ZORLong value) { return {kExact, value}; }
constexpr Int kNoNumber{kNilTag}, kAnyNumber{kAnyTag};
inline Int Int::Parse(const std::string& notation) {
  return notation == "Nil" ? kNoNumber : notation == "Any" ? kAnyNumber : Number(std::stoi(notation));
}

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

// A value of another class, by its text form. Operations take it as Base.
template <class Class, class Base>
struct Form {
  struct Held {
    explicit Held(const Form& v) {
      ZORistrstream in(v.form.c_str(), 0);
      value.InputValue(in);
    }
    Form Now() const {
      ZORostrstream out;
      value.PrintOn(out);
      return {std::string(out.View())};
    }
    Base& Typed() { return value; }
    Base& Abstract() { return value; }
    Class value;
  };
  static Form Parse(const char* notation) { return {notation}; }
  std::string form;
  bool operator==(const Form&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Form& v) { return out << v.form; }
};
using Truth = Form<ZORVadSingleBoolean, ZORVaDoBoolean>;
using HeldBoolean = Truth::Held;

// What the models do to a text.
template <char first, char last>
std::string Folded(std::string text) {
  for (char& c : text) c = c >= first && c <= last ? static_cast<char>(c ^ 0x20) : c;
  return text;
}
inline std::string Next(const std::string& s) {  // s itself where there is none
  if (s.size() < 255) return s + ' ';
  const std::size_t i = s.find_last_not_of('z');
  return i == std::string::npos ? s : s.substr(0, i) + static_cast<char>(s[i] + 1);
}
inline std::string Previous(const std::string& s) {  // of a text that is not empty
  std::string u = s.substr(0, s.size() - 1);
  if (s.back() != ' ') u += static_cast<char>(s.back() - 1);
  return u + std::string(u.size() < 255 ? 255 - u.size() : 0, 'z');
}

// A reference to nothing, as a caller passes it where an operand is missing.
template <class Value>
Value& Missing() {
  Value* volatile nothing = nullptr;
  return *nothing;
}

}  // namespace zor::test
