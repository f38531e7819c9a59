// Sets of texts.
#include <memory>
#include <optional>

#include "bench/cases.h"
#include "bench/kinds.h"
#include "bench/measure.h"

namespace zor::bench {

namespace {

using benchmark::State;

// Values of a round: together they hold more texts than the near caches.
std::size_t CountFor(int size) { return std::max<std::size_t>(65536 / static_cast<std::size_t>(size), 2); }

// The cases as values of one kind. Operands stay, targets are made anew for each round.
template <class Kind>
struct Pool {
  using Set = typename Kind::Set;
  using Text = typename Kind::Text;

  explicit Pool(const Cases& cases) : count(cases.size()), x(new Set[count]), y(new Set[count]) {
    for (std::size_t i = 0; i < count; ++i) {
      targetTexts.push_back(Packed(cases[i].target));
      yTexts.push_back(Packed(cases[i].y));
      if (!cases[i].x.empty()) Kind::Build(x[i], Packed(cases[i].x));
      if (!cases[i].y.empty()) Kind::Build(y[i], yTexts[i]);
    }
  }
  static std::vector<Text> Packed(const Texts& plain) {
    std::vector<Text> packed;
    for (const std::string& text : plain) packed.push_back(Kind::Make(text));
    return packed;
  }
  void Empty() {
    targets.reset();
    MendHeap();
    targets.reset(new Set[count]);
  }
  void Renew() {
    Empty();
    for (std::size_t i = 0; i < count; ++i) {
      if (!targetTexts[i].empty()) Kind::Build(targets[i], targetTexts[i]);
    }
  }
  std::size_t Left() const {
    std::size_t left = 0;
    for (std::size_t i = 0; i < count; ++i) left += Kind::Size(targets[i]);
    return left;
  }

  std::size_t count;
  std::vector<std::vector<Text>> targetTexts, yTexts;
  std::unique_ptr<Set[]> targets, x, y;
};

// Makes a workload of operate(target, x, y) on cases.
template <class... Kinds, class Operate>
void RegisterCases(const std::string& work, std::initializer_list<int> sizes, Case (*make)(TextMaker&, std::size_t),
                   Operate operate) {
  Register<Kinds...>(work, sizes, [=]<class Kind>(State& state, int size) {
    Pool<Kind> pool(Cached(make, size, CountFor(size)));
    Measure(
        state, pool.count, [&] { pool.Renew(); },
        [&](std::size_t i) { operate.template operator()<Kind>(pool.targets[i], pool.x[i], pool.y[i]); },
        [&] { return pool.Left(); });
  });
}

template <class... Kinds>
void RegisterBuild(const std::string& work, std::initializer_list<int> sizes, Case (*make)(TextMaker&, std::size_t)) {
  Register<Kinds...>(work, sizes, [=]<class Kind>(State& state, int size) {
    Pool<Kind> pool(Cached(make, size, CountFor(size)));
    Measure(
        state, pool.count, [&] { pool.Empty(); },
        [&](std::size_t i) { Kind::Build(pool.targets[i], pool.targetTexts[i]); }, [&] { return pool.Left(); });
  });
}

template <class Kind>
void Copy(State& state, int size) {
  using Slot = std::optional<typename Kind::Set>;
  Pool<Kind> pool(Cached(Same, size, CountFor(size)));
  std::unique_ptr<Slot[]> copies;
  const auto renew = [&] {
    copies.reset();
    MendHeap();
    copies.reset(new Slot[pool.count]);
  };
  const auto copy = [&](std::size_t i) { copies[i].emplace(pool.x[i]); };
  Measure(state, pool.count, renew, copy, [&] { return Kind::Size(*copies[0]); });
}

template <class Kind>
void Contains(State& state, int size) {
  Pool<Kind> pool(Cached(Sought, size, CountFor(size)));
  std::size_t found = 0;
  const auto ask = [&](std::size_t i) { found += Kind::Contains(pool.targets[i / 16], pool.yTexts[i / 16][i % 16]); };
  const auto renew = [&] { pool.Renew(), found = 0; };
  Measure(state, pool.count * 16, renew, ask, [&] { return found; });
}

template <class Kind>
void Cut(State& state, int size) {
  Pool<Kind> pool(Cached(Same, size, CountFor(size)));
  const auto cut = [&](std::size_t i) { Kind::Cut(pool.targets[i], pool.yTexts[i][0], pool.yTexts[i][1]); };
  Measure(
      state, pool.count, [&] { pool.Renew(); }, cut, [&] { return pool.Left(); });
}

}  // namespace

void RegisterSets() {
  const auto sizes = {16, 256, 4096, 65536};
  const auto intersect = []<class Kind>(auto& target, auto& x, auto&) { Kind::Intersect(target, x); };
  const auto unite = []<class Kind>(auto& target, auto& x, auto&) { Kind::Unite(target, x); };
  const auto concatenate = []<class Kind>(auto& target, auto& x, auto& y) { Kind::Concatenate(target, x, y); };
  const auto fold = []<class Kind>(auto& target, auto& x, auto&) { Kind::Fold(target, x); };

  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("intersect, half lost", sizes, Overlapping, intersect);
  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("intersect, unchanged", sizes, Same, intersect);
  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("intersect 16", {65536}, Few, intersect);
  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("unite", sizes, Overlapping, unite);
  Register<Module, Tree, Vector, Flat, BTree, Floor>(
      "contains", sizes, []<class Kind>(State& state, int size) { Contains<Kind>(state, size); });
  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("concatenate, 256 new", {256}, Crossed, concatenate);
  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("concatenate, 31 new", {256}, Runs, concatenate);
  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("concatenate, all kept", {256}, CrossedAll, concatenate);
  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("concatenate, 16 of 32 kept", {256}, CrossedSome,
                                                          concatenate);
  RegisterCases<Module, Tree, Vector, Flat, BTree, Floor>("fold, all kept", {16, 256}, Folds, fold);
  Register<Module, Tree, Vector, Flat, BTree, Floor>(
      "copy", sizes, []<class Kind>(State& state, int size) { Copy<Kind>(state, size); });
  RegisterBuild<Module, Tree, Vector, Flat, BTree, Floor>("build, ascending", sizes, Same);
  RegisterBuild<Module, Tree, Vector, BTree>("build, shuffled", {16, 256, 4096}, Shuffled);
  Register<Module, Tree, Vector, Flat, BTree, Floor>(
      "cut", sizes, []<class Kind>(State& state, int size) { Cut<Kind>(state, size); });
}

}  // namespace zor::bench
