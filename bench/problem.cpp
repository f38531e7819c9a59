// problem WORK SIZE: prints one of the networks for zornet.
#include "bench/problems.h"

#include <cstdio>
#include <cstdlib>
#include <string_view>

int main(int argc, char** argv) {
  using namespace zor::bench;
  constexpr struct {
    std::string_view name;
    Problem (*make)(std::size_t);
  } kWorks[] = {{"chain", Chain}, {"order", SmallOrder}, {"order16", Order}, {"sets", Sets}, {"mix", Mix}};
  for (const auto& work : kWorks) {
    if (argc != 3 || work.name != argv[1]) continue;
    std::fputs(work.make(std::strtoul(argv[2], nullptr, 10)).network.c_str(), stdout);
    return 0;
  }
  std::fputs("problem chain|order|order16|sets|mix SIZE\n", stderr);
  return 1;
}
