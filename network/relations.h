// Equality and order between two strings, posted or reified.
#pragma once

#include "network/store.h"
#include "network/truth.h"

namespace zornet {

// What a pass over a constraint leaves to do.
enum class Progress {
  Done,   // it holds whatever the values left; it need not be looked at again
  Waits,  // until one of its variables is changed by another constraint
  Again,  // until one of its variables is changed, also by itself
};

class Relations {
 public:
  explicit Relations(Store& store);

  Progress Narrow(const Constraint& constraint);

 private:
  Progress Post(Meaning meaning, int x, int y);
  Progress Equal(int x, int y);
  Progress Unequal(int x, int y);
  Progress Ordered(int x, int y, bool strict);
  Progress Reflexive(Meaning meaning, int x);
  Progress Decide(Meaning meaning, int x, int y, int truth);

  void Equate(int target, int other);
  void Remove(int target, const ZORString& text);
  void NarrowBeyondEnds(int x, int y);
  void CutAbove(int target, const ZORString& bound, bool strict);
  void CutBelow(int target, const ZORString& bound, bool strict);
  void LowerTo(const ZORString& bound, const ZORString& highest, Value& outcome);
  void RaiseTo(const ZORString& bound, const ZORString& lowest, Value& outcome);
  void RemoveFrom(Value& outcome, const ZORString& text);
  bool Ask(Meaning meaning, int x, int y, Value& answer);
  void AskEqual(const Value& left, const Value& right, Value& answer);
  void AskOrder(Meaning meaning, const Value& left, const Value& right, Value& answer);
  const Value& OperandFor(int variable, Value& plain);
  Value& Bound(const ZORString& text);

  Store& mStore;
  Value mSingle, mOther;  // single texts that are Exact even when they are the greatest
  Value mSet;
  Value mTruth;
};

}  // namespace zornet
