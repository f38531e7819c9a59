// Single values, and values of which nothing is known.
#include <array>
#include <cstddef>
#include <memory>
#include <new>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "bench/measure.h"
#include "bench/texts.h"
#include "enum/ZORVadEnumString.h"
#include "single/ZORVadSingleString.h"

namespace zor::bench {

namespace {

using benchmark::State;

constexpr std::size_t kValues = 16384;

// Values that the solver reaches through its table.
struct Module {
  static constexpr const char* kName = "module";
  using Value = ZORVadSingleString;
  static Value Make(const std::string& text) { return Value(text.c_str()); }
  static void Concatenate(ZORVaDoString& z, const ZORVaDoString& x, const ZORVaDoString& y) {
    benchmark::DoNotOptimize(z.CalcConcatenation(x, y));
  }
  static bool IsKnown(const Value& value) { return value.GetState() == ZORVaDoString::ZorStringExact; }
};

struct String {
  static constexpr const char* kName = "std::string";
  using Value = std::optional<std::string>;
  static Value Make(const std::string& text) { return text; }
  static void Concatenate(Value& z, const Value& x, const Value& y) {
    if (!z.has_value()) {
      z = *x + *y;
    } else if (*z != *x + *y) {
      z.reset();
    }
  }
  static bool IsKnown(const Value& value) { return value.has_value(); }
};

template <class Kind>
void Concatenate(State& state, bool known) {
  using Value = typename Kind::Value;
  TextMaker maker(1);
  std::vector<std::array<std::string, 2>> texts(kValues);
  std::vector<Value> x, y, z;
  for (auto& [head, tail] : texts) {
    head = maker.Next().substr(0, 4 + maker.Below(8));
    tail = maker.Letters(4 + maker.Below(12));
    x.push_back(Kind::Make(head));
    y.push_back(Kind::Make(tail));
  }
  const auto renew = [&] {
    z.clear();
    MendHeap();
    for (const auto& [head, tail] : texts) z.push_back(known ? Kind::Make(head + tail) : Value());
  };
  const auto left = [&] {
    std::size_t count = 0;
    for (const Value& value : z) count += Kind::IsKnown(value);
    return count;
  };
  Measure(
      state, kValues, renew, [&](std::size_t i) { Kind::Concatenate(z[i], x[i], y[i]); }, left);
}

// clang-format off
struct UnknownSingle { static constexpr const char* kName = "module";      using Value = ZORVadSingleString; };
struct UnknownString { static constexpr const char* kName = "std::string"; using Value = std::string; };
struct UnknownEnum   { static constexpr const char* kName = "module";      using Value = ZORVadEnumString; };
struct UnknownTree   { static constexpr const char* kName = "std::set";    using Value = std::set<std::string>; };
// clang-format on

template <class Kind>
void MakeUnknown(State& state) {
  using Value = typename Kind::Value;
  const std::unique_ptr<std::byte[]> memory(new std::byte[kValues * sizeof(Value)]);
  const auto make = [&](std::size_t i) {
    auto* value = new (memory.get() + i * sizeof(Value)) Value;
    benchmark::DoNotOptimize(value);
    value->~Value();
  };
  Measure(
      state, kValues, [] {}, make, [] { return 0; });
}

}  // namespace

void RegisterSingles() {
  Register<Module, String>("z = x + y, known", {1},
                           []<class Kind>(State& state, int) { Concatenate<Kind>(state, true); });
  Register<Module, String>("z = x + y, unknown", {1},
                           []<class Kind>(State& state, int) { Concatenate<Kind>(state, false); });
  const auto unknown = []<class Kind>(State& state, int) { MakeUnknown<Kind>(state); };
  Register<UnknownSingle, UnknownString>("unknown single, made and destroyed", {1}, unknown);
  Register<UnknownEnum, UnknownTree>("unknown set, made and destroyed", {1}, unknown);
}

}  // namespace zor::bench
