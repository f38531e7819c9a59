// Who does the work: the module, what a user would write instead, and the floor. Each kind has the same operations
// under the same names on sets of its own.
#pragma once

#include <absl/container/btree_set.h>
#include <benchmark/benchmark.h>

#include <algorithm>
#include <boost/container/flat_set.hpp>
#include <cstring>
#include <iterator>
#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

#include "bench/texts.h"
#include "enum/ZORVadEnumString.h"

namespace zor::bench {

struct Module {
  static constexpr const char* kName = "module";
  using Text = ZORString;
  using Set = ZORVadEnumString;

  static Text Make(const std::string& text) { return {text.data(), text.size()}; }
  static std::size_t Size(const Set& set) { return static_cast<std::size_t>(set.Count()); }
  static void Build(Set& set, const std::vector<Text>& texts) {
    set.SetExactValue(texts[0]);
    for (std::size_t i = 1; i < texts.size(); ++i) set.Insert(texts[i]);
  }
  static void Intersect(Set& target, const Set& other) { target.Intersect(other); }
  static void Unite(Set& target, const Set& other) { target.Unite(other); }
  static bool Contains(const Set& set, const Text& text) { return set.Contains(text) != 0; }
  static void Cut(Set& set, const Text& lower, const Text& upper) {
    set.CutLower(lower);
    set.CutUpper(upper);
  }
  static void Concatenate(Set& target, const Set& x, const Set& y) { target.CalcConcatenation(x, y); }
  static void Fold(Set& target, const Set& x) { target.CalcLowerValue(x); }
};

// The standard set algorithms on a container that is kept in order; an empty target stands for an unknown one.
template <class Container>
struct Standard {
  using Text = std::string;
  using Set = Container;
  static constexpr bool kIsVector = std::is_same_v<Set, std::vector<std::string>>;

  static Text Make(const std::string& text) { return text; }
  static std::size_t Size(const Set& set) { return set.size(); }
  static void Insert(Set& set, std::string text) {
    if constexpr (kIsVector) {
      set.push_back(std::move(text));
    } else {
      set.insert(std::move(text));
    }
  }
  static void Sort(Set& set) {
    if constexpr (kIsVector) {
      std::sort(set.begin(), set.end());
      set.erase(std::unique(set.begin(), set.end()), set.end());
    }
  }
  static void Build(Set& set, const std::vector<Text>& texts) {
    for (const Text& text : texts) Insert(set, text);
    Sort(set);
  }
  static void Intersect(Set& target, const Set& other) {
    Set result;
    std::set_intersection(target.begin(), target.end(), other.begin(), other.end(),
                          std::inserter(result, result.end()));
    target = std::move(result);
  }
  static void Unite(Set& target, const Set& other) {
    Set result;
    std::set_union(target.begin(), target.end(), other.begin(), other.end(), std::inserter(result, result.end()));
    target = std::move(result);
  }
  static bool Contains(const Set& set, const Text& text) {
    if constexpr (kIsVector) {
      return std::binary_search(set.begin(), set.end(), text);
    } else {
      return set.find(text) != set.end();
    }
  }
  static void Cut(Set& set, const Text& lower, const Text& upper) {
    if constexpr (kIsVector) {
      set.erase(set.begin(), std::lower_bound(set.begin(), set.end(), lower));
      set.erase(std::upper_bound(set.begin(), set.end(), upper), set.end());
    } else {
      set.erase(set.begin(), set.lower_bound(lower));
      set.erase(set.upper_bound(upper), set.end());
    }
  }
  static void Meet(Set& target, Set candidates) {
    Sort(candidates);
    if (target.empty()) {
      target = std::move(candidates);
    } else {
      Intersect(target, candidates);
    }
  }
  static void Concatenate(Set& target, const Set& x, const Set& y) {
    Set candidates;
    for (const std::string& head : x) {
      for (const std::string& tail : y) Insert(candidates, head + tail);
    }
    Meet(target, std::move(candidates));
  }
  static void Fold(Set& target, const Set& x) {
    Set candidates;
    for (std::string text : x) {
      for (char& c : text) c = c >= 'A' && c <= 'Z' ? static_cast<char>(c + ('a' - 'A')) : c;
      Insert(candidates, std::move(text));
    }
    Meet(target, std::move(candidates));
  }
};

// clang-format off
struct Tree   : Standard<std::set<std::string>>                  { static constexpr const char* kName = "std::set"; };
struct Vector : Standard<std::vector<std::string>>               { static constexpr const char* kName = "vector"; };
struct Flat   : Standard<boost::container::flat_set<std::string>> { static constexpr const char* kName = "flat_set"; };
struct BTree  : Standard<absl::btree_set<std::string>>           { static constexpr const char* kName = "btree_set"; };
// clang-format on

// A pointer to a text of its own.
struct Own : std::unique_ptr<const std::string> {
  using std::unique_ptr<const std::string>::unique_ptr;
  explicit Own(const std::string& text) : unique_ptr(std::make_unique<const std::string>(text)) {}
  Own(const Own& other) : Own(*other) {}
  Own(Own&&) noexcept = default;
  Own& operator=(Own&&) noexcept = default;
  Own& operator=(const Own&) = delete;
  ~Own() = default;
};

// What no set in order can do without: a walk, or a bisection, over pointers to texts, which allocates nothing and
// changes nothing. Where texts have to be made or dropped, pointers to std::string are.
struct Floor {
  static constexpr const char* kName = "floor";
  using Text = std::string;
  using Set = std::vector<Own>;

  static Text Make(const std::string& text) { return text; }
  static std::size_t Size(const Set&) { return 0; }
  static void Build(Set& set, const std::vector<Text>& texts) {
    for (const Text& text : texts) set.emplace_back(text);
  }
  static void Walk(const Set& a, const Set& b) {
    std::size_t equal = 0;
    for (auto i = a.begin(), j = b.begin(); i != a.end() && j != b.end();) {
      const int order = (*i)->compare(**j);
      equal += order == 0;
      i += order <= 0;
      j += order >= 0;
    }
    benchmark::DoNotOptimize(equal);
  }
  static void Intersect(Set& target, const Set& other) { Walk(target, other); }
  static void Unite(Set& target, const Set& other) { Walk(target, other); }
  static bool Less(const Own& a, const std::string& b) { return *a < b; }
  static bool Contains(const Set& set, const Text& text) {
    const auto found = std::lower_bound(set.begin(), set.end(), text, Less);
    return found != set.end() && **found == text;
  }
  static void Cut(Set& set, const Text& lower, const Text& upper) {
    set.erase(set.begin(), std::lower_bound(set.begin(), set.end(), lower, Less));
    const auto greater = [](const std::string& a, const Own& b) { return a < *b; };
    set.erase(std::upper_bound(set.begin(), set.end(), upper, greater), set.end());
  }
  // Each candidate is made in a place on the stack and compared with the next text of the target.
  struct Candidates {
    explicit Candidates(const Set& set) : next(set.begin()), end(set.end()) {}
    ~Candidates() { benchmark::DoNotOptimize(next); }
    void Meet(std::size_t length) {
      benchmark::DoNotOptimize(place);
      if (next != end && **next == std::string_view(place, length)) ++next;
    }
    Set::const_iterator next, end;
    char place[64];
  };
  static void Concatenate(Set& target, const Set& x, const Set& y) {
    Candidates candidates(target);
    for (const Own& head : x) {
      for (const Own& tail : y) {
        std::memcpy(candidates.place, head->data(), head->size());
        std::memcpy(candidates.place + head->size(), tail->data(), tail->size());
        candidates.Meet(head->size() + tail->size());
      }
    }
  }
  static void Fold(Set& target, const Set& x) {
    Candidates candidates(target);
    for (const Own& text : x) {
      std::transform(text->begin(), text->end(), candidates.place,
                     [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c + ('a' - 'A')) : c; });
      candidates.Meet(text->size());
    }
  }
};

}  // namespace zor::bench
