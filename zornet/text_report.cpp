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
  TextReport(const Source& source, const Places& places, const Model& model, const ReportStyle& style,
             std::ostream& results, std::ostream& remarks)
      : mModel(model),
        mNames(source, places, model),
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

  void Variables(const Network& network) override {
    for (const int variable : mModel.Wanted()) {
      mResults << mPaint(Style::Name, mNames.OfVariable(variable)) << " = " << Shown(network[variable]) << '\n';
    }
  }

  void Solution(const Network& network, std::uint64_t) override {
    Variables(network);
    mResults << "----------\n" << std::flush;
  }

  void Explain(const Network& network, Var variable, const Explanation& explanation) override;
  void Statistics(const Network& network) override;
  void Called(const RawCall& call) override;
  void Finish(const Network& network, const Summary& summary) override;

 private:
  std::string Line(const Narrowing& narrowing) const;
  std::string Shown(const Domain& domain) const;
  std::string Result(const Network& network, const Summary& summary) const;

  const Model& mModel;
  Names mNames;
  ReportStyle mStyle;
  Paint mPaint;
  std::ostream& mResults;
  std::ostream& mRemarks;
};

std::string TextReport::Shown(const Domain& domain) const {
  const Style style = domain.IsNil()     ? Style::Error
                      : domain.IsOne()   ? Style::Known
                      : domain.IsKnown() ? Style::Open
                                         : Style::Faint;
  return mPaint(style, domain.HasShape() ? domain.Print() + ": " + domain.PrintShape() : domain.Print());
}

// model.szn:12: str_concat(x, y, z): z: Any -> "ab" (CalcConcatenation)
std::string TextReport::Line(const Narrowing& narrowing) const {
  const std::string place = mNames.PlaceOfConstraint(narrowing.constraint);
  const std::string what = narrowing.constraint == kNone ? "" : mNames.OfConstraint(narrowing.constraint) + "  ";
  return fmt::format("{} {}{}: {} -> {} {}", mPaint(Style::Faint, place + ":"), what,
                     mPaint(Style::Name, mNames.OfVariable(narrowing.variable)), narrowing.before,
                     mPaint(narrowing.failed ? Style::Error : Style::Known, narrowing.after),
                     mPaint(Style::Faint, fmt::format("({})", narrowing.operation)));
}

void TextReport::Explain(const Network& network, Var variable, const Explanation& explanation) {
  mResults << fmt::format("{} is {}", mPaint(Style::Name, mNames.OfVariable(variable)), Shown(network[variable]));
  if (explanation.narrowings.empty()) {
    mResults << (explanation.declared.empty() ? ": no constraint narrowed it\n" : ", as it was declared\n");
    return;
  }
  mResults << ", since\n";
  for (const auto& [declared, value] : explanation.declared) {
    mResults << fmt::format("  {} {} was declared as {}\n",
                            mPaint(Style::Faint, mNames.PlaceOfVariable(declared.index) + ":"),
                            mPaint(Style::Name, mNames.OfVariable(declared)), value);
  }
  for (const Narrowing& narrowing : explanation.narrowings) mResults << "  " << Line(narrowing) << '\n';
}

void TextReport::Statistics(const Network& network) {
  mResults << mPaint(Style::Bold,
                     fmt::format("{:<24}{:>10}{:>10}{:>16}\n", "operation", "calls", "changes", "contradictions"));
  for (const OperationCount& count : network.Counts()) {
    mResults << fmt::format("{:<24}{:>10}{:>10}{:>16}\n", count.operation, count.calls, count.changes,
                            count.contradictions);
  }
}

void TextReport::Called(const RawCall& call) {
  mResults << fmt::format("{} {} = {}", mPaint(Style::Faint, mNames.PlaceOfConstraint(call.constraint) + ":"),
                          call.call, call.answer);
  if (call.before != call.after) {
    mResults << fmt::format("  {}: {} -> {}", mPaint(Style::Name, call.target), call.before,
                            mPaint(call.failed ? Style::Error : Style::Known, call.after));
  }
  mResults << '\n';
}

std::string TextReport::Result(const Network& network, const Summary& summary) const {
  const auto& search = summary.search;
  const std::string solutions = search ? Counted(search->solutions, "solution") : "";
  if (summary.outcome == Outcome::StepLimit) return "step limit reached" + (search ? " after " + solutions : "");
  if (const int failed = network.FailedConstraint(); failed != kNone) {
    return fmt::format("contradiction at {}: {} leaves nothing for {}", mNames.PlaceOfConstraint(failed),
                       mNames.OfConstraint(failed), mNames.OfVariable(network.FailedVariable()));
  }
  if (summary.outcome == Outcome::Contradiction) return "contradiction: no solution";
  if (!search) return "settled";
  if (!search->complete) return solutions + " found, there may be more";
  return search->solutions == 1 ? "the only solution" : "all " + solutions;
}

void TextReport::Finish(const Network& network, const Summary& summary) {
  const auto& search = summary.search;
  if (search && search->complete) mResults << "==========\n";
  mResults.flush();
  if (summary.outcome == Outcome::Open)
    mRemarks << fmt::format("unknown: {} stays open\n", mNames.OfVariable(search->openVariable));
  if (mStyle.quiet) return;
  const Paint paint(mStyle.remarkColour);
  const OperationCount total = Total(network.Counts());
  const bool good = summary.outcome == Outcome::Settled;
  mRemarks << fmt::format("{}; {}, {}, {} in {:.1f} ms\n",
                          paint(good ? Style::Known : Style::Error, Result(network, summary)),
                          Counted(mModel.Constraints().size(), "constraint"), Counted(total.calls, "call"),
                          Counted(total.changes, "change"), summary.milliseconds);
}

}  // namespace

std::unique_ptr<Report> MakeTextReport(const Source& source, const Places& places, const Model& model,
                                       const ReportStyle& style, std::ostream& results, std::ostream& remarks) {
  return std::make_unique<TextReport>(source, places, model, style, results, remarks);
}

}  // namespace zornet
