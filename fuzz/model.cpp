// Models: any text is a model or is answered with errors, and a model is narrowed, searched and told about.
#include <nlohmann/json.hpp>
#include <sstream>

#include "fuzz/support.h"
#include "language/reader.h"
#include "zornet/graph.h"
#include "zornet/raw.h"
#include "zornet/report.h"

namespace {

using namespace zornet;

constexpr Limits kLimits{64, 500};
constexpr std::uint64_t kSolutions = 3;
constexpr std::size_t kVariables = 1000;  // more take arrays, and too long

// Every file that a model names is the model itself.
struct SameFiles : Files {
  explicit SameFiles(std::string model) : text(std::move(model)) {}
  std::string Read(const std::string&) const override { return text; }
  std::string text;
};

// Tells report all there is to tell of a model: bare calls, what is narrowed, explanations and solutions.
Summary Tell(const Source& source, const ReadModel& read, Report& report, bool traces) {
  static const Network kKeepsModulesLoaded{Model()};
  const Names names(source, read.places, read.model);
  Network bare(read.model, kLimits), network(read.model, kLimits);
  RunRaw(bare, names, [&](const RawCall& call) { report.Called(call); });
  if (traces) network.OnNarrowing([&](const Narrowing& narrowing) { report.Narrowed(narrowing); });
  Summary summary;
  summary.outcome = network.Narrow();
  report.Variables(network);
  for (int v = 0; v < static_cast<int>(read.model.Variables().size()); ++v)
    report.Explain(network, {v}, network.Explain({v}));
  std::uint64_t solutions = 0;
  summary.search = network.Search(kSolutions, [&] {
    report.Solution(network, ++solutions);
    return true;
  });
  summary.outcome = summary.search->outcome;
  report.Statistics(network);
  Graph(network, names);
  report.Finish(network, summary);
  return summary;
}

void CheckObjects(std::istringstream lines) {
  for (std::string line; std::getline(lines, line);)
    if (!nlohmann::json::accept(line)) zor::fuzz::Fail("no JSON: " + line);
}

}  // namespace

// With a listener or without, the outcome is the same.
int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const SameFiles files(std::string(data, data + size));
  Source source("fuzz.szn", files.text);
  Diagnostics diagnostics;
  const ReadModel read = Read(source, diagnostics, files);
  if (read.model.Variables().size() > kVariables) return 0;
  std::ostringstream objects, results, remarks;
  const auto json = MakeJsonReport(source, read.places, read.model, objects);
  const auto text = MakeTextReport(source, read.places, read.model, {true, true, false}, results, remarks);
  if (diagnostics.Failed()) {
    for (Report* report : {json.get(), text.get()}) report->Errors(source, diagnostics);
  } else {
    const Summary traced = Tell(source, read, *text, true), plain = Tell(source, read, *json, false);
    const bool isSame = traced.outcome == plain.outcome && traced.search->solutions == plain.search->solutions;
    if (!isSame) zor::fuzz::Fail("another outcome when it is traced");
  }
  CheckObjects(std::istringstream(objects.str()));
  return 0;
}
