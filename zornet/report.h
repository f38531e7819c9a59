// What a run tells: people read lines of text, programs one JSON object a line.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <ostream>
#include <string>

#include "language/diagnostics.h"
#include "language/reader.h"
#include "network/ZORNetwork.h"

namespace zornet {

// A bare call of the module, as --raw makes them.
struct RawCall {
  int constraint;
  std::string call;  // z.CalcConcatenation(x, y)
  int answer;
  std::string target;
  std::string before;
  std::string after;
  bool failed;  // nothing is left in the target
};

struct Summary {
  Outcome outcome = Outcome::Settled;
  double milliseconds = 0;
  std::optional<SearchResult> search;
};

class Report {
 public:
  virtual ~Report() = default;
  virtual void Errors(const Source& source, const Diagnostics& diagnostics) = 0;
  virtual void Failure(const std::string& message) = 0;
  virtual void Narrowed(const Narrowing& narrowing) = 0;
  virtual void Variables(const Network& network) = 0;
  virtual void Solution(const Network& network, std::uint64_t number) = 0;
  virtual void Explain(const Network& network, Var variable, const Explanation& explanation) = 0;
  virtual void Statistics(const Network& network) = 0;
  virtual void Called(const RawCall& call) = 0;
  virtual void Finish(const Network& network, const Summary& summary) = 0;
};

// The sums over all operations.
OperationCount Total(const std::vector<OperationCount>& counts);

// Results go to one stream, remarks such as the summary to another.
struct ReportStyle {
  bool colour = false;        // in results
  bool remarkColour = false;  // in remarks
  bool quiet = false;         // no summary
};
std::unique_ptr<Report> MakeTextReport(const Source& source, const Places& places, const Model& model,
                                       const ReportStyle& style, std::ostream& results, std::ostream& remarks);
std::unique_ptr<Report> MakeJsonReport(const Source& source, const Places& places, const Model& model,
                                       std::ostream& results);

// How reports call things: a constraint as it is written, a variable by its name, a constant as it is written.
class Names {
 public:
  Names(const Source& source, const Places& places, const Model& model)
      : mSource(source), mPlaces(places), mModel(model) {}

  std::string OfConstraint(int constraint) const;
  std::string OfVariable(int variable) const;
  std::string DeclarationOf(int variable) const;  // the line of the source that declares it
  std::string OfVariable(Var variable) const { return OfVariable(variable.index); }
  std::size_t LineOfConstraint(int constraint) const;
  const std::string& FileOfConstraint(int constraint) const;
  std::string PlaceOfConstraint(int constraint) const;  // file:line
  std::string PlaceOfVariable(int variable) const;

 private:
  std::string Written(Extent extent) const;
  std::string Place(Extent extent) const;

  const Source& mSource;
  const Places& mPlaces;
  const Model& mModel;
};

}  // namespace zornet
