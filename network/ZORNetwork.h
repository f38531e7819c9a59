// A network narrows the variables of a model to what its constraints leave possible. It always ends, and it never drops
// a value that a solution needs; what is left need not be part of a solution, which Search finds out.
//
//   zornet::Network network(model);
//   if (network.Narrow() == zornet::Outcome::Contradiction) ...
//   network[host].Print();                   // "north-7"
//   network.Search(10, [&] { ... return true; });
//   for (const auto& step : network.Explain(host).narrowings) ...
//
// Networks are independent of each other; each is used by one thread at a time.
#pragma once

#include <atomic>
#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "network/ZORModel.h"

class ZORVaDoAny;

namespace zornet {

class Value;
struct Shape;

// The modules of the value types cannot be used: what() says which and why.
struct ZOR_EXPORT ModuleFailure : std::runtime_error {
  using std::runtime_error::runtime_error;
};

struct Limits {
  std::size_t budget = 65536;         // combinations of values that one pass over a constraint may try
  std::uint64_t steps = 100'000'000;  // passes over a constraint, and choices of a search, in all
  std::chrono::steady_clock::time_point deadline = std::chrono::steady_clock::time_point::max();
  const std::atomic<bool>* stop = nullptr;  // set to true by another thread or a signal, it ends narrowing and search
};

enum class Outcome {
  Settled,        // no constraint narrows anything further
  Contradiction,  // there is no solution
  StepLimit,
  Open,  // a search has tried everything, but a variable stays unknown in some branch: there may be more solutions
  TimeLimit,
  Stopped,
};

// What is known of a text that is not listed. Lengths are in characters.
struct TextShape {
  int shortest = 0, longest = 255;
  std::string beginning, end;   // of every possible text
  std::string least, greatest;  // bounds of the possible texts
  std::string characters;       // that may occur, ascending
  bool orMax = false;           // the greatest text is possible too, whatever the rest says
};

// What is still possible for a variable: a view, valid until its network changes. Texts and numbers ascend.
class ZOR_EXPORT Domain {
 public:
  explicit Domain(const Value& value, const zornet::Shape* shape = nullptr) : mValue(&value), mShape(shape) {}

  bool IsNil() const;    // nothing: a contradiction
  bool IsAny() const;    // nothing is listed; a text may still have a shape
  bool IsKnown() const;  // neither: the values are listed, or lie in an interval
  bool IsOne() const;    // one text, number or truth value is left

  // Of a known domain.
  std::vector<std::string> Texts() const;
  std::vector<std::int32_t> Numbers() const;  // of a set of integers
  std::int32_t Lowest() const;                // of integers; of a truth value 0 or 1
  std::int32_t Highest() const;

  std::string Print() const;  // of any domain, as models write it: { "a", "b" }, 1..9, Any

  // Of a text of which nothing is listed but something is known.
  bool HasShape() const { return mShape != nullptr; }
  TextShape Shape() const;
  std::string PrintShape() const;            // "ab…", 2 to 255 characters; empty without a shape
  bool Admits(std::string_view text) const;  // whether the text is possible; also of a domain that lists its texts

 private:
  const Value* mValue;
  const zornet::Shape* mShape;
};

inline constexpr int kNone = -1;  // no constraint

// A step: a variable lost values through an operation of a constraint, or through a choice of a search.
struct Narrowing {
  int constraint = kNone;  // its number in the model
  std::string_view operation;
  Var variable;
  std::string before, after;  // as Domain::Print
  bool failed = false;        // nothing is left
};

// Why a variable is what it is.
struct Explanation {
  struct Start {
    Var variable;
    std::string value;  // as Domain::Print
  };
  std::vector<Start> declared;        // variables that took part, and what they were declared as
  std::vector<Narrowing> narrowings;  // in the order in which they happened
};

// What can keep a variable from being narrowed further.
enum class Limit {
  Set,         // more values are possible than are listed: 256 texts, 4096 integers, 256 for one Integer
  Budget,      // the values have more combinations than Limits::budget
  Narrowings,  // an interval was narrowed 4096 times in a row
  Steps,       // Limits::steps were made
  Time,        // Limits::deadline has passed
  Stop,        // Limits::stop is true
};

// A limit that kept a variable from being narrowed further.
struct LimitMet {
  Limit limit = Limit::Set;
  Var variable;
  int constraint = kNone;   // the one that would have narrowed it
  std::uint64_t count = 0;  // the values or combinations; 0 where they were not counted
  std::uint64_t most = 0;   // what the limit allows
};

struct OperationCount {
  std::string_view operation;
  std::uint64_t calls = 0, changes = 0, contradictions = 0;
};

struct SearchResult {
  Outcome outcome = Outcome::Settled;  // Contradiction: there is certainly no solution
  std::uint64_t solutions = 0;         // found
  bool complete = false;               // there are no more
  std::uint64_t open = 0;              // branches left because variables stay unknown in them
  std::vector<Var> openVariables;      // these variables
};

// A copy of a model with the domains of its variables. Narrow and Search change them.
class ZOR_EXPORT Network {
 public:
  // Opens the modules, from the program's own folder, from moduleFolders, or from where this library is installed.
  // While other networks exist, it shares their modules. Throws ModuleFailure.
  explicit Network(Model model, const Limits& limits = {}, const std::vector<std::string>& moduleFolders = {});
  ~Network();
  Network(Network&&) noexcept;
  Network& operator=(Network&&) noexcept;

  // Narrows until nothing changes, until a contradiction, or until a limit.
  Outcome Narrow();

  // Narrows, then looks for solutions, in which every wanted variable has one value, and stops after `most` of them.
  // Each comes once; variables that are not wanted get a value only where a constraint needs it. found is called for
  // each solution, while the domains show it, and returns whether to continue. Afterwards the domains are as narrowed.
  SearchResult Search(std::uint64_t most, const std::function<bool()>& found);

  const Model& GetModel() const;
  Domain operator[](Var variable) const;
  Domain operator[](int variable) const { return (*this)[Var{variable}]; }

  // After a contradiction: the variable for which nothing is left, and the constraint that found it. Else both are -1.
  Var FailedVariable() const;
  int FailedConstraint() const;

  // Says what brought a variable to its domain, by narrowing once more from the start.
  Explanation Explain(Var variable) const;

  // The limits that keep variables from being narrowed further. None after a contradiction, and none for a variable
  // that has one value.
  std::vector<LimitMet> LimitsMet() const;

  // The solver's own value, for direct calls of the modules' operations. The network owns it. After a change to it,
  // narrowing is no longer sound.
  ZORVaDoAny& Bare(Var variable);

  // Set what is called while it narrows: at each narrowing; and from time to time, with the steps made and the number
  // of waiting constraints.
  void OnNarrowing(std::function<void(const Narrowing&)> told);
  void OnProgress(std::function<void(std::uint64_t steps, std::size_t waiting)> told);

  std::uint64_t Steps() const;                 // passes over a constraint, and choices
  std::vector<OperationCount> Counts() const;  // of the operations that were called

 private:
  struct ZOR_INTERNAL Inside;
  std::unique_ptr<Inside> mInside;
};

}  // namespace zornet
