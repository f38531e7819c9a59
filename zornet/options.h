// What the command line asks for.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "network/ZORNetwork.h"

namespace zornet {

struct Options {
  std::string file;
  bool raw = false;
  std::uint64_t solutions = 0;
  std::uint64_t split = 0;
  std::string parts;  // what the files of the parts begin with
  bool trace = false;
  std::vector<std::string> explain;
  bool stats = false;
  bool json = false;
  std::string dot;
  std::string svg;
  std::string colour = "auto";
  bool quiet = false;
  Limits limits;
  std::vector<std::string> modulePaths;
};

enum ExitCode {
  kSettled = 0,
  kContradiction = 1,
  kUsage = 2,
  kModelError = 3,
  kModuleError = 4,
  kLimit = 5,
  kOpen = 6,  // all is tried, but there may be more solutions
  kNoMemory = 7,
  kSignal = 128,  // and its number
};

// Nothing when the program is to end with exitCode: help or version was asked for, or the command line is wrong.
std::optional<Options> ReadOptions(int argc, char** argv, int& exitCode);

}  // namespace zornet
