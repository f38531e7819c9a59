#include "zornet/run.h"

#include <fmt/core.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <memory>
#include <new>
#include <stdexcept>

#include "language/reader.h"
#include "language/spelling.h"
#include "zornet/colour.h"
#include "zornet/graph.h"
#include "zornet/interrupt.h"
#include "zornet/picture.h"
#include "zornet/progress.h"
#include "zornet/raw.h"
#include "zornet/split.h"

namespace zornet {

namespace {

// What goes wrong with a file or a name on the command line.
struct UsageError : std::runtime_error {
  using std::runtime_error::runtime_error;
};

// A model may be named without its ending.
Source Load(std::string file) {
  const bool isInput = file == "-";
  if (!isInput && !std::filesystem::exists(file) && std::filesystem::exists(file + ".szn")) file += ".szn";
  const std::string name = isInput ? "<stdin>" : file;
  try {
    return {name, isInput ? ReadText(std::cin) : DiskFiles().Read(file)};
  } catch (const std::runtime_error& error) {
    throw UsageError(fmt::format("{}: {}", name, error.what()));
  }
}

class OneRun {
 public:
  OneRun(const Options& options, Network& network, const Names& names, Report& report)
      : mOptions(options), mNetwork(network), mNames(names), mReport(report) {}

  int Go();

 private:
  void FindExplained();
  std::string SuggestVariable(const std::string& name) const;
  void Solve();
  static void EndWithoutReader();
  void Tell();
  void WritePictures() const;
  int ExitCode() const;

  const Options& mOptions;
  Network& mNetwork;
  const Names& mNames;
  Report& mReport;
  std::vector<Var> mExplained;
  Explanation mDrawn;  // all that was explained, for pictures
  Summary mSummary;
};

int OneRun::Go() {
  FindExplained();
  const auto begin = std::chrono::steady_clock::now();
  if (mOptions.raw) {
    RunRaw(mNetwork, mNames, [this](const RawCall& call) { mReport.Called(call); });
  } else {
    Solve();
  }
  mSummary.milliseconds = std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - begin).count();
  Tell();
  return ExitCode();
}

void OneRun::FindExplained() {
  const std::vector<Variable>& variables = mNetwork.GetModel().Variables();
  for (const std::string& name : mOptions.explain) {
    const auto found = std::find_if(variables.begin(), variables.end(),
                                    [&](const Variable& variable) { return variable.name == name; });
    if (name.empty() || found == variables.end())
      throw UsageError(fmt::format("--explain: there is no variable '{}'{}", name, SuggestVariable(name)));
    mExplained.push_back({static_cast<int>(found - variables.begin())});
  }
}

// As a write would, also while there is nothing to write. Where the signal is ignored the flag is left.
void OneRun::EndWithoutReader() {
  const bool isGone = IsReaderGone();
  if (isGone) std::raise(SIGPIPE);
  if (isGone || !std::cout.good()) Interrupts::Raise();
}

std::string OneRun::SuggestVariable(const std::string& name) const {
  std::vector<std::string_view> names;
  for (const Variable& variable : mNetwork.GetModel().Variables()) {
    if (variable.name.starts_with(name + "[")) return fmt::format("; did you mean '{}'?", variable.name);
    if (!variable.constant) names.push_back(variable.name);
  }
  return Suggestion(name, names);
}

// Nobody is told where nobody listens: text forms cost more than the narrowing itself.
void OneRun::Solve() {
  if (mOptions.trace) mNetwork.OnNarrowing([this](const Narrowing& narrowing) { mReport.Narrowed(narrowing); });
  const Interrupts interrupts;
  ProgressLine progress(isatty(STDERR_FILENO) != 0 && !mOptions.json);
  mNetwork.OnProgress([&](std::uint64_t steps, std::size_t waiting) {
    progress.Show(steps, waiting);
    EndWithoutReader();
  });
  mSummary.outcome = mNetwork.Narrow();
  if (mOptions.solutions != 0) {
    std::uint64_t solutions = 0;
    mSummary.search = mNetwork.Search(mOptions.solutions, [&] {
      mReport.Solution(mNetwork, ++solutions);
      return std::cout.good();
    });
    mSummary.outcome = mSummary.search->outcome;
  }
  mNetwork.OnProgress(nullptr);
}

void OneRun::Tell() {
  if (!mSummary.search) mReport.Variables(mNetwork);
  if (mSummary.outcome == Outcome::Stopped) return mReport.Finish(mNetwork, mSummary);
  for (const Var variable : mExplained) {
    const Explanation explanation = mNetwork.Explain(variable);
    mReport.Explain(mNetwork, variable, explanation);
    mDrawn.declared.insert(mDrawn.declared.end(), explanation.declared.begin(), explanation.declared.end());
    mDrawn.narrowings.insert(mDrawn.narrowings.end(), explanation.narrowings.begin(), explanation.narrowings.end());
  }
  if (mOptions.stats) mReport.Statistics(mNetwork);
  WritePictures();
  if (!mOptions.raw) mReport.Finish(mNetwork, mSummary);
}

void OneRun::WritePictures() const {
  try {
    if (mOptions.dot.empty() && mOptions.svg.empty()) return;
    const std::string graph = Graph(mNetwork, mNames, mExplained.empty() ? nullptr : &mDrawn);
    if (!mOptions.dot.empty()) WriteGraph(mOptions.dot, graph);
    if (!mOptions.svg.empty()) WritePicture(mOptions.svg, graph);
  } catch (const std::runtime_error& error) {
    throw UsageError(error.what());
  }
}

int OneRun::ExitCode() const {
  switch (mSummary.outcome) {
    case Outcome::Settled:
      return kSettled;
    case Outcome::Contradiction:
      return kContradiction;
    case Outcome::StepLimit:
    case Outcome::TimeLimit:
      return kLimit;
    case Outcome::Stopped:
      return Interrupts::Signal() != 0 ? kSignal + Interrupts::Signal() : kUsage;
    case Outcome::Open:
      return kOpen;
  }
  return kSettled;
}

// The names of the files are told on standard output, so that the next program can read them.
int WriteParts(const Options& options, const std::string& written, const Model& model) {
  const std::vector<Part> parts = Split(model, options.limits, options.modulePaths, options.split);
  for (std::size_t i = 0; i < parts.size(); ++i) {
    const std::string file = fmt::format("{}.{}.szn", options.parts.empty() ? "part" : options.parts, i + 1);
    std::ofstream out(file, std::ios::binary);
    out << written << "\n" << parts[i];
    out.close();
    if (!out) throw UsageError(fmt::format("{}: {}", file, std::strerror(errno)));
    std::cout << file << '\n';
  }
  return parts.empty() ? kContradiction : kSettled;
}

// The end of the program takes back all memory at once, and in a moment; to destroy each value takes long.
Network& KeptForGood(std::unique_ptr<Network> network) {
  static Network* volatile kept = nullptr;  // else the compiler drops it, and what looks for leaks finds one
  kept = network.release();
  return *kept;
}

}  // namespace

int Run(const Options& options) {
  ReportStyle style{WantsColour(options.colour, STDOUT_FILENO), WantsColour(options.colour, STDERR_FILENO),
                    options.quiet};
  const auto reportOn = [&](const Source& source, const Places& places, const Model& model) {
    return options.json ? MakeJsonReport(source, places, model, std::cout)
                        : MakeTextReport(source, places, model, style, std::cout, std::cerr);
  };
  const auto fail = [&](const std::string& message, int code) {
    reportOn(Source(options.file, ""), {}, {})->Failure(message);
    return code;
  };
  try {
    Source source = Load(options.file);
    Diagnostics diagnostics;
    ReadModel read = Read(source, diagnostics, DiskFiles());
    if (diagnostics.Failed()) {
      reportOn(source, {}, {})->Errors(source, diagnostics);
      return kModelError;
    }
    if (options.split != 0) return WriteParts(options, SelfContained(source, read.places.embedded), read.model);
    Limits limits = options.limits;
    limits.stop = &Interrupts::Flag();
    Network& network = KeptForGood(std::make_unique<Network>(std::move(read.model), limits, options.modulePaths));
    const Names names(source, read.places, network.GetModel());
    const auto report = reportOn(source, read.places, network.GetModel());
    return OneRun(options, network, names, *report).Go();
  } catch (const ModuleFailure& error) {
    return fail(error.what(), kModuleError);
  } catch (const std::runtime_error& error) {
    return fail(error.what(), kUsage);
  }
}

}  // namespace zornet
