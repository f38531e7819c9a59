// Sets of texts as the tables of the tests write them:
//   Nil  Any  Max  Min    the states that need no text, and "" alone
//   {a,b}  {a,b,Max}      the texts in any order, and the greatest beside them; {,a} begins with ""
//   Any{a}  Nil{a}        what Insert leaves of such a value
#pragma once

#include <algorithm>
#include <string>
#include <string_view>
#include <vector>

#include "enum/ZORVadEnumString.h"
#include "tests/support/check.h"

namespace zor::test {

struct Set {
  using Held = struct HeldSet;
  static Set Parse(const char* notation) { return notation; }
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

}  // namespace zor::test
