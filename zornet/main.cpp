#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <iostream>
#include <new>

#include "zornet/run.h"

namespace {

bool sTellsJson = false;

// Where memory is refused, whoever asked for it: what was found is kept, and nothing more is asked for.
[[noreturn]] void EndWithoutMemory() {
  std::cout.flush();
  if (sTellsJson) {
    std::fputs("{\"event\":\"failure\",\"message\":\"out of memory\"}\n", stdout);
    std::fflush(stdout);
  } else {
    std::fputs("zornet: error: out of memory\n", stderr);
  }
  std::_Exit(zornet::kNoMemory);
}

}  // namespace

int main(int argc, char** argv) {
  std::set_new_handler(EndWithoutMemory);
  // Written in large pieces where nobody waits for single lines. A solution is flushed when it is found.
  if (isatty(STDOUT_FILENO) == 0) std::ios::sync_with_stdio(false);
  int exitCode = 0;
  try {
    const auto options = zornet::ReadOptions(argc, argv, exitCode);
    sTellsJson = options && options->json;
    if (options) exitCode = zornet::Run(*options);
  } catch (const std::bad_alloc&) {  // more than any memory has
    EndWithoutMemory();
  }
  if (std::cout.flush()) return exitCode;
  std::cerr << "zornet: error: standard output cannot be written\n";
  return zornet::kUsage;
}
