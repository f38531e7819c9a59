// What the fuzz targets share: bytes that make choices, what is in a value, and the invariants that hold for it.
#pragma once

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "enum/ZORVadEnumString.h"
#include "module/InitModule.h"

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

inline std::string_view View(const ZORString& text) {
  return {text.CastToCharPtr(), static_cast<std::size_t>(text.GetLengthInChar())};
}

inline std::string Form(const ZORVaDoObject& value) {
  ZORostrstream out;
  value.PrintOn(out);
  return std::string(out.View());
}

// All that an operation could change in a value.
struct Content {
  int state = 0;  // of a string; other values have their text form as their only text
  std::vector<std::string> texts;
  std::vector<const ZORString*> objects;

  bool operator==(const Content& other) const { return state == other.state && texts == other.texts; }

  std::string Show() const {
    std::string shown = std::to_string(state) + ':';
    for (const std::string& text : texts)
      shown += " '" + text.substr(0, 24) + (text.size() > 24 ? "' of " + std::to_string(text.size()) : "'");
    return shown;
  }
};

inline Content ContentOf(const ZORVaDoObject& value) {
  if (const auto* single = ZORVadSingleString::DynamicCast(&value))
    return {single->GetState(), {std::string(View(single->GetLowerBound()))}, {}};
  const auto* const set = ZORVadEnumString::DynamicCast(&value);
  if (set == nullptr) return {0, {Form(value)}, {}};
  Content content{set->GetState(), {}, {}};
  for (int i = 0; i < set->Count(); ++i) {
    content.objects.push_back(&set->GetValue(i));
    content.texts.emplace_back(View(set->GetValue(i)));
  }
  return content;
}

// What a string value tells about itself.
struct Aspects {
  bool isNil, isUndefined, isLeast, isGreatest;
  unsigned long cardinality;
  std::string lower, upper;

  bool operator==(const Aspects&) const = default;
};

inline Aspects AspectsOf(const ZORVaDoString& value) {
  return {value.IsNil() != 0,
          value.IsUndefined() != 0,
          value.IsEmpty() != 0,
          value.IsFull() != 0,
          value.GetCardinality(),
          std::string(View(value.GetLowerBound())),
          std::string(View(value.GetUpperBound()))};
}

inline const std::string kLeast = " ", kGreatest(255, 'z');

// The text of a single value is both its bounds, whatever the state.
inline Aspects SingleAspects(int state, const std::string& text) {
  const bool isNil = state == ZORVaDoString::ZorStringNil, isUndefined = state == ZORVaDoString::ZorStringAny;
  const bool isLeast = state == ZORVaDoString::ZorStringExact && text == kLeast;
  const unsigned long cardinality = isUndefined ? 255 : isNil ? 0 : 1;
  return {isNil, isUndefined, isLeast, state == ZORVaDoString::ZorStringMax, cardinality, text, text};
}

inline Aspects SetAspects(int state, const std::vector<std::string>& texts) {
  switch (state) {
    case ZORVaDoString::ZorStringNil:
      return {true, false, false, false, 0, "", ""};
    case ZORVaDoString::ZorStringAny:
      return {false, true, false, false, 256, kLeast, kGreatest};
    case ZORVaDoString::ZorStringMax:
      return {false, false, false, texts.empty(), texts.size(), texts.empty() ? kGreatest : texts.front(), kGreatest};
    default:
      break;
  }
  if (texts == std::vector<std::string>{""}) return {false, false, true, false, 1, kLeast, kLeast};
  return {false, false, false, false, texts.size(), texts.front(), texts.back()};
}

// What is wrong with a string value, empty when nothing is.
inline std::string Fault(const ZORVaDoObject& value, const Content& content) {
  const auto* const string = ZORVaDoString::DynamicCast(&value);
  if (string == nullptr) return "";
  if (content.state < ZORVaDoString::ZorStringExact || content.state > ZORVaDoString::ZorStringMax)
    return "a state that is none";
  const bool isSingle = ZORVadSingleString::DynamicCast(&value) != nullptr;
  if (isSingle && content.state == ZORVaDoString::ZorStringMax && content.texts[0] != kGreatest)
    return "a Max with another text";
  const bool isOpen = content.state == ZORVaDoString::ZorStringAny || content.state == ZORVaDoString::ZorStringNil;
  if (!isSingle && isOpen && !content.texts.empty()) return "texts in an Any or Nil set";
  if (content.state == ZORVaDoString::ZorStringExact && content.texts.empty()) return "an Exact set without texts";
  if (!std::is_sorted(content.texts.begin(), content.texts.end())) return "texts out of order";
  const Aspects due =
      isSingle ? SingleAspects(content.state, content.texts[0]) : SetAspects(content.state, content.texts);
  return AspectsOf(*string) == due ? "" : "tests or bounds that its state and texts belie";
}

}  // namespace zor::fuzz
