// The values of a network while it is narrowed. An operation of the module never touches a variable: it works on a
// value of its own, which Meet intersects with the variable. So no answer of the module can add a value.
//
// A single text or integer that could be several stays Undefined, but may have candidates, of which its value is one.
// A text that is neither known nor has candidates may have a shape.
#pragma once

#include <array>
#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "network/ZORModel.h"
#include "network/operations.h"
#include "network/shape.h"
#include "network/values.h"

namespace zornet {

class Watcher {
 public:
  virtual ~Watcher() = default;
  virtual void Narrowed(const Narrowing& narrowing) = 0;
};

struct OperationCounts {
  std::uint64_t calls = 0;
  std::uint64_t changes = 0;
  std::uint64_t contradictions = 0;
};

// The domain of a variable as a list in ascending order; positions count from 0.
struct Listing {
  bool known = false;  // else nothing else counts
  std::vector<ZORString> texts;
  std::vector<ZORLong> numbers;  // of a set of integers
  ZORLong first = 0;             // of any other numbers, which are all from here on
  std::size_t count = 0;
  Sort sort = Sort::Text;

  ZORLong NumberAt(std::size_t i) const {
    return sort == Sort::IntegerSet ? numbers[i] : static_cast<ZORLong>(first + static_cast<std::int64_t>(i));
  }
};

class Store {
 public:
  Store(const Types& types, const Model& model);

  const zornet::Types& Types() const { return mTypes; }
  const zornet::Model& Model() const { return mModel; }
  const Value& operator[](int variable) const { return mValues[static_cast<std::size_t>(variable)]; }
  const Variable& Declared(int variable) const { return mModel.Variables()[static_cast<std::size_t>(variable)]; }
  std::int64_t LowestNumber(int variable) const;   // of integers and truth values; the least of all where nothing
  std::int64_t HighestNumber(int variable) const;  // is known, and the greatest
  std::size_t Count(int variable) const;           // of the values that List answers; 0 where nothing is known
  // Good until the variable changes or the next constraint is started; of an Undefined single its candidates.
  const Listing& List(int variable);

  // A value of the variable's type that is Undefined, good until the next call for the same type.
  Value& Fresh(Sort sort);
  Value& FreshLike(int variable) { return Fresh((*this)[variable].Sort()); }
  Value& CopyOf(int variable);

  // Changes are recorded under the constraint and operation named last.
  void StartConstraint(int constraint) {
    mConstraint = constraint;
    mFitted = false;
    if (mKeptValues > kMostKept) ForgetListings();
    if (!mLimitsMet.empty()) ForgetLimits();
  }
  void StartOperation(Operation operation);
  void Meet(int variable, const Value& outcome);
  void MeetTexts(int variable, std::vector<ZORString> texts);           // ascending; none is a contradiction
  void KeepTexts(int variable, const std::vector<char>& kept);          // of those that List answers; at least one
  void MeetNumbers(int variable, std::vector<ZORLong> numbers);         // so are these; of an interval both ends
  void Bound(int variable, std::int64_t lowest, std::int64_t highest);  // keeps the numbers from one to the other
  void Fail(int variable);

  // Lets take(value) take values away from a known variable in place, which saves the copy that Meet intersects with.
  template <class Take>
  void Edit(int variable, Take take) {
    Former former = FormerOf(variable);
    take(mValues[static_cast<std::size_t>(variable)]);
    Settle(std::move(former));
  }

  // Recorded under the constraint named last, until it is named again; in a search for good.
  void MeetLimit(Limit limit, int variable, std::uint64_t count, std::uint64_t most);
  void ExceedSet(int variable, std::uint64_t count);  // of values, or 0
  std::vector<LimitMet> LimitsMet() const;

  bool HasCandidates(int variable) const;  // an Undefined single that is one of those that List answers

  bool IsListed(int variable) const { return !(*this)[variable].IsUndefined() || HasCandidates(variable); }
  Shape ShapeOf(int variable);                 // of a text; listed texts and nothing known have one too
  const Shape* HeldShape(int variable) const;  // of a text that is not listed; null when nothing is known of it
  void MeetShape(int variable, const Shape& shape);
  bool WasFitted() const { return mFitted; }  // a shape took away what the constraint named last had left

  bool HasFailed() const { return mFailed != kNone; }
  int Failed() const { return mFailed; }  // the variable that became Nil, or kNone
  int FailedConstraint() const { return mFailedConstraint; }
  std::vector<int>& Touched() { return mTouched; }  // changed since the reader emptied it

  const std::array<OperationCounts, kOperations>& Counts() const { return mCounts; }
  void Watch(Watcher* watcher) { mWatcher = watcher; }
  bool IsWatched() const { return mWatcher != nullptr; }

  // The value itself, for the module's bare operations.
  Value& Bare(int variable) { return mValues[static_cast<std::size_t>(variable)]; }

  // Undo takes back the changes since the latest Mark. AddChanged adds the variables whose values these are of.
  void Mark() { mMarks.push_back({mTrail.size(), mShapeTrail.size()}); }
  void AddChanged(std::vector<int>& variables) const;
  void Undo();

 private:
  struct Measure {
    bool nil, undefined;
    unsigned long cardinality;
    bool operator==(const Measure&) const = default;
  };
  struct Saved {
    int variable;
    Value value;
    std::unique_ptr<Listing> candidates;  // null when there were none
  };

  // A variable before it is narrowed; saved while there is a mark.
  struct Former {
    int variable;
    Measure measure;
    std::string shown;
    std::optional<Saved> saved;
  };

  Listing& ListingOf(int variable);
  void Fill(int variable, Listing& listing) const;
  void AddTexts(int variable, std::vector<ZORString>& texts) const;
  void Remember(int variable);
  void Hold(int variable, Listing listing);
  void ForgetListings();
  static Measure MeasureOf(const Value& value);
  Former FormerOf(int variable);
  bool Settle(Former former);  // whether it was narrowed
  void Narrow(int variable, const Value& outcome);
  bool IsCandidate(int variable, const Value& outcome) const;
  std::vector<ZORLong> CandidatesIn(int variable, const Value& outcome) const;
  void MeetCandidates(int variable, Listing candidates);
  std::unique_ptr<Listing> TakeCandidates(int variable);
  void Changed(int variable, const std::string& before);
  void FitToShape(int variable);
  void HoldShape(int variable, Shape shape);
  std::string Show(int variable) const;
  std::uint64_t MostListed(int variable) const;
  void ForgetLimits();

  const zornet::Types& mTypes;
  const zornet::Model& mModel;
  std::vector<Value> mValues;
  std::vector<Value> mFresh;
  std::vector<std::unique_ptr<Listing>> mListings;  // of the variables that were listed
  std::vector<char> mListed;                        // whether the listing is up to date
  static constexpr std::size_t kMostKept = 1 << 13;
  std::vector<int> mKept;  // the variables that were listed since all listings were forgotten
  std::size_t mKeptValues = 0;
  std::vector<std::unique_ptr<Listing>> mForgotten;
  std::vector<char> mChanged;  // whether the value is not as it was declared any more
  std::vector<int> mShapeOf;   // by variable: an index into mShapes, or kNone
  std::vector<Shape> mShapes;
  std::vector<int> mTouched;
  std::vector<Saved> mTrail;
  std::vector<std::pair<int, Shape>> mShapeTrail;  // variables with the shapes that they had
  struct Marked {
    std::size_t values, shapes;
  };
  std::vector<Marked> mMarks;
  std::array<OperationCounts, kOperations> mCounts{};
  std::map<std::tuple<int, int, Limit>, LimitMet> mLimitsMet;  // by constraint and variable
  Watcher* mWatcher = nullptr;
  int mConstraint = kNone;
  Operation mOperation = Operation::Choice;
  int mFailed = kNone;
  int mFailedConstraint = kNone;
  bool mFitted = false;
};

}  // namespace zornet
