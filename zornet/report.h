// What a run tells: people read lines of text, programs one JSON object a line.
#pragma once

#include <cstdint>
#include <memory>
#include <ostream>
#include <string>

#include "language/diagnostics.h"
#include "language/reader.h"
#include "network/log.h"
#include "network/propagation.h"
#include "network/store.h"

namespace zornet {

// A bare call of the module, as --raw makes them.
struct RawCall {
  int constraint;
  std::string call;  // z.CalcConcatenation(x, y)
  int answer;
  std::string target;
  std::string before;
  std::string after;
};

struct Summary {
  Outcome outcome = Outcome::Settled;
  std::uint64_t passes = 0;
  double milliseconds = 0;
  bool searched = false;  // then also:
  std::uint64_t solutions = 0;
  bool complete = false;   // there are no more
  std::uint64_t open = 0;  // assignments left out since they leave openVariable unknown
  int openVariable = kNone;
};

class Report : public Watcher {
 public:
  virtual void Errors(const Source& source, const Diagnostics& diagnostics) = 0;
  virtual void Failure(const std::string& message) = 0;
  virtual void Variables(const Store& store) = 0;
  virtual void Solution(const Store& store, std::uint64_t number) = 0;
  virtual void Explain(const Store& store, int variable, const Log::Explanation& explanation) = 0;
  virtual void Statistics(const Store& store) = 0;
  virtual void Called(const RawCall& call) = 0;
  virtual void Finish(const Store& store, const Summary& summary) = 0;
};

// results and remarks are where the two kinds of lines go; the summary is a remark.
struct ReportStyle {
  bool colour = false;        // in results
  bool remarkColour = false;  // in remarks
  bool trace = false;         // tell each narrowing
  bool quiet = false;         // no summary
};
std::unique_ptr<Report> MakeTextReport(const Source& source, const ReadModel& read, const ReportStyle& style,
                                       std::ostream& results, std::ostream& remarks);
std::unique_ptr<Report> MakeJsonReport(const Source& source, const ReadModel& read, std::ostream& results);

// How reports call things: a constraint as it is written, a variable by its name, a constant as it is written.
class Names {
 public:
  Names(const Source& source, const ReadModel& read) : mSource(source), mRead(read) {}

  std::string OfConstraint(int constraint) const;
  std::string OfVariable(int variable) const;
  std::size_t LineOfConstraint(int constraint) const;
  std::size_t LineOfVariable(int variable) const;
  std::string PlaceOfConstraint(int constraint) const;  // file:line
  std::string PlaceOfVariable(int variable) const;
  const Source& File() const { return mSource; }

 private:
  std::string Written(Extent extent) const;

  const Source& mSource;
  const ReadModel& mRead;
};

}  // namespace zornet
