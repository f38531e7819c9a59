#include <fmt/core.h>

#include <algorithm>

#include "zornet/colour.h"
#include "zornet/render.h"
#include "zornet/report.h"

namespace zornet {

namespace {

std::string Counted(std::uint64_t count, std::string_view thing) {
  return fmt::format("{} {}{}", count, thing, count == 1 ? "" : "s");
}

class TextReport : public Report {
 public:
  TextReport(const Source& source, const ReadModel& read, const ReportStyle& style, std::ostream& results,
             std::ostream& remarks)
      : mModel(read.model),
        mNames(source, read),
        mStyle(style),
        mPaint(style.colour),
        mResults(results),
        mRemarks(remarks) {}

  void Errors(const Source& source, const Diagnostics& diagnostics) override {
    mRemarks << Render(source, diagnostics, mStyle.remarkColour);
  }

  void Failure(const std::string& message) override {
    mRemarks << Paint(mStyle.remarkColour)(Style::Error, "zornet: error:") << ' ' << message << '\n';
  }

  void Narrowed(const Narrowing& narrowing) override {
    if (mStyle.trace) mResults << Line(narrowing) << '\n';
  }

  void Variables(const Store& store) override {
    for (const int variable : mModel.outputs) {
      mResults << mPaint(Style::Name, mNames.OfVariable(variable)) << " = " << Shown(store[variable]) << '\n';
    }
  }

  void Solution(const Store& store, std::uint64_t) override {
    Variables(store);
    mResults << "----------\n" << std::flush;
  }

  void Explain(const Store& store, int variable, const Log::Explanation& explanation) override;
  void Statistics(const Store& store) override;
  void Called(const RawCall& call) override;
  void Finish(const Store& store, const Summary& summary) override;

 private:
  std::string Line(const Narrowing& narrowing) const;
  std::string Shown(const Value& value) const;
  std::string Result(const Store& store, const Summary& summary) const;

  const Model& mModel;
  Names mNames;
  ReportStyle mStyle;
  Paint mPaint;
  std::ostream& mResults;
  std::ostream& mRemarks;
};

std::string TextReport::Shown(const Value& value) const {
  const Style style = value.IsNil()     ? Style::Error
                      : value.IsOne()   ? Style::Known
                      : value.IsKnown() ? Style::Open
                                        : Style::Faint;
  return mPaint(style, value.Show());
}

// model.szn:12: str_concat(x, y, z): z: Any -> "ab" (CalcConcatenation)
std::string TextReport::Line(const Narrowing& narrowing) const {
  const std::string place = mNames.PlaceOfConstraint(narrowing.constraint);
  const std::string what = narrowing.constraint == kNone ? "" : mNames.OfConstraint(narrowing.constraint) + "  ";
  return fmt::format("{} {}{}: {} -> {} {}", mPaint(Style::Faint, place + ":"), what,
                     mPaint(Style::Name, mNames.OfVariable(narrowing.variable)), narrowing.before,
                     mPaint(narrowing.after == "Nil" ? Style::Error : Style::Known, narrowing.after),
                     mPaint(Style::Faint, fmt::format("({})", NameOf(narrowing.operation))));
}

void TextReport::Explain(const Store& store, int variable, const Log::Explanation& explanation) {
  mResults << fmt::format("{} is {}", mPaint(Style::Name, mNames.OfVariable(variable)), Shown(store[variable]));
  if (explanation.narrowings.empty()) {
    mResults << (explanation.declared.empty() ? ", as nothing tells more about it\n" : ", as it was declared\n");
    return;
  }
  mResults << ", since\n";
  for (const int declared : explanation.declared) {
    const Value start = Store::Initial(store.Types(), mModel.variables[static_cast<std::size_t>(declared)]);
    mResults << fmt::format("  {} {} was declared as {}\n",
                            mPaint(Style::Faint, mNames.PlaceOfVariable(declared) + ":"),
                            mPaint(Style::Name, mNames.OfVariable(declared)), start.Show());
  }
  for (const Narrowing* narrowing : explanation.narrowings) mResults << "  " << Line(*narrowing) << '\n';
}

void TextReport::Statistics(const Store& store) {
  mResults << mPaint(Style::Bold,
                     fmt::format("{:<24}{:>10}{:>10}{:>16}\n", "operation", "calls", "changes", "contradictions"));
  for (std::size_t i = 0; i < kOperations; ++i) {
    const OperationCounts& counts = store.Counts()[i];
    if (counts.calls == 0) continue;
    mResults << fmt::format("{:<24}{:>10}{:>10}{:>16}\n", NameOf(static_cast<Operation>(i)), counts.calls,
                            counts.changes, counts.contradictions);
  }
}

void TextReport::Called(const RawCall& call) {
  mResults << fmt::format("{} {} = {}", mPaint(Style::Faint, mNames.PlaceOfConstraint(call.constraint) + ":"),
                          call.call, call.answer);
  if (call.before != call.after) {
    mResults << fmt::format("  {}: {} -> {}", mPaint(Style::Name, call.target), call.before,
                            mPaint(call.after == "Nil" ? Style::Error : Style::Known, call.after));
  }
  mResults << '\n';
}

std::string TextReport::Result(const Store& store, const Summary& summary) const {
  std::string solutions = Counted(summary.solutions, "solution");
  if (summary.outcome == Outcome::StepLimit) {
    return "step limit reached" + (summary.searched ? " after " + solutions : "");
  }
  if (store.HasFailed()) {
    return fmt::format("contradiction at {}: {} leaves nothing for {}",
                       mNames.PlaceOfConstraint(store.FailedConstraint()),
                       mNames.OfConstraint(store.FailedConstraint()), mNames.OfVariable(store.Failed()));
  }
  if (summary.outcome == Outcome::Contradiction) return "contradiction: no solution";
  if (!summary.searched) return "settled";
  if (!summary.complete) return solutions + ", there may be more";
  if (summary.solutions == 0) return solutions;
  return summary.solutions == 1 ? "the only solution" : "all " + solutions;
}

void TextReport::Finish(const Store& store, const Summary& summary) {
  if (summary.searched && summary.complete) mResults << "==========\n";
  mResults.flush();
  if (mStyle.quiet) return;
  const Paint paint(mStyle.remarkColour);
  if (summary.open != 0) {
    mRemarks << fmt::format("{} left out: {} stays unknown in {}\n", Counted(summary.open, "assignment"),
                            mNames.OfVariable(summary.openVariable), summary.open == 1 ? "it" : "them");
  }
  const bool good = summary.outcome == Outcome::Settled;
  mRemarks << fmt::format("{}; {}, {}, {} in {:.1f} ms\n",
                          paint(good ? Style::Known : Style::Error, Result(store, summary)),
                          Counted(mModel.constraints.size(), "constraint"), Counted(store.Calls(), "call"),
                          Counted(store.Changes(), "change"), summary.milliseconds);
}

}  // namespace

std::unique_ptr<Report> MakeTextReport(const Source& source, const ReadModel& read, const ReportStyle& style,
                                       std::ostream& results, std::ostream& remarks) {
  return std::make_unique<TextReport>(source, read, style, results, remarks);
}

}  // namespace zornet
