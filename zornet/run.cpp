#include "zornet/run.h"

#include <fmt/core.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <stdexcept>

#include "language/reader.h"
#include "network/search.h"
#include "network/session.h"
#include "zornet/colour.h"
#include "zornet/graph.h"
#include "zornet/picture.h"
#include "zornet/progress.h"
#include "zornet/raw.h"

namespace zornet {

namespace {

// What goes wrong with a file or a name on the command line.
struct UsageError : std::runtime_error {
  using std::runtime_error::runtime_error;
};

// A model may be named without its ending.
Source Load(std::string file) {
  if (file == "-") return {"<stdin>", {std::istreambuf_iterator<char>(std::cin), {}}};
  if (!std::filesystem::exists(file) && std::filesystem::exists(file + ".szn")) file += ".szn";
  if (std::filesystem::is_directory(file)) throw UsageError(file + ": is a folder");
  std::ifstream in(file, std::ios::binary);
  std::string text{std::istreambuf_iterator<char>(in), {}};
  if (!in.is_open() || in.bad()) throw UsageError(fmt::format("{}: {}", file, std::strerror(errno)));
  return {file, std::move(text)};
}

// Passes a narrowing on to the report and, where explanations are wanted, to the log.
class Both : public Watcher {
 public:
  Both(Watcher& first, Watcher& second) : mFirst(first), mSecond(second) {}
  void Narrowed(const Narrowing& narrowing) override {
    mFirst.Narrowed(narrowing);
    mSecond.Narrowed(narrowing);
  }

 private:
  Watcher& mFirst;
  Watcher& mSecond;
};

class OneRun {
 public:
  OneRun(const Options& options, const Source& source, const ReadModel& read, Report& report)
      : mOptions(options),
        mModel(read.model),
        mReport(report),
        mNames(source, read),
        mLog(read.model),
        mBoth(report, mLog) {}

  int Go();

 private:
  void FindExplained();
  void Watch(Store& store, bool explained);
  void Solve(Store& store);
  void Search(Store& store, Propagation& propagation);
  void Tell(Store& store);
  void WritePictures(const Store& store) const;
  int ExitCode() const;

  const Options& mOptions;
  const Model& mModel;
  Report& mReport;
  Names mNames;
  Log mLog;
  Both mBoth;
  std::vector<int> mExplained;
  Summary mSummary;
};

int OneRun::Go() {
  FindExplained();
  const Session session(mOptions.modulePaths);
  Store store(session.Types(), mModel);
  Watch(store, !mExplained.empty());
  const auto begin = std::chrono::steady_clock::now();
  if (mOptions.raw) {
    RunRaw(store, mNames, [this](const RawCall& call) { mReport.Called(call); });
  } else {
    Solve(store);
  }
  mSummary.milliseconds = std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - begin).count();
  Tell(store);
  return ExitCode();
}

void OneRun::FindExplained() {
  for (const std::string& name : mOptions.explain) {
    const auto found = std::find_if(mModel.variables.begin(), mModel.variables.end(),
                                    [&](const Variable& variable) { return variable.name == name; });
    if (name.empty() || found == mModel.variables.end())
      throw UsageError(fmt::format("--explain: there is no variable '{}'", name));
    mExplained.push_back(static_cast<int>(found - mModel.variables.begin()));
  }
}

// Nobody watches where nobody listens: text forms cost more than the narrowing itself.
void OneRun::Watch(Store& store, bool explained) {
  Watcher* const told = mOptions.trace || mOptions.json ? &mReport : nullptr;
  store.Watch(explained ? &mBoth : told);
}

void OneRun::Solve(Store& store) {
  Propagation propagation(store, mOptions.limits);
  ProgressLine progress(isatty(STDERR_FILENO) != 0 && !mOptions.json);
  propagation.OnProgress([&](std::uint64_t steps, std::size_t waiting) { progress.Show(steps, waiting); });
  mSummary.outcome = propagation.Run();
  mSummary.searched = mOptions.solutions != 0;
  mSummary.complete = mSummary.outcome == Outcome::Contradiction;
  if (mSummary.searched && mSummary.outcome == Outcome::Settled) Search(store, propagation);
  mSummary.passes = propagation.Steps();
}

// The choices are undone in the end, so that they explain nothing.
void OneRun::Search(Store& store, Propagation& propagation) {
  Watch(store, false);
  zornet::Search search(store, propagation);
  mSummary.outcome = search.Run(mOptions.solutions, [&] {
    mReport.Solution(store, ++mSummary.solutions);
    return std::cout.good();
  });
  mSummary.complete = search.IsComplete();
  mSummary.open = search.Open();
  mSummary.openVariable = search.OpenVariable();
  const bool none = mSummary.complete && mSummary.solutions == 0 && mSummary.open == 0;
  if (none) mSummary.outcome = Outcome::Contradiction;
}

void OneRun::Tell(Store& store) {
  if (!mSummary.searched) mReport.Variables(store);
  for (const int variable : mExplained) mReport.Explain(store, variable, mLog.Explain(variable));
  if (mOptions.stats) mReport.Statistics(store);
  WritePictures(store);
  if (!mOptions.raw) mReport.Finish(store, mSummary);
}

void OneRun::WritePictures(const Store& store) const {
  try {
    if (!mOptions.dot.empty()) WriteGraph(mOptions.dot, Graph(store, mNames));
    if (!mOptions.svg.empty()) WritePicture(mOptions.svg, Graph(store, mNames));
  } catch (const std::runtime_error& error) {
    throw UsageError(error.what());
  }
}

int OneRun::ExitCode() const {
  if (mSummary.outcome == Outcome::StepLimit) return kStepLimit;
  return mSummary.outcome == Outcome::Contradiction ? kContradiction : kSettled;
}

}  // namespace

int Run(const Options& options) {
  ReportStyle style{WantsColour(options.colour, STDOUT_FILENO), WantsColour(options.colour, STDERR_FILENO),
                    options.trace, options.quiet};
  const auto fail = [&](const std::exception& error, int code) {
    const Source none(options.file, "");
    const ReadModel empty;
    auto report = options.json ? MakeJsonReport(none, empty, std::cout)
                               : MakeTextReport(none, empty, style, std::cout, std::cerr);
    report->Failure(error.what());
    return code;
  };
  try {
    const Source source = Load(options.file);
    Diagnostics diagnostics;
    const ReadModel model = Read(source, diagnostics);
    auto report = options.json ? MakeJsonReport(source, model, std::cout)
                               : MakeTextReport(source, model, style, std::cout, std::cerr);
    if (diagnostics.Failed()) {
      report->Errors(source, diagnostics);
      return kModelError;
    }
    return OneRun(options, source, model, *report).Go();
  } catch (const ModuleFailure& error) {
    return fail(error, kModuleError);
  } catch (const std::runtime_error& error) {
    return fail(error, kUsage);
  }
}

}  // namespace zornet
