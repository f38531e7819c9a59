// Networks: zornet in this process, other solvers as programs that tell their own time.
#include <stdio.h>

#include <cstdlib>
#include <fstream>
#include <stdexcept>

#include "bench/measure.h"
#include "bench/problems.h"
#include "language/reader.h"
#include "network/ZORNetwork.h"

namespace zor::bench {

namespace {

using benchmark::State;

constexpr int kSeconds = 20;  // that a program is given

// From the text of the model to what is left in every variable.
struct Zornet {
  static constexpr const char* kName = "zornet";
  static void Run(State& state, const Problem& problem) {
    const auto solve = [&](std::size_t) {
      zornet::Diagnostics diagnostics;
      zornet::Source source("problem", problem.network);
      zornet::Network network(zornet::Read(source, diagnostics).model);
      if (diagnostics.Failed() || network.Narrow() != zornet::Outcome::Settled) std::abort();
    };
    Measure(
        state, 1, [] {}, solve, [] { return 0; });
  }
};

// What a program that found a solution says behind key, in seconds; kSeconds when it found none.
double Ask(const std::string& command, const std::string& key) {
  FILE* const out = popen(command.c_str(), "r");
  if (out == nullptr) throw std::runtime_error(command);
  std::string said;
  for (int c = 0; (c = fgetc(out)) != EOF;) said += static_cast<char>(c);
  pclose(out);
  const std::size_t at = said.find(key);
  if (said.find("unsat") != std::string::npos) throw std::runtime_error(command + " found no solution");
  if (said.rfind("sat", 0) != 0 || at == std::string::npos) return kSeconds;
  char* end = nullptr;
  const double time = std::strtod(said.c_str() + at + key.size(), &end);
  return *end == 'm' ? time * 1e-3 : time;
}

void RunProgram(State& state, const Problem& problem, const std::string& command, const std::string& key) {
  const std::string file = "problem.smt2";
  std::ofstream(file) << problem.smt;
  for ([[maybe_unused]] auto round : state) {
    const double seconds = Ask(command + ' ' + file + " 2>&1", key);
    state.SetIterationTime(seconds);
    state.counters["ns"] = seconds * 1e9;
    state.counters["unsolved"] = seconds >= kSeconds;
  }
}

struct Z3 {
  static constexpr const char* kName = "z3";
  static void Run(State& state, const Problem& problem) {
    RunProgram(state, problem, "z3 -st -T:" + std::to_string(kSeconds), ":total-time");
  }
};

struct Cvc5 {
  static constexpr const char* kName = "cvc5";
  static void Run(State& state, const Problem& problem) {
    RunProgram(state, problem, "cvc5 --stats --tlimit=" + std::to_string(kSeconds * 1000), "global::totalTime = ");
  }
};

void RegisterProblem(const char* work, Problem (*make)(std::size_t)) {
  const auto run = [make]<class Kind>(State& state, int size) {
    Kind::Run(state, make(static_cast<std::size_t>(size)));
  };
  Register<Zornet>(work, {10, 100, 1000, 10000}, run);
  RegisterOnce<Z3, Cvc5>(work, {10, 100, 1000}, run);
}

}  // namespace

void RegisterNetworks() {
  RegisterProblem("chain of concatenations", Chain);
  RegisterProblem("sets under concatenation", Sets);
  RegisterProblem("chain of <= on sets", Order);
}

}  // namespace zor::bench
