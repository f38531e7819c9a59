// Operations whose operands the input chooses.
#pragma once

#include <initializer_list>
#include <iterator>
#include <tuple>
#include <utility>

#include "fuzz/network.h"

namespace zor::fuzz {

constexpr std::size_t kMostOperands = 4;

// What an operation is run on. Its operands may coincide, or be a part of each other; to see that this makes no
// difference it is then run again on twins, which are copies for each operand alone.
struct Choices {
  Network& network;
  std::array<Network, kMostOperands>& twins;
  Bytes& bytes;

  template <class Value>
  Value* PickValue() {
    using Class = std::remove_const_t<Value>;
    return static_cast<Value*>(&network[kFirst<Class> + bytes.Below(kLast<Class> - kFirst<Class>)]);
  }
  Text PickText();
};

inline Text Choices::PickText() {
  static const std::string kTexts[] = {
      // clang-format off
      "", " ", "  ", "a", "b", "ab", "aB", "A", "B", "z", "{", "~", "\"", "\xff", "3", "a ", "ab ", "ac", "Max", "Nil",
      "2..9", "{ \"b\", \"a\" }", "{ \"a\", \"a\" }", "{ 1, 5 }", "\"ab\"", std::string(31, 'z'), std::string(32, 'a'),
      std::string(254, 'a'), std::string(255, 'a'), std::string(255, 'z'), std::string(256, 'z'), std::string(300, 'A'),
      std::string(254, 'z') + "y", std::string(253, 'a') + "zz", std::string(254, 'b') + ' ',
      // clang-format on
  };
  constexpr unsigned kOwn = 192;  // from here on the text stands in the input
  const unsigned choice = bytes.Next();
  const std::string text = choice < kOwn ? kTexts[choice % std::size(kTexts)] : bytes.Take(choice - kOwn);
  return Text(text.data(), text.size());
}

// An operand as an operation takes it. Where an abstract class is asked for it may be missing, unless it is Given.
//   Get, Apart       the operand, and its twin once Part has answered 1 for a copy without difference
//   Owner            the value that it is or is a part of, if any
//   Target, Twin     the value that the operation may change, if it is this operand, and its twin
//   IsKept           whether what only the caller can see is as it was
template <class Value>
struct Given {};

template <class Operand>
class Picked;

template <class Value>
class Picked<Given<Value>> {
 public:
  Picked(Choices& choices) : mValue(choices.PickValue<Value>()) {}
  Value& Get() const { return *mValue; }
  Value& Apart() const { return *mTwin; }
  bool Part(const Network& network, Network& twins) {
    if (mValue == nullptr) return true;
    Any& twin = twins[network.Find(mValue)];
    mTwin = static_cast<Value*>(&twin);
    return Reproduce(*mValue, twin);
  }
  const Any* Owner() const { return mValue; }
  const Any* Target() const { return std::is_const_v<Value> ? nullptr : mValue; }
  const Any* Twin() const { return std::is_const_v<Value> ? nullptr : mTwin; }
  bool IsKept() const { return true; }

 protected:
  Value* mValue;
  Value* mTwin = nullptr;
};

template <class Value>
class Picked<Value&> : public Picked<Given<Value>> {
 public:
  Picked(Choices& choices) : Picked<Given<Value>>(choices) {
    using Class = std::remove_const_t<Value>;
    constexpr bool kMayMiss =
        std::is_same_v<Class, String> || std::is_same_v<Class, Scalar> || std::is_same_v<Class, Any>;
    if (kMayMiss && choices.bytes.Below(16) == 15) this->mValue = nullptr;
  }
};

struct NoValue {
  bool Part(const Network&, Network&) { return true; }
  const Any* Owner() const { return nullptr; }
  const Any* Target() const { return nullptr; }
  const Any* Twin() const { return nullptr; }
  bool IsKept() const { return true; }
};

// A text of the caller's, or the very object that a set lists.
template <>
class Picked<const Text&> : public NoValue {
 public:
  Picked(Choices& choices) {
    const auto* const set = Set::DynamicCast(choices.PickValue<Any>());
    if (set != nullptr && set->Count() > 0) {
      mText = &set->GetValue(static_cast<int>(choices.bytes.Below(static_cast<std::size_t>(set->Count()))));
      mOwner = set;
    } else {
      mOwn = choices.PickText();
    }
    mWas = View(mOwn);
  }
  const Text& Get() const { return *mText; }
  const Text& Apart() const { return mOwn; }
  bool Part(const Network&, Network&) {
    mOwn = *mText;
    mWas = View(mOwn);
    return true;
  }
  const Any* Owner() const { return mOwner; }
  bool IsKept() const { return View(mOwn) == mWas; }

 private:
  Text mOwn;
  std::string mWas;
  const Text* mText = &mOwn;
  const Any* mOwner = nullptr;
};

template <>
class Picked<const Vector&> : public NoValue {
 public:
  Picked(Choices& choices) {
    for (std::size_t left = choices.bytes.Below(8); left > 0; --left) mVector.Add(new Text(choices.PickText()));
    mWas = Content();
  }
  ~Picked() { mVector.Flush(1); }
  const Vector& Get() const { return mVector; }
  const Vector& Apart() const { return mVector; }
  bool IsKept() const { return Content() == mWas; }

 private:
  std::vector<std::string> Content() const {
    std::vector<std::string> texts;
    for (unsigned i = 0; i < mVector.Count(); ++i) texts.emplace_back(View(*mVector[i]));
    return texts;
  }

  Vector mVector{3, 4u};
  std::vector<std::string> mWas;
};

template <>
class Picked<int> : public NoValue {
 public:
  Picked(Choices& choices) : mNumber(static_cast<signed char>(choices.bytes.Next())) {}
  int Get() const { return mNumber; }
  int Apart() const { return mNumber; }

 private:
  int mNumber;
};

constexpr int kNoAnswer = -1;

// An operation that was run, and perhaps run again on twins.
struct Call {
  const Any* self;
  const Any* target = nullptr;
  int answer = kNoAnswer;
  bool hasKept = true;
  bool isTwice = false;
  const Any* twin = nullptr;  // of the target
  int twinAnswer = kNoAnswer;
};

struct Operation {
  const char* name;
  unsigned licence;
  Call (*act)(Choices& choices);
};

inline bool AnyCoincide(std::initializer_list<const Any*> owners) {
  for (const Any* const* i = owners.begin(); i != owners.end(); ++i)
    if (*i != nullptr && std::find(i + 1, owners.end(), *i) != owners.end()) return true;
  return false;
}

inline const Any* FirstOf(std::initializer_list<const Any*> values) {
  const Any* const* const found = std::find_if(values.begin(), values.end(), [](const Any* v) { return v != nullptr; });
  return found != values.end() ? *found : nullptr;
}

template <class Body, class... Operands>
int AnswerOf(Operands&&... operands) {
  if constexpr (std::is_same_v<decltype(Body()(std::forward<Operands>(operands)...)), int>) {
    return Body()(std::forward<Operands>(operands)...);
  } else {
    Body()(std::forward<Operands>(operands)...);
    return kNoAnswer;
  }
}

template <class Operand>
Choices& ChoicesFor(Choices& choices) {
  return choices;
}

template <class Body, class... Operands>
Call Act(Choices& choices) {
  static_assert(sizeof...(Operands) <= kMostOperands);
  std::tuple<Picked<Operands>...> picked{ChoicesFor<Operands>(choices)...};
  return std::apply(
      [&](auto&... v) {
        Call call{&std::get<0>(picked).Get(), FirstOf({v.Target()...})};
        auto twins = choices.twins.begin();
        call.isTwice = AnyCoincide({v.Owner()...}) && (v.Part(choices.network, *twins++) && ...);
        call.answer = AnswerOf<Body>(v.Get()...);
        if (call.isTwice) {
          call.twinAnswer = AnswerOf<Body>(v.Apart()...);
          call.twin = FirstOf({v.Twin()...});
        }
        call.hasKept = (v.IsKept() && ...);
        return call;
      },
      picked);
}

template <class Self, class... Operands, class Body>
constexpr Operation Make(const char* name, unsigned licence, Body) {
  return {name, licence, Act<Body, Given<std::remove_reference_t<Self>>, Operands...>};
}

}  // namespace zor::fuzz
