#include "bench/measure.h"

#include <malloc.h>

#include <cstdlib>

#include "network/ZORNetwork.h"
#include "tests/support/allocations.h"

namespace zor::bench {

long Allocations() { return test::sAllocations; }

void MendHeap() {
  void* volatile large = std::malloc(std::size_t{1} << 16);  // which makes the allocator join what lies free
  std::free(large);
}

}  // namespace zor::bench

int main(int argc, char** argv) {
  mallopt(M_TRIM_THRESHOLD, -1);  // memory that was had once stays: the system's part in it is no part of a set's work
  mallopt(M_MMAP_MAX, 0);
  const zornet::Network keepsModulesLoaded{zornet::Model()};
  zor::bench::RegisterSets();
  zor::bench::RegisterSingles();
  zor::bench::RegisterNetworks();
  benchmark::Initialize(&argc, argv);
  if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 1;
  benchmark::RunSpecifiedBenchmarks();
  benchmark::Shutdown();
}
