// Sets of texts as the tables of the tests write them:
//   Nil  Any  Max  Min    the states that need no text, and "" alone
//   {a,b}  {a,b,Max}      the texts in any order, and the greatest beside them; {,a} begins with ""
//   Any{a}  Nil{a}        what Insert leaves of such a value
//   a*254z                254 times a, then z
#pragma once

#include <algorithm>
#include <cctype>
#include <string>
#include <string_view>
#include <vector>

#include "enum/ZORVadEnumString.h"
#include "tests/support/check.h"

namespace zor::test {

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
    PrintValue(out, v.tag, "") << " {";
    for (std::size_t i = 0; i < std::min<std::size_t>(v.texts.size(), 6); ++i)
      PrintValue(out << ' ', kExact, v.texts[i]);
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

inline Set Of(const ZORVadEnumString& value) {
  Set now{value.GetState(), {}};
  for (int i = 0; i < value.Count(); ++i) now.texts.push_back(Plain(value.GetValue(i)));
  return now;
}

inline std::string Printed(const ZORVaDoObject& value) {
  ZORostrstream out;
  value.PrintOn(out);
  return std::string(out.View());
}

struct HeldSet {
  explicit HeldSet(const Set& v) {
    if (v.tag == kNilTag || v.tag == kExact) value.SetNilValue();
    if (v.tag == kMaxTag) value.CalcMaxValue();
    // Equal texts go in while the value is Nil, the one after them gives the state.
    const std::size_t last = std::min<std::size_t>(v.texts.size() - 1, 200);
    for (std::size_t i = 0; i < v.texts.size(); ++i) {
      if (v.tag == kExact && i == last) {
        value.InsertExactValue(Packed(v.texts[i]));
      } else {
        value.Insert(Packed(v.texts[i]));
      }
    }
    EXPECT_EQ(Now(), v);
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

using SetRow = Row<0, Set, Set>;      // why, {z, x}, answer, z afterwards, second answer
using SetInverse = Row<1, Set, Set>;  // x afterwards
using SingleRow = Row<0, Set, Str>;   // x is a single string
using SingleInverse = Row<1, Set, Str>;
using SetsRow = Row<0, Set, Set, Set>;      // z, x, y
using SetsInverse = Row<1, Set, Set, Set>;  // x afterwards

// An operation on a value and a text, in one call.
struct TextRow {
  const char* why;
  Set z;
  const char* text;
  int answer;
  Set after;
};

template <std::size_t kCount, class Operation>
void CheckTexts(const TextRow (&rows)[kCount], Operation operation) {
  for (const auto& [why, z, text, answer, after] : rows) {
    HeldSet held(z);
    const ZORString given = Packed(Unpacked(text));
    EXPECT_EQ(operation(held.value, given), answer) << why;
    EXPECT_EQ(held.Now(), after) << why;
  }
}

// An operation by its name in one form alone, where the forms differ.
#define ZOR_ENTRY(Name) \
  [](auto& target, auto&... operands) { return ZORVaDoString::StaticCast(&target)->Name(AsString(operands)...); }
#define ZOR_TYPED(Name) [](auto& target, auto&... operands) { return AsSet(target).Name(AsSet(operands)...); }

inline ZORVaDoString& AsString(ZORVaDoString& value) { return value; }
inline ZORVadEnumString& AsSet(ZORVaDoString& value) { return *ZORVadEnumString::StaticCast(&value); }

}  // namespace zor::test
