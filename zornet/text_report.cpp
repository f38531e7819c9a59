#include <fmt/core.h>

#include <algorithm>
#include <span>
#include <utility>

#include "zornet/colour.h"
#include "zornet/limits.h"
#include "zornet/render.h"
#include "zornet/report.h"

namespace zornet {

namespace {

std::string Counted(std::uint64_t count, std::string_view thing) {
  return fmt::format("{} {}{}", count, thing, count == 1 ? "" : "s");
}

std::string Ended(Limit limit) {
  if (limit == Limit::Stop) return "interrupted";
  return limit == Limit::Time ? "time limit reached" : "step limit reached";
}

constexpr std::size_t kMostNamed = 8;

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
    mRemarks << Paint(mStyle.remarkColour)(Style::Error, "zornet: error:") << ' ' << Harmless(message) << '\n';
  }

  void Narrowed(const Narrowing& narrowing) override { mResults << Line(narrowing) << '\n'; }

  void Variables(const Network& network) override { Show(network, LimitsOf(network)); }

  void Solution(const Network& network, std::uint64_t) override {
    Show(network, {});
    mResults << "----------\n" << std::flush;
  }

  void Explain(const Network& network, Var variable, const Explanation& explanation) override;
  void Statistics(const Network& network) override;
  void Called(const RawCall& call) override;
  void Finish(const Network& network, const Summary& summary) override;

 private:
  void Show(const Network& network, const LimitsByVariable& limits);
  std::string LimitsAt(int variable, const LimitsByVariable& limits) const;
  std::string Line(const Narrowing& narrowing) const;
  std::string Place(int constraint) const;
  std::string Shown(const Domain& domain) const;
  std::string Result(const Network& network, const Summary& summary) const;
  std::string Limited(const Network& network, const Summary& summary) const;
  void TellOpen(const Network& network, const std::vector<Var>& variables);

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
  std::string shown = domain.Print();
  if (domain.HasShape()) shown += ": " + domain.PrintShape();
  return mPaint(style, std::move(shown));
}

void TextReport::Show(const Network& network, const LimitsByVariable& limits) {
  for (const int variable : mModel.Wanted()) {
    std::string line = mPaint(Style::Name, mNames.OfVariable(variable));
    line.append(" = ").append(Shown(network[variable]));
    if (const std::string met = LimitsAt(variable, limits); !met.empty()) line += mPaint(Style::Faint, "  % " + met);
    mResults << (line += '\n');
  }
}

// One of each kind.
std::string TextReport::LimitsAt(int variable, const LimitsByVariable& limits) const {
  std::string shown;
  std::set<Limit> kinds;
  const auto [first, last] = limits.equal_range(variable);
  for (auto at = first; at != last; ++at) {
    if (!kinds.insert(at->second.limit).second) continue;
    if (!shown.empty()) shown += "; ";
    shown += Describe(at->second, mModel.Variables()[static_cast<std::size_t>(variable)].sort);
  }
  return shown;
}

// model.szn:12: str_concat(x, y, z)
std::string TextReport::Place(int constraint) const {
  return fmt::format("{} {}", mPaint(Style::Faint, mNames.PlaceOfConstraint(constraint) + ":"),
                     constraint == kNone ? "" : mNames.OfConstraint(constraint) + "  ");
}

// model.szn:12: str_concat(x, y, z): z: Any -> "ab" (CalcConcatenation)
std::string TextReport::Line(const Narrowing& narrowing) const {
  return fmt::format("{}{}: {} -> {} {}", Place(narrowing.constraint),
                     mPaint(Style::Name, mNames.OfVariable(narrowing.variable)), narrowing.before,
                     mPaint(narrowing.failed ? Style::Error : Style::Known, narrowing.after),
                     mPaint(Style::Faint, fmt::format("({})", narrowing.operation)));
}

void TextReport::Explain(const Network& network, Var variable, const Explanation& explanation) {
  mResults << fmt::format("{} is {}", mPaint(Style::Name, mNames.OfVariable(variable)), Shown(network[variable]));
  const LimitsByVariable limits = LimitsOf(network);
  const auto [first, last] = limits.equal_range(variable.index);
  if (explanation.narrowings.empty() && first == last) {
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
  const Sort sort = mModel.Variables()[static_cast<std::size_t>(variable.index)].sort;
  for (auto at = first; at != last; ++at)
    mResults << "  " << Place(at->second.constraint) << Describe(at->second, sort) << '\n';
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
  if (const auto end = EndOf(summary.outcome)) return Ended(*end) + (search ? " after " + solutions : "");
  if (const int failed = network.FailedConstraint(); failed != kNone) {
    return fmt::format("contradiction at {}: {} leaves nothing for {}", mNames.PlaceOfConstraint(failed),
                       mNames.OfConstraint(failed), mNames.OfVariable(network.FailedVariable()));
  }
  if (summary.outcome == Outcome::Contradiction) return "contradiction: no solution";
  if (!search) return "settled";
  if (summary.outcome == Outcome::Open) return "open after " + solutions;
  if (!search->complete) return solutions + " found, there may be more";
  return search->solutions == 1 ? "the only solution" : "all " + solutions;
}

// A search that has tried all is sure in spite of them. The outcome itself names one.
std::string TextReport::Limited(const Network& network, const Summary& summary) const {
  std::set<Limit> limits = LimitsOf(network, summary.outcome);
  if (const auto end = EndOf(summary.outcome)) limits.erase(*end);
  if (limits.empty() || (summary.search && summary.search->complete)) return "";
  std::string listed;
  for (const Limit limit : limits) listed += fmt::format("{}{}", listed.empty() ? "" : ", ", NameOf(limit));
  return fmt::format(" (limits met: {})", listed);
}

// Which variables stay open, the first of many by name, and what limits them.
void TextReport::TellOpen(const Network& network, const std::vector<Var>& variables) {
  const std::size_t named = std::min(variables.size(), kMostNamed);
  const LimitsByVariable limits = LimitsOf(network);
  std::string names, lines;
  for (const Var variable : std::span(variables).first(named)) {
    names += (names.empty() ? "" : ", ") + mNames.OfVariable(variable);
    if (const std::string met = LimitsAt(variable.index, limits); !met.empty())
      lines += fmt::format("  {}: {}\n", mNames.OfVariable(variable), met);
  }
  if (named < variables.size()) names += fmt::format(" and {} more", variables.size() - named);
  mRemarks << fmt::format("unknown: {} stay{} open\n{}", names, variables.size() == 1 ? "s" : "", lines);
}

void TextReport::Finish(const Network& network, const Summary& summary) {
  const auto& search = summary.search;
  if (search && search->complete) mResults << "==========\n";
  mResults.flush();
  if (summary.outcome == Outcome::Open) TellOpen(network, search->openVariables);
  if (mStyle.quiet) return;
  const Paint paint(mStyle.remarkColour);
  const OperationCount total = Total(network.Counts());
  const bool good = summary.outcome == Outcome::Settled;
  mRemarks << fmt::format("{}{}; {}, {}, {} in {:.1f} ms\n",
                          paint(good ? Style::Known : Style::Error, Result(network, summary)),
                          Limited(network, summary), Counted(mModel.Constraints().size(), "constraint"),
                          Counted(total.calls, "call"), Counted(total.changes, "change"), summary.milliseconds);
}

}  // namespace

std::unique_ptr<Report> MakeTextReport(const Source& source, const Places& places, const Model& model,
                                       const ReportStyle& style, std::ostream& results, std::ostream& remarks) {
  return std::make_unique<TextReport>(source, places, model, style, results, remarks);
}

}  // namespace zornet
