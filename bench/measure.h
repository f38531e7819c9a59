// How every workload is measured: rounds over many independent values, in which no value is met twice.
#pragma once

#include <benchmark/benchmark.h>
#include <time.h>

#include <algorithm>
#include <cstddef>
#include <limits>
#include <optional>
#include <string>

#include "host/ZORText.h"

namespace zor::bench {

constexpr int kRounds = 6;

long Allocations();  // so far, by whatever way they reached the allocator
void MendHeap();     // what was freed in small pieces becomes large ones again, so that all rounds meet the same heap

// Of this thread: other work on the machine takes nothing from it.
inline double Seconds() {
  timespec now;
  clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
  return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}

// Rounds of operate on each number below count. renew makes the targets anew before a round and is not counted; what
// left answers afterwards, a number of texts, has to be the same for all who do the same work.
// Reports ns and allocations of one operation: the time of the fastest round, since all that disturbs one makes it
// slower, and the allocations of the first, in which freed texts are not kept for later ones.
template <class Renew, class Operate, class Left>
void Measure(benchmark::State& state, std::size_t count, Renew renew, Operate operate, Left left) {
  const auto operations = static_cast<double>(count);
  double fastest = std::numeric_limits<double>::max();
  std::optional<long> allocations;
  for ([[maybe_unused]] auto round : state) {
    ZORString::KeepFreed(allocations.has_value());
    renew();
    const long before = Allocations();
    const double start = Seconds();
    for (std::size_t i = 0; i < count; ++i) operate(i);
    const double seconds = Seconds() - start;
    if (!allocations) allocations = Allocations() - before;
    fastest = std::min(fastest, seconds);
    state.SetIterationTime(seconds);
  }
  state.counters["ns"] = fastest * 1e9 / operations;
  state.counters["allocations"] = static_cast<double>(allocations.value_or(0)) / operations;
  state.counters["left"] = static_cast<double>(left());
}

// Body is a template over Kind, one of those who do the same work side by side: body<Kind>(state, size).
template <class Kind, class Body>
benchmark::internal::Benchmark* RegisterOne(const std::string& work, int size, Body body) {
  const std::string name = work + '/' + Kind::kName + '/' + std::to_string(size);
  const auto run = [body, size](benchmark::State& state) { body.template operator()<Kind>(state, size); };
  return benchmark::RegisterBenchmark(name.c_str(), run)->UseManualTime();
}

template <class... Kinds, class Body>
void Register(const std::string& work, std::initializer_list<int> sizes, Body body) {
  for (const int size : sizes) (RegisterOne<Kinds>(work, size, body)->Iterations(kRounds), ...);
}

// What takes too long for more than one round.
template <class... Kinds, class Body>
void RegisterOnce(const std::string& work, std::initializer_list<int> sizes, Body body) {
  for (const int size : sizes) (RegisterOne<Kinds>(work, size, body)->Iterations(1)->Repetitions(1), ...);
}

void RegisterSets();
void RegisterSingles();
void RegisterNetworks();

}  // namespace zor::bench
