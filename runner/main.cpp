#include <csignal>

#include "runner/run.h"

int main(int argc, char** argv) {
  std::signal(SIGPIPE, SIG_IGN);  // a program that we feed may end early
  int exitCode = 0;
  const auto options = zornet::ReadOptions(argc, argv, exitCode);
  return options ? zornet::Run(*options) : exitCode;
}
