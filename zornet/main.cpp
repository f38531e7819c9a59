#include <cstdio>
#include <iostream>
#include <new>

#include "zornet/run.h"

int main(int argc, char** argv) {
  int exitCode = 0;
  try {
    const auto options = zornet::ReadOptions(argc, argv, exitCode);
    if (options) exitCode = zornet::Run(*options);
  } catch (const std::bad_alloc&) {  // even where telling of it needs memory
    std::fputs("zornet: error: out of memory\n", stderr);
    exitCode = zornet::kNoMemory;
  }
  if (std::cout.flush()) return exitCode;
  std::cerr << "zornet: error: standard output cannot be written\n";
  return zornet::kUsage;
}
