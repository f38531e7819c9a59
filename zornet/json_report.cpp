#include <nlohmann/json.hpp>

#include "zornet/render.h"
#include "zornet/report.h"

namespace zornet {

namespace {

using Json = nlohmann::ordered_json;

std::string_view Describe(Sort sort) {
  switch (sort) {
    case Sort::Text:
      return "string";
    case Sort::TextSet:
      return "set string";
    case Sort::Integer:
      return "int";
    case Sort::Interval:
      return "interval";
    case Sort::IntegerSet:
      return "set int";
    case Sort::Boolean:
      return "bool";
  }
  return "";
}

std::string_view Describe(Outcome outcome) {
  switch (outcome) {
    case Outcome::Settled:
      return "settled";
    case Outcome::Contradiction:
      return "contradiction";
    case Outcome::StepLimit:
      return "step limit";
  }
  return "";
}

// The text form, and what it holds in a form that a program need not take apart.
Json Describe(const Value& value) {
  Json json{{"value", value.Show()}};
  json["state"] = value.IsNil() ? "nil" : value.IsUndefined() ? "any" : "known";
  if (!value.IsKnown()) return json;
  if (IsText(value.Sort())) {
    Json texts = Json::array();
    for (const ZORString& text : value.Texts()) texts.push_back(std::string(ToView(text)));
    json["texts"] = std::move(texts);
  } else if (value.Sort() == Sort::IntegerSet) {
    json["numbers"] = value.Numbers();
  } else if (value.Sort() == Sort::Boolean) {
    json["truth"] = value.LowestNumber() != 0;
  } else {
    json["from"] = value.LowestNumber();
    json["to"] = value.HighestNumber();
  }
  return json;
}

class JsonReport : public Report {
 public:
  JsonReport(const Source& source, const ReadModel& read, std::ostream& results)
      : mModel(read.model), mNames(source, read), mResults(results) {}

  void Errors(const Source& source, const Diagnostics& diagnostics) override {
    for (const Diagnostic& diagnostic : diagnostics.All()) {
      const Location at = source.Locate(diagnostic.extent.begin);
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

  void Variables(const Store& store) override {
    for (const int variable : mModel.outputs) {
      Json json{
          {"event", "variable"}, {"name", mNames.OfVariable(variable)}, {"type", Describe(store[variable].Sort())}};
      json.update(Describe(store[variable]));
      Tell(json);
    }
  }

  void Solution(const Store& store, std::uint64_t number) override {
    Json values = Json::object();
    for (const int variable : mModel.outputs) values[mNames.OfVariable(variable)] = store[variable].Show();
    Tell({{"event", "solution"}, {"number", number}, {"values", std::move(values)}});
    mResults.flush();
  }

  void Explain(const Store& store, int variable, const Log::Explanation& explanation) override {
    Json steps = Json::array(), declared = Json::array();
    for (const int other : explanation.declared) declared.push_back(mNames.OfVariable(other));
    for (const Narrowing* narrowing : explanation.narrowings) steps.push_back(ToJson("narrowing", *narrowing));
    Tell({{"event", "explanation"},
          {"name", mNames.OfVariable(variable)},
          {"value", store[variable].Show()},
          {"declared", std::move(declared)},
          {"narrowings", std::move(steps)}});
  }

  void Statistics(const Store& store) override {
    for (std::size_t i = 0; i < kOperations; ++i) {
      const OperationCounts& counts = store.Counts()[i];
      if (counts.calls == 0) continue;
      Tell({{"event", "operation"},
            {"name", NameOf(static_cast<Operation>(i))},
            {"calls", counts.calls},
            {"changes", counts.changes},
            {"contradictions", counts.contradictions}});
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

  void Finish(const Store& store, const Summary& summary) override {
    Json json{{"event", "summary"},
              {"outcome", Describe(summary.outcome)},
              {"constraints", mModel.constraints.size()},
              {"passes", summary.passes},
              {"calls", store.Calls()},
              {"changes", store.Changes()},
              {"milliseconds", summary.milliseconds}};
    if (summary.searched)
      json.update({{"solutions", summary.solutions}, {"complete", summary.complete}, {"open", summary.open}});
    if (store.HasFailed()) {
      json["variable"] = mNames.OfVariable(store.Failed());
      json["constraint"] = mNames.OfConstraint(store.FailedConstraint());
      json["line"] = mNames.LineOfConstraint(store.FailedConstraint());
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
    json["operation"] = NameOf(narrowing.operation);
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

std::unique_ptr<Report> MakeJsonReport(const Source& source, const ReadModel& read, std::ostream& results) {
  return std::make_unique<JsonReport>(source, read, results);
}

}  // namespace zornet
