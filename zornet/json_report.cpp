#include <nlohmann/json.hpp>

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
  }
  return "";
}

Json Describe(const TextShape& shape) {
  return {{"shortest", shape.shortest},     {"longest", shape.longest},
          {"beginning", shape.beginning},   {"end", shape.end},
          {"least", shape.least},           {"greatest", shape.greatest},
          {"characters", shape.characters}, {"orMax", shape.orMax}};
}

// The text form, and what it holds in a form that a program need not take apart.
Json Describe(const Domain& domain, Sort sort) {
  Json json{{"value", domain.Print()}};
  json["state"] = domain.IsNil() ? "nil" : domain.IsAny() ? "any" : "known";
  if (domain.HasShape()) json["shape"] = Describe(domain.Shape());
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

class JsonReport : public Report {
 public:
  JsonReport(const Source& source, const Places& places, const Model& model, std::ostream& results)
      : mModel(model), mNames(source, places, model), mResults(results) {}

  void Errors(const Source& source, const Diagnostics& diagnostics) override {
    Locator locate(source);
    for (const Diagnostic& diagnostic : diagnostics.All()) {
      const Location at = locate(diagnostic.extent.begin);
      Tell({{"event", diagnostic.severity == Diagnostic::Error ? "error" : "note"},
            {"file", source.Name()},
            {"line", at.line},
            {"column", at.column},
            {"length", MarkedLength(source, diagnostic.extent)},
            {"message", diagnostic.message}});
    }
  }

  void Failure(const std::string& message) override { Tell({{"event", "failure"}, {"message", message}}); }
  void Narrowed(const Narrowing& narrowing) override { Tell(ToJson("narrowing", narrowing)); }

  void Variables(const Network& network) override {
    for (const int variable : mModel.Wanted()) {
      const Sort sort = mModel.Variables()[static_cast<std::size_t>(variable)].sort;
      Json json{{"event", "variable"}, {"name", mNames.OfVariable(variable)}, {"type", NamesOf(sort).type}};
      json.update(Describe(network[variable], sort));
      Tell(json);
    }
  }

  void Solution(const Network& network, std::uint64_t number) override {
    Json values = Json::object();
    for (const int variable : mModel.Wanted()) values[mNames.OfVariable(variable)] = network[variable].Print();
    Tell({{"event", "solution"}, {"number", number}, {"values", std::move(values)}});
    mResults.flush();
  }

  void Explain(const Network& network, Var variable, const Explanation& explanation) override {
    Json steps = Json::array(), declared = Json::array();
    for (const auto& start : explanation.declared) declared.push_back(mNames.OfVariable(start.variable));
    for (const Narrowing& step : explanation.narrowings) steps.push_back(ToJson("narrowing", step));
    Tell({{"event", "explanation"},
          {"name", mNames.OfVariable(variable)},
          {"value", network[variable].Print()},
          {"declared", std::move(declared)},
          {"narrowings", std::move(steps)}});
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
    Tell({{"event", "call"},
          {"line", mNames.LineOfConstraint(call.constraint)},
          {"call", call.call},
          {"answer", call.answer},
          {"target", call.target},
          {"before", call.before},
          {"after", call.after}});
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
    if (const auto& search = summary.search)
      json.update({{"solutions", search->solutions}, {"complete", search->complete}, {"open", search->open}});
    if (summary.search && summary.search->open != 0) json["variable"] = mNames.OfVariable(summary.search->openVariable);
    if (const int failed = network.FailedConstraint(); failed != kNone) {
      json["variable"] = mNames.OfVariable(network.FailedVariable());
      json["constraint"] = mNames.OfConstraint(failed);
      json["line"] = mNames.LineOfConstraint(failed);
    }
    Tell(json);
    mResults.flush();
  }

 private:
  Json ToJson(std::string_view event, const Narrowing& narrowing) const {
    Json json{{"event", event}};
    if (narrowing.constraint != kNone) {
      json["line"] = mNames.LineOfConstraint(narrowing.constraint);
      json["constraint"] = mNames.OfConstraint(narrowing.constraint);
    }
    json["operation"] = narrowing.operation;
    json["target"] = mNames.OfVariable(narrowing.variable);
    json["before"] = narrowing.before;
    json["after"] = narrowing.after;
    return json;
  }

  // File names and broken models need not be UTF-8.
  void Tell(const Json& json) { mResults << json.dump(-1, ' ', false, Json::error_handler_t::replace) << '\n'; }

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
