#include "zornet/options.h"

#include <fmt/core.h>

#include <CLI/CLI.hpp>
#include <algorithm>
#include <charconv>
#include <chrono>
#include <cmath>
#include <iostream>
#include <sstream>

#include "language/spelling.h"
#include "zornet/render.h"

namespace zornet {

namespace {

constexpr char kAbout[] =
    "zornet narrows the variables of a model to what its constraints leave possible.\n"
    "It ends, and it never drops a text that a solution needs.";

constexpr char kFooter[] =
    "Exit codes: 0 settled, 1 contradiction, 2 usage or file, 3 error in the model, 4 module not loadable,\n"
    "5 step or time limit, 6 searched to the end but variables stay open, 7 out of memory,\n"
    "130 SIGINT, 143 SIGTERM.\n"
    "The language of models and all else: man zornet.";

// Digits alone: to the library a minus sign is part of an unsigned number, which then wraps.
CLI::Validator WholeFrom(std::uint64_t least) {
  const auto check = [least](const std::string& text) {
    std::uint64_t number = 0;
    const char* const last = text.data() + text.size();
    const auto [end, error] = std::from_chars(text.data(), last, number);
    const bool good = error == std::errc() && end == last && number >= least;
    return good ? std::string() : fmt::format("expected a whole number from {} on, not '{}'", least, text);
  };
  return {check, ""};
}

// Fractions too, but no exponents.
std::optional<double> SecondsIn(const std::string& text) {
  double seconds = 0;
  const char* const last = text.data() + text.size();
  const auto [end, error] = std::from_chars(text.data(), last, seconds, std::chars_format::fixed);
  const bool good = error == std::errc() && end == last && std::isfinite(seconds) && !std::signbit(seconds);
  return good ? std::optional(seconds) : std::nullopt;
}

CLI::Validator Seconds() {
  const auto check = [](const std::string& text) {
    return SecondsIn(text) ? std::string() : fmt::format("expected seconds, such as 1.5, not '{}'", text);
  };
  return {check, ""};
}

// From now on, which is close to the start of the program.
void SetTimeLimit(double seconds, Limits& limits) {
  constexpr double kMost = 1e9;  // about as long as for ever, and a clock can count it
  const std::chrono::duration<double> limit(std::min(seconds, kMost));
  limits.deadline =
      std::chrono::steady_clock::now() + std::chrono::duration_cast<std::chrono::steady_clock::duration>(limit);
}

// What is no option and no file.
std::string RefuseExtra(const CLI::App& app) {
  const std::vector<std::string> extras = app.remaining();
  const auto option =
      std::find_if(extras.begin(), extras.end(), [](const auto& word) { return word.starts_with('-'); });
  if (option == extras.end()) return fmt::format("one model at a time, not '{}' too", extras.front());
  std::vector<std::string> names;
  for (const CLI::Option* known : app.get_options()) names.push_back(known->get_name());
  const std::vector<std::string_view> views(names.begin(), names.end());
  const std::string word = option->substr(0, option->find('='));
  return fmt::format("there is no option '{}'{}", word, Suggestion(word, views));
}

std::string Failure(const CLI::App* app, const CLI::Error& error) {
  const bool extra = error.get_exit_code() == static_cast<int>(CLI::ExitCodes::ExtrasError);
  if (!extra) return CLI::FailureMessage::simple(app, error);
  return RefuseExtra(*app) + "\nRun with --help for more information.\n";
}

}  // namespace

std::optional<Options> ReadOptions(int argc, char** argv, int& exitCode) {
  Options options;
  std::optional<double> seconds;
  CLI::App app(kAbout, "zornet");
  app.footer(kFooter);
  app.failure_message(Failure);
  app.set_version_flag("--version", "zornet " ZORNET_VERSION);
  app.add_option("FILE", options.file, "The model (*.szn); - for standard input")->required();
  auto* solutions =
      app.add_option("--solutions", options.solutions, "Print up to N solutions")->type_name("N")->check(WholeFrom(1));
  auto* split = app.add_option("--split", options.split, "Write at least N parts of the model, to be searched apart")
                    ->type_name("N")
                    ->check(WholeFrom(1))
                    ->excludes(solutions);
  app.add_option("--parts", options.parts, "What the names of these files begin with (part)")
      ->type_name("PREFIX")
      ->needs(split);
  app.add_flag("--trace", options.trace, "Print each narrowing as it happens");
  auto* explain = app.add_option("--explain", options.explain, "Print what brought a variable to its value")
                      ->type_name("NAME")
                      ->allow_extra_args(false);
  app.add_flag("--stats", options.stats, "Print calls, changes and contradictions of each operation");
  app.add_flag("--raw", options.raw, "Call the module's bare operations in the order of the file, once each")
      ->excludes(solutions)
      ->excludes(split)
      ->excludes(explain);
  app.add_flag("--json-stream", options.json, "Print everything as one JSON object a line");
  app.add_option("--dot", options.dot, "Write the network as a graph for Graphviz; - for standard output")
      ->type_name("FILE");
  app.add_option("--svg", options.svg, "Write the network as a picture; - for standard output; needs Graphviz")
      ->type_name("FILE");
  app.add_option("--color", options.colour, "auto, always or never")
      ->type_name("WHEN")
      ->check(CLI::IsMember({"auto", "always", "never"}));
  app.add_option("--budget", options.limits.budget, "Combinations that one constraint may try for supports (65536)")
      ->type_name("N")
      ->check(WholeFrom(0));
  app.add_option("--step-limit", options.limits.steps,
                 "Passes over a constraint, and choices, before giving up (100000000)")
      ->type_name("N")
      ->check(WholeFrom(0));
  app.add_option("--time-limit", seconds, "Seconds, fractions too, before giving up")
      ->type_name("SECONDS")
      ->check(Seconds());
  app.add_option("--module-path", options.modulePaths, "Look for modules in this folder too; may be repeated")
      ->type_name("DIR")
      ->allow_extra_args(false);
  app.add_flag("-q,--quiet", options.quiet, "No summary at the end");
  try {
    app.parse(argc, argv);
  } catch (const CLI::ParseError& error) {
    std::ostringstream told;
    exitCode = app.exit(error, std::cout, told) == 0 ? kSettled : kUsage;
    std::istringstream lines(told.str());
    for (std::string line; std::getline(lines, line);) std::cerr << Harmless(line) << '\n';
    return std::nullopt;
  }
  if (seconds) SetTimeLimit(*seconds, options.limits);
  return options;
}

}  // namespace zornet
