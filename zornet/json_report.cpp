#include <nlohmann/json.hpp>

#include "zornet/limits.h"
#include "zornet/render.h"
#include "zornet/report.h"

namespace zornet {

namespace {

using Json = nlohmann::ordered_json;

std::string_view Describe(Outcome outcome) {
  switch (outcome) {
    case Outcome::Settled:
      return "settled";
    case Outcome::Contradiction:
      return "contradiction";
    case Outcome::StepLimit:
      return "step limit";
    case Outcome::Open:
      return "open";
    case Outcome::TimeLimit:
      return "time limit";
    case Outcome::Stopped:
      return "interrupted";
  }
  return "";
}

// The text form, and what it holds in a form that a program need not take apart.
Json Describe(const Domain& domain, Sort sort) {
  Json json{{"value", domain.Print()}};
  json["state"] = domain.IsNil() ? "nil" : domain.IsAny() ? "any" : "known";
  if (!domain.IsKnown()) return json;
  if (IsText(sort)) {
    json["texts"] = domain.Texts();
  } else if (sort == Sort::IntegerSet) {
    json["numbers"] = domain.Numbers();
  } else if (sort == Sort::Boolean) {
    json["truth"] = domain.Lowest() != 0;
  } else {
    json["from"] = domain.Lowest();
    json["to"] = domain.Highest();
  }
  return json;
}

// The one value of a variable in a solution.
Json ValueOf(const Domain& domain, Sort sort) {
  if (IsText(sort)) return domain.Texts().front();
  if (sort == Sort::Boolean) return domain.Lowest() != 0;
  return domain.Lowest();
}

class JsonReport : public Report {
 public:
  JsonReport(const Source& source, const Places& places, const Model& model, std::ostream& results)
      : mFile(source.Name()), mModel(model), mNames(source, places, model), mResults(results) {}

  void Errors(const Source& source, const Diagnostics& diagnostics) override {
    Locator locate(source);
    for (const Diagnostic& diagnostic : diagnostics.All()) {
      const Location at = locate(diagnostic.extent.begin);
      Tell({{"event", diagnostic.severity == Diagnostic::Error ? "error" : "note"},
            {"file", source.NameAt(diagnostic.extent.begin)},
            {"line", at.line},
            {"column", at.column},
            {"length", MarkedLength(source, diagnostic.extent)},
            {"message", diagnostic.message}});
    }
  }

  void Failure(const std::string& message) override { Tell({{"event", "failure"}, {"message", message}}); }
  void Narrowed(const Narrowing& narrowing) override { Tell(ToJson("narrowing", narrowing)); }

  void Variables(const Network& network) override {
    const LimitsByVariable limits = LimitsOf(network);
    for (const int variable : mModel.Wanted()) {
      const Sort sort = mModel.Variables()[static_cast<std::size_t>(variable)].sort;
      Json json{{"event", "variable"}, {"name", mNames.OfVariable(variable)}, {"type", NamesOf(sort).type}};
      json.update(Describe(network[variable], sort));
      AddLimits(json, limits, variable);
      Tell(json);
    }
  }

  void Solution(const Network& network, std::uint64_t number) override {
    Json values = Json::object();
    for (const int variable : mModel.Wanted())
      values[mNames.OfVariable(variable)] =
          ValueOf(network[variable], mModel.Variables()[static_cast<std::size_t>(variable)].sort);
    Tell({{"event", "solution"}, {"number", number}, {"values", std::move(values)}});
    mResults.flush();
  }

  void Explain(const Network& network, Var variable, const Explanation& explanation) override {
    Json steps = Json::array(), declared = Json::array();
    for (const auto& start : explanation.declared) declared.push_back(mNames.OfVariable(start.variable));
    for (const Narrowing& step : explanation.narrowings) steps.push_back(ToJson("narrowing", step));
    Json json{{"event", "explanation"},
              {"name", mNames.OfVariable(variable)},
              {"value", network[variable].Print()},
              {"declared", std::move(declared)},
              {"narrowings", std::move(steps)}};
    AddLimits(json, LimitsOf(network), variable.index);
    Tell(json);
  }

  void Statistics(const Network& network) override {
    for (const OperationCount& count : network.Counts()) {
      Tell({{"event", "operation"},
            {"name", count.operation},
            {"calls", count.calls},
            {"changes", count.changes},
            {"contradictions", count.contradictions}});
    }
  }

  void Called(const RawCall& call) override {
    Json json{{"event", "call"}};
    AddLine(json, call.constraint);
    json.update({{"call", call.call},
                 {"answer", call.answer},
                 {"target", call.target},
                 {"before", call.before},
                 {"after", call.after}});
    Tell(json);
  }

  void Finish(const Network& network, const Summary& summary) override {
    const OperationCount total = Total(network.Counts());
    Json json{{"event", "summary"},
              {"outcome", Describe(summary.outcome)},
              {"constraints", mModel.Constraints().size()},
              {"passes", network.Steps()},
              {"calls", total.calls},
              {"changes", total.changes},
              {"milliseconds", summary.milliseconds}};
    if (const auto& search = summary.search) {
      json.update({{"solutions", search->solutions}, {"complete", search->complete}});
      json["open"] = Json::array();
      for (const Var variable : search->openVariables) json["open"].push_back(mNames.OfVariable(variable));
    }
    for (const Limit limit : LimitsOf(network, summary.outcome)) json["limits"].push_back(NameOf(limit));
    if (const int failed = network.FailedConstraint(); failed != kNone) {
      json["variable"] = mNames.OfVariable(network.FailedVariable());
      json["constraint"] = mNames.OfConstraint(failed);
      AddLine(json, failed);
    }
    Tell(json);
    mResults.flush();
  }

 private:
  Json ToJson(std::string_view event, const Narrowing& narrowing) const {
    Json json{{"event", event}};
    AddConstraint(json, narrowing.constraint);
    json["operation"] = narrowing.operation;
    json["target"] = mNames.OfVariable(narrowing.variable);
    json["before"] = narrowing.before;
    json["after"] = narrowing.after;
    return json;
  }

  // The file where it is not that of the model.
  void AddLine(Json& json, int constraint) const {
    const std::string& file = mNames.FileOfConstraint(constraint);
    if (file != mFile) json["file"] = file;
    json["line"] = mNames.LineOfConstraint(constraint);
  }

  void AddConstraint(Json& json, int constraint) const {
    if (constraint == kNone) return;
    AddLine(json, constraint);
    json["constraint"] = mNames.OfConstraint(constraint);
  }

  void AddLimits(Json& json, const LimitsByVariable& limits, int variable) const {
    const auto [first, last] = limits.equal_range(variable);
    for (auto at = first; at != last; ++at) {
      Json limit{{"limit", NameOf(at->second.limit)}};
      if (at->second.most != 0) limit["most"] = at->second.most;
      if (at->second.count != 0) limit["count"] = at->second.count;
      AddConstraint(limit, at->second.constraint);
      json["limits"].push_back(std::move(limit));
    }
  }

  // File names and broken models need not be UTF-8. In ASCII alone nothing acts on a terminal.
  void Tell(const Json& json) { mResults << json.dump(-1, ' ', true, Json::error_handler_t::replace) << '\n'; }

  const std::string& mFile;
  const Model& mModel;
  Names mNames;
  std::ostream& mResults;
};

}  // namespace

std::unique_ptr<Report> MakeJsonReport(const Source& source, const Places& places, const Model& model,
                                       std::ostream& results) {
  return std::make_unique<JsonReport>(source, places, model, results);
}

}  // namespace zornet
