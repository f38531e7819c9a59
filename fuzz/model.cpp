// The runner: any text is a model or is answered with errors, and a model is narrowed, searched and told about.
#include <nlohmann/json.hpp>
#include <sstream>

#include "fuzz/support.h"
#include "language/reader.h"
#include "network/log.h"
#include "network/search.h"
#include "network/session.h"
#include "zornet/graph.h"
#include "zornet/raw.h"
#include "zornet/report.h"

namespace {

using namespace zornet;

constexpr Limits kLimits{64, 500};
constexpr std::uint64_t kSolutions = 3;

class Run {
 public:
  Run(const Source& source, const ReadModel& read, Report& report)
      : mModel(read.model), mReport(report), mNames(source, read) {}

  Summary Solve(bool explains);

 private:
  void CallAll();
  void Search(Store& store, Propagation& propagation);
  void Explain(const Store& store, const Log& log);

  const Session& Types() const {
    static const Session kSession;
    return kSession;
  }

  const Model& mModel;
  Report& mReport;
  Names mNames;
  Summary mSummary;
};

Summary Run::Solve(bool explains) {
  CallAll();
  Log log(mModel);
  Store store(Types().Types(), mModel);
  store.Watch(explains ? static_cast<Watcher*>(&log) : &mReport);
  Propagation propagation(store, kLimits);
  mSummary.outcome = propagation.Run();
  mReport.Variables(store);
  if (explains) Explain(store, log);
  if (mSummary.outcome == Outcome::Settled) Search(store, propagation);
  mReport.Statistics(store);
  Graph(store, mNames);
  mReport.Finish(store, mSummary);
  return mSummary;
}

void Run::CallAll() {
  Store store(Types().Types(), mModel);
  RunRaw(store, mNames, [&](const RawCall& call) { mReport.Called(call); });
}

void Run::Search(Store& store, Propagation& propagation) {
  store.Watch(nullptr);
  zornet::Search search(store, propagation);
  mSummary.outcome = search.Run(kSolutions, [&] {
    mReport.Solution(store, ++mSummary.solutions);
    return true;
  });
  mSummary.searched = true;
  mSummary.complete = search.IsComplete();
  mSummary.open = search.Open();
  mSummary.openVariable = search.OpenVariable();
}

void Run::Explain(const Store& store, const Log& log) {
  const auto count = static_cast<int>(mModel.variables.size());
  for (int variable = 0; variable < count; ++variable) mReport.Explain(store, variable, log.Explain(variable));
}

void CheckObjects(std::istringstream lines) {
  for (std::string line; std::getline(lines, line);)
    if (!nlohmann::json::accept(line)) zor::fuzz::Fail("no JSON: " + line);
}

}  // namespace

// Whoever listens, to the narrowing or to the reasons for it, sees the same outcome.
int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const Source source("fuzz.szn", std::string(data, data + size));
  Diagnostics diagnostics;
  const ReadModel model = Read(source, diagnostics);
  std::ostringstream objects, results, remarks;
  const auto json = MakeJsonReport(source, model, objects);
  const auto text = MakeTextReport(source, model, {true, true, true, false}, results, remarks);
  if (diagnostics.Failed()) {
    for (Report* report : {json.get(), text.get()}) report->Errors(source, diagnostics);
  } else {
    const Summary told = Run(source, model, *text).Solve(false);
    const Summary explained = Run(source, model, *json).Solve(true);
    const bool isSame = told.outcome == explained.outcome && told.solutions == explained.solutions;
    if (!isSame) zor::fuzz::Fail("another outcome when it is explained");
  }
  CheckObjects(std::istringstream(objects.str()));
  return 0;
}
