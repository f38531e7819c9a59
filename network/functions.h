// Narrowing of the constraints whose last argument is a function of the others, and of those that only supports narrow.
#pragma once

#include "network/arithmetic.h"
#include "network/semantics.h"
#include "network/status.h"
#include "network/store.h"
#include "network/supports.h"

namespace zornet {

class Functions {
 public:
  Functions(Store& store, std::size_t budget, Stop& stop);

  Status Narrow(const Constraint& constraint);

 private:
  Status NarrowNumbers(const Constraint& constraint);
  Status NarrowRelation(const Constraint& constraint);
  bool HasExact(std::span<const int> variables) const;
  void TakeExact(std::span<const int> variables);
  void ComputeExact(const Constraint& constraint);
  void MeetResult(const Constraint& constraint, const Answer& answer);

  bool ComputeSets(const Constraint& constraint);
  bool HasKnownInputs(const Constraint& constraint);
  bool FoldSets(const Constraint& constraint, const Value& first);
  bool CallSets(Meaning meaning, const Value& x, const Value& y, Value& result);
  bool MayOverflow(const Constraint& constraint);
  const Value& AsSet(int variable, Value& set);
  void MeetSet(int variable, const Value& set);
  void BoundLength(int number);
  void BoundPosition(int number);
  bool BoundSlice(const Constraint& constraint);
  void BoundPositions(int from, int to, std::int64_t shortest);
  void DropLongTexts(int variable, std::int64_t longest);

  Store& mStore;
  Semantics mSemantics;
  Supports mSupports;
  Arithmetic mArithmetic;
  Value mX, mY, mZ;           // sets
  std::vector<Exact> mExact;  // inputs
  std::vector<int> mInputs;
  std::vector<ZORString> mTexts;
};

}  // namespace zornet
