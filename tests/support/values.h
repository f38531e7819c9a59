// Values as the tables of the tests write them: plain, printable, and made into objects of the module for each call.
#pragma once

#include <algorithm>
#include <cctype>
#include <deque>
#include <ostream>
#include <sstream>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "enum/ZORVadEnumString.h"
#include "host/ZORPrint.h"

namespace zor::test {

using Tag = ZORVaDoString::ZORStringStateTag;
constexpr Tag kExact = ZORVaDoString::ZorStringExact, kAnyTag = ZORVaDoString::ZorStringAny,
              kNilTag = ZORVaDoString::ZorStringNil, kMaxTag = ZORVaDoString::ZorStringMax;

inline std::string Plain(const ZORString& text) { return std::string(text.View()); }

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

inline std::ostream& Show(std::ostream& out, Tag tag, const std::string& text) {
  out << (tag == kExact ? "" : tag == kAnyTag ? "Any:" : tag == kNilTag ? "Nil:" : tag == kMaxTag ? "Max:" : "?:");
  if (text.size() <= 24) return out << '\'' << text << '\'';
  return out << '\'' << text.substr(0, 4) << "..." << text.substr(text.size() - 4) << "' (" << text.size() << ')';
}

// A single string. Notations: Nil, Any, Max, Min, or a text.
struct Str {
  using Held = struct HeldSingle;
  Tag tag = kAnyTag;
  std::string text = std::string(256, 'z');

  Str() = default;
  Str(Tag state, std::string held) : tag(state), text(std::move(held)) {}
  Str(const char* notation);  // NOLINT(google-explicit-constructor)
  bool operator==(const Str&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Str& v) { return Show(out, v.tag, v.text); }
};

inline Str Text(const std::string& text) { return {kExact, text}; }
inline Str Times(int count, char c, const std::string& tail = "") { return Text(std::string(count, c) + tail); }
inline const Str kNil{kNilTag, ""}, kAny, kMax{kMaxTag, std::string(255, 'z')}, kMin{kExact, " "};
inline Str::Str(const char* notation) : Str(Text(Unpacked(notation))) {
  for (const auto& [word, value] : {std::pair("Nil", kNil), {"Any", kAny}, {"Max", kMax}, {"Min", kMin}})
    if (std::string_view(word) == notation) *this = value;
}

// A set of texts. Notations:
//   Nil  Any  Max  Min    the states that need no text, and "" alone
//   {a,b}  {a,b,Max}      the texts in any order, and the greatest beside them; {,a} begins with ""
//   Any{a}  Nil{a}        what Insert leaves of such a value
struct Set {
  using Held = struct HeldSet;
  Tag tag = kAnyTag;
  std::vector<std::string> texts;

  Set() = default;
  Set(Tag state, std::vector<std::string> listed) : tag(state), texts(std::move(listed)) { Sort(); }
  Set(std::string_view notation) {  // NOLINT(google-explicit-constructor)
    const std::string_view word = notation.substr(0, notation.find('{'));
    tag = word == "Nil" ? kNilTag : word == "Any" ? kAnyTag : word == "Max" ? kMaxTag : kExact;
    if (word == "Min") texts = {""};
    notation.remove_prefix(word.size());
    while (notation.size() > 1) {  // the comma or brace before a text, and more
      notation.remove_prefix(1);
      const std::string_view text = notation.substr(0, notation.find_first_of(",}"));
      notation.remove_prefix(text.size());
      if (text == "Max") tag = kMaxTag;
      if (text != "Max") texts.push_back(Unpacked(text));
    }
    Sort();
  }
  Set(const char* notation) : Set(std::string_view(notation)) {}  // NOLINT(google-explicit-constructor)

  void Sort() { std::sort(texts.begin(), texts.end()); }
  bool HasEquals() const { return std::adjacent_find(texts.begin(), texts.end()) != texts.end(); }
  bool operator==(const Set&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Set& v) {
    Show(out, v.tag, "") << " {";
    for (std::size_t i = 0; i < std::min<std::size_t>(v.texts.size(), 6); ++i) Show(out << ' ', kExact, v.texts[i]);
    return out << " } of " << v.texts.size();
  }
};

// a0, a1, ... as the sets of many texts.
inline Set Many(int count, const std::string& head = "a") {
  Set set{kExact, {}};
  for (int i = 0; i < count; ++i) set.texts.push_back(head + std::to_string(i));
  set.Sort();
  return set;
}

// A single integer. Notations: Nil, Any, or a number.
struct Int {
  using Held = struct HeldInteger;
  Tag tag = kAnyTag;
  ZORLong value = 0;

  Int() = default;
  Int(ZORLong number) : tag(kExact), value(number) {}  // NOLINT(google-explicit-constructor)
  explicit Int(Tag state) : tag(state) {}
  bool operator==(const Int&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Int& v) {
    return v.tag == kExact ? out << v.value : out << (v.tag == kNilTag ? "Nil" : "Any");
  }
};

// A text that an operation takes as such.
struct Word {
  using Held = struct HeldWord;
  std::string text;

  Word(std::string held = "") : text(std::move(held)) {}    // NOLINT(google-explicit-constructor)
  Word(const char* notation) : text(Unpacked(notation)) {}  // NOLINT(google-explicit-constructor)
  bool operator==(const Word&) const = default;
  friend std::ostream& operator<<(std::ostream& out, const Word& v) { return Show(out, kExact, v.text); }
};

using Value = std::variant<Str, Set, Int, Word>;
inline std::ostream& operator<<(std::ostream& out, const Value& value) {
  return std::visit([&](const auto& v) -> std::ostream& { return out << v; }, value);
}

template <class Plain>
std::vector<Value> ListOf(std::initializer_list<Plain> values) {
  return {values.begin(), values.end()};
}

inline std::string ShownAs(const Value& value) {
  std::ostringstream out;
  out << value;
  return out.str();
}

inline Str Of(const ZORVadSingleString& value) { return {value.GetState(), Plain(value.GetLowerBound())}; }
inline Set Of(const ZORVadEnumString& value) {
  Set now{value.GetState(), {}};
  for (int i = 0; i < value.Count(); ++i) now.texts.push_back(Plain(value.GetValue(i)));
  return now;
}
inline Int Of(const ZORVadSingleInteger& value) {
  return value.IsNil() != 0 ? Int(kNilTag) : value.IsUndefined() != 0 ? Int() : Int(value.GetValue());
}

// The objects. Typed is what typed forms are called with, Abstract what the entries of the solver's table get.
struct HeldSingle {
  HeldSingle(const Str& v) : value(ZORString(v.text)) {  // NOLINT(google-explicit-constructor)
    ZORVadSingleString state;
    if (v.tag == kMaxTag) value.CalcMaxValue();
    if (v.tag == kNilTag) state.SetNilValue();
    if (v.tag == kNilTag || v.tag == kAnyTag) value = state;  // which leaves the text as it is
  }
  Str Now() const { return Of(value); }
  std::vector<const ZORString*> Objects() const { return {}; }  // its text is no object of its own
  ZORVadSingleString& Typed() { return value; }
  ZORVaDoString& Abstract() { return value; }
  ZORVadSingleString value;
};

struct HeldSet {
  HeldSet(const Set& v) {  // NOLINT(google-explicit-constructor)
    if (v.tag == kNilTag || v.tag == kExact) value.SetNilValue();
    if (v.tag == kMaxTag) value.CalcMaxValue();
    // Equal texts go in while the value is Nil, the one after them gives the state.
    const std::size_t last = std::min<std::size_t>(v.texts.size() - 1, 200);
    for (std::size_t i = 0; i < v.texts.size(); ++i) {
      if (v.tag == kExact && i == last) {
        value.InsertExactValue(v.texts[i]);
      } else {
        value.Insert(v.texts[i]);
      }
    }
  }
  Set Now() const { return Of(value); }
  std::vector<const ZORString*> Objects() const {
    std::vector<const ZORString*> objects;
    for (int i = 0; i < value.Count(); ++i) objects.push_back(&value.GetValue(i));
    return objects;
  }
  ZORVadEnumString& Typed() { return value; }
  ZORVaDoString& Abstract() { return value; }
  ZORVadEnumString value;
};

struct HeldInteger {
  HeldInteger(const Int& v) {  // NOLINT(google-explicit-constructor)
    if (v.tag == kExact) value.SetExactValue(v.value);
    if (v.tag == kNilTag) value.SetNilValue();
  }
  Int Now() const { return Of(value); }
  std::vector<const ZORString*> Objects() const { return {}; }
  ZORVaDoInteger& Typed() { return value; }
  ZORVaDoInteger& Abstract() { return value; }
  ZORVadSingleInteger value;
};

// The text itself, or one that a set lists.
struct HeldWord {
  HeldWord(const Word& v) : own(v.text) {}  // NOLINT(google-explicit-constructor)
  Word Now() const { return {Plain(own)}; }
  std::vector<const ZORString*> Objects() const { return {}; }
  const ZORString& Typed() const { return listed != nullptr ? *listed : own; }
  const ZORString& Abstract() const { return Typed(); }
  ZORString own;
  const ZORString* listed = nullptr;
};

using Object = std::variant<HeldSingle, HeldSet, HeldInteger, HeldWord>;  // in the order of Value
inline Value NowOf(const Object& object) {
  return std::visit([](const auto& held) { return Value(held.Now()); }, object);
}
inline std::vector<const ZORString*> ObjectsOf(const Object& object) {
  return std::visit([](const auto& held) { return held.Objects(); }, object);
}

// As the solver's table takes it; null for a word.
inline ZORVaDoAny* OperandOf(Object& object) {
  return std::visit(
      [](auto& held) -> ZORVaDoAny* {
        if constexpr (requires { held.value; }) return &held.value;
        return nullptr;
      },
      object);
}

// Objects where they stay: a copy of one would not be it.
class Objects {
 public:
  explicit Objects(const std::vector<Value>& values) {
    for (const Value& value : values)
      std::visit([&]<class Plain>(const Plain& v) { mHeld.emplace_back(std::in_place_type<typename Plain::Held>, v); },
                 value);
  }
  Object& operator[](std::size_t i) { return mHeld[i]; }
  void Replace(std::size_t i, const Value& value) {
    std::visit([&]<class Plain>(const Plain& v) { mHeld[i].emplace<typename Plain::Held>(v); }, value);
  }
  bool ShareTexts() const {
    std::vector<const ZORString*> all;
    for (const Object& object : mHeld)
      for (const ZORString* text : ObjectsOf(object)) all.push_back(text);
    std::sort(all.begin(), all.end());
    return std::adjacent_find(all.begin(), all.end()) != all.end();
  }

 private:
  std::deque<Object> mHeld;
};

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

// States and bounds, as the models see them.
namespace model {

inline const std::string kLeastText = " ", kGreatestText(255, 'z');

inline bool IsNil(const auto& v) { return v.tag == kNilTag; }
inline bool IsAny(const auto& v) { return v.tag == kAnyTag; }
inline bool IsMin(const Str& v) { return v == kMin; }
inline bool IsMax(const Str& v) { return v.tag == kMaxTag; }
inline bool IsMin(const Set& v) { return v.tag == kExact && v.texts == std::vector<std::string>{""}; }
inline bool IsMax(const Set& v) { return v.tag == kMaxTag && v.texts.empty(); }
inline std::string Lower(const Str& v) { return v.text; }
inline std::string Upper(const Str& v) { return v.text; }
inline std::string Lower(const Set& v) {
  if (IsNil(v)) return "";
  if (IsAny(v) || IsMin(v)) return kLeastText;
  return IsMax(v) ? kGreatestText : v.texts.front();
}
inline std::string Upper(const Set& v) {
  if (IsNil(v)) return "";
  if (IsMin(v)) return kLeastText;
  return IsAny(v) || v.tag == kMaxTag ? kGreatestText : v.texts.back();
}

}  // namespace model

// A reference to nothing, as a caller passes it where an operand is missing.
template <class Value>
Value& Missing() {
  Value* volatile nothing = nullptr;
  return *nothing;
}

}  // namespace zor::test
