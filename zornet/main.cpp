#include <iostream>

#include "zornet/run.h"

int main(int argc, char** argv) {
  int exitCode = 0;
  const auto options = zornet::ReadOptions(argc, argv, exitCode);
  if (options) exitCode = zornet::Run(*options);
  if (std::cout.flush()) return exitCode;
  std::cerr << "zornet: error: standard output cannot be written\n";
  return zornet::kUsage;
}
