// Narrowing of a function by the combinations of what its arguments can be. A listed value without a support among the
// others is dropped; what an unknown argument can be is collected. One pass finds all that can be found this way.
//
// Combinations are tried one by one, or driven from the listed results: a result of a concatenation or slice is looked
// for among the texts it begins with, so that what is tried is close to what is found.
#pragma once

#include <string_view>
#include <utility>
#include <vector>

#include "network/semantics.h"
#include "network/stop.h"
#include "network/store.h"

namespace zornet {

class Supports {
 public:
  Supports(Store& store, Semantics& semantics, std::size_t budget, Stop& stop);

  // False when the combinations are more than the budget, cannot be listed, or it is to end; then nothing has changed.
  bool Narrow(const Constraint& constraint);
  void ExceedBudget(const Constraint& constraint, double combinations);  // 0 where they were not counted

 private:
  // One variable of the constraint: its domain, and the values with a support so far. Of a range of numbers only the
  // least and the greatest supported one matter, since a range has no holes.
  struct Column {
    int variable = kNone;
    const Listing* listing = nullptr;
    Listing clamped;         // replaces positions that are unknown or too many
    bool openBelow = false;  // the first one stands for all less positions too
    bool openAbove = false;  // the last one stands for all greater positions too
    bool tried = false;      // it is one of mTried
    std::vector<char> kept;
    std::size_t dropped = 0;                    // values not kept so far
    std::size_t lowest = 0, behindHighest = 0;  // supported numbers of a range
    std::size_t index = 0;                      // the value that is tried
    std::vector<Answer> found;                  // values of a variable that is not listed
    bool open = false;                          // found does not hold all of them
    bool tooMany = false;                       // since there are more than a set lists
    bool met = false;                           // its variable has been narrowed

    bool IsListed() const { return listing->known; }
    bool IsRange() const { return !IsText(listing->sort) && listing->sort != Sort::IntegerSet; }
    bool HasAll() const;
    bool HasNone() const;
    void Start();
    void Keep(std::size_t place);
  };

  void Prepare(const Constraint& constraint);
  void ClampPositions();
  void ClampPosition(Column& column, std::int64_t low, std::int64_t high, bool openBelow, bool openAbove);
  double Combinations(const Constraint& constraint, std::size_t target);
  bool Try(const Constraint& constraint, std::size_t target);
  void Start();
  bool TryOne(const Constraint& constraint, std::size_t target);
  bool Advance();
  void Choose(Column& column, std::size_t index);
  bool Accept(std::size_t target, Answer&& answer);
  bool HasAll() const;

  double DrivenCost(const Constraint& constraint);
  bool Drive(const Constraint& constraint);
  bool Spend();
  bool DriveConcatenation();
  bool CutDifferent(std::size_t result);
  bool Reach(std::string_view text);
  bool ReachFrom(std::size_t input, std::string_view text, std::size_t from);
  bool KeepParts(std::size_t input);
  bool KeepUnknownParts(std::size_t input, std::string_view text);
  bool CutRepeated(std::size_t result);
  bool CutFrom(std::size_t input, std::string_view rest);
  void KeepChosen();
  void KeepOverflow(std::size_t greatest);
  bool DriveExtreme();
  bool Attain(std::size_t result);
  void KeepBesideExtreme(std::size_t input);
  bool DriveSlice();
  bool Slice(std::size_t text, std::size_t from);
  void KeepSlice(std::size_t text, std::size_t from, std::size_t result, std::size_t first, std::size_t last);

  void Apply(const Constraint& constraint);
  void Meet(Column& column);
  void MeetNumbers(Column& column);
  void MeetFound(Column& column);
  std::size_t Inputs() const { return mColumnOf.size() - 1; }
  Column& Result() { return At(Inputs()); }
  Column& At(std::size_t position) { return mColumns[mColumnOf[position]]; }

  Store& mStore;
  Semantics& mSemantics;
  std::size_t mBudget;
  Stop& mStop;
  std::size_t mForward = 0;      // the position of the result, or behind all when there is none: a relation is posted
  std::size_t mCount = 0;        // of the columns in use
  std::vector<Column> mColumns;  // one for each different variable
  std::vector<std::size_t> mColumnOf;                    // by position
  std::vector<std::uint32_t> mColumnOfVariable;          // good where that column has the variable
  std::vector<Exact> mExact;                             // what is tried, by position
  std::size_t mTries = 0;                                // left of the budget of a driven pass
  std::vector<Column*> mTried;                           // the columns whose combinations are tried
  std::vector<std::pair<double, std::size_t>> mTargets;  // by their cost; the result before inputs of equal cost

  // A part of the text that is cut: input, its places, and which text of the input it is.
  struct Part {
    std::size_t input, from, to, index;
  };
  // The part that an input has taken, where it stands more than once.
  struct Choice {
    bool made = false;
    std::string_view text;
    std::size_t index = 0;
  };
  // A text that is the least or the greatest of the inputs, with an input that has it.
  struct Extreme {
    std::size_t index, owner;
    bool shared;  // others have it too
  };
  std::vector<Extreme> mExtremes;           // the nearest to the end of the order first
  bool mLeast = true;                       // of the extremes
  std::vector<std::vector<char>> mReached;  // by input, the places where it can begin
  std::vector<char> mLeads, mLeadsNext;     // places from which the end is reached
  std::vector<Part> mParts;
  std::vector<Choice> mChosen;  // by column
  std::vector<std::size_t> mLongest;
};

}  // namespace zornet
