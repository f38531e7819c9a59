// A network narrows the variables of a model to what its constraints leave possible. It always ends, and it never drops
// a value that a solution needs; what is left need not be part of a solution, which Search finds out.
//
//   zornet::Network network(model);
//   if (network.Narrow() == zornet::Outcome::Contradiction) ...
//   network[host].Print();                   // "north-7"
//   network.Search(10, [&] { ... return true; });
//   for (const auto& step : network.Explain(host).narrowings) ...
//
// Networks are independent of each other; one belongs to one thread at a time.
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
  const std::atomic<bool>* stop = nullptr;  // ends it when another thread or a signal makes this true
};

enum class Outcome {
  Settled,        // no constraint narrows anything further
  Contradiction,  // there is no solution
  StepLimit,
  Open,  // of a search that tried all: there may be more solutions, as a variable stays unknown in some branch
  TimeLimit,
  Stopped,
};

// What is known of a text that is not listed. Lengths are in characters.
struct TextShape {
  int shortest = 0, longest = 255;
  std::string beginning, end;   // of every possible text
  std::string least, greatest;  // between which they lie
  std::string characters;       // that may occur, ascending
  bool orMax = false;           // the greatest text is possible too, whatever the rest says
};

// What is still possible for a variable: a view, good until its network changes. Texts and numbers ascend.
class ZOR_EXPORT Domain {
 public:
  explicit Domain(const Value& value, const zornet::Shape* shape = nullptr) : mValue(&value), mShape(shape) {}

  bool IsNil() const;    // nothing: a contradiction
  bool IsAny() const;    // nothing is known
  bool IsKnown() const;  // neither: what follows is for a known domain
  bool IsOne() const;    // one text, number or truth value is left

  std::vector<std::string> Texts() const;
  std::vector<std::int32_t> Numbers() const;  // of a set of integers
  std::int32_t Lowest() const;                // of integers; of a truth value 0 or 1
  std::int32_t Highest() const;

  std::string Print() const;  // of any domain, as models write it: { "a", "b" }, 1..9, Any

  // Of a text of which nothing is listed but something known.
  bool HasShape() const { return mShape != nullptr; }
  TextShape Shape() const;
  std::string PrintShape() const;            // "ab…", 2 to 255 characters
  bool Admits(std::string_view text) const;  // also of a domain that lists its texts

 private:
  const Value* mValue;
  const zornet::Shape* mShape;
};

inline constexpr int kNone = -1;  // no constraint

// A step: a variable lost values by an operation of a constraint, or by a choice of a search.
struct Narrowing {
  int constraint = kNone;
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
  std::vector<Start> declared;        // variables that took part with what they were declared as
  std::vector<Narrowing> narrowings;  // in the order in which they happened
};

// What can keep a variable from being narrowed further.
enum class Limit {
  Set,         // more values are possible than a set lists
  Budget,      // the values have more combinations than Limits::budget
  Narrowings,  // of one interval in a row
  Steps,       // Limits::steps are made
  Time,        // Limits::deadline is past
  Stop,        // Limits::stop is true
};

// A limit that did so.
struct LimitMet {
  Limit limit = Limit::Set;
  Var variable;
  int constraint = kNone;   // that would have narrowed it
  std::uint64_t count = 0;  // the values or combinations; 0 where they were not counted
  std::uint64_t most = 0;   // what the limit allows
};

struct OperationCount {
  std::string_view operation;
  std::uint64_t calls = 0, changes = 0, contradictions = 0;
};

struct SearchResult {
  Outcome outcome = Outcome::Settled;  // Contradiction: it is sure that there is no solution
  std::uint64_t solutions = 0;
  bool complete = false;           // there are no more
  std::uint64_t open = 0;          // branches left because variables stay unknown in them
  std::vector<Var> openVariables;  // these variables
};

class ZOR_EXPORT Network {
 public:
  // Opens the modules, from beside the program, from the folders given, or from where this library is installed. While
  // there are other networks their modules are taken. Throws ModuleFailure.
  explicit Network(Model model, const Limits& limits = {}, const std::vector<std::string>& moduleFolders = {});
  ~Network();
  Network(Network&&) noexcept;
  Network& operator=(Network&&) noexcept;

  // Narrows until nothing changes, until a contradiction, or until a limit.
  Outcome Narrow();

  // Narrows, then looks for solutions, in which every wanted variable has one value, and stops at `most` of them. Each
  // comes once; unless constraints need them, variables that are not wanted stay as they are. found is called at each,
  // while the domains show it; it answers whether to go on. Afterwards the domains are as narrowed.
  SearchResult Search(std::uint64_t most, const std::function<bool()>& found);

  const Model& GetModel() const;
  Domain operator[](Var variable) const;
  Domain operator[](int variable) const { return (*this)[Var{variable}]; }

  // After a contradiction: what nothing is left for, and the constraint that said so. Else -1 in both.
  Var FailedVariable() const;
  int FailedConstraint() const;

  // Narrows once more from the start, to tell what brought a variable to its domain.
  Explanation Explain(Var variable) const;

  // What keeps variables from being narrowed further, apart from what is not known of others. None after a
  // contradiction, and none at a variable that has one value.
  std::vector<LimitMet> LimitsMet() const;

  // The solver's own value, for the bare operations of its modules. What is narrowed after a change is not sound.
  ZORVaDoAny& Bare(Var variable);

  // Are called while it narrows: at each step, and now and then with the steps made and the constraints that wait.
  void OnNarrowing(std::function<void(const Narrowing&)> told);
  void OnProgress(std::function<void(std::uint64_t steps, std::size_t waiting)> told);

  std::uint64_t Steps() const;                 // passes over a constraint, and choices
  std::vector<OperationCount> Counts() const;  // of the operations that were called

 private:
  struct ZOR_INTERNAL Inside;
  std::unique_ptr<Inside> mInside;
};

}  // namespace zornet
