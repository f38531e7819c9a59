// Equality and order, posted or reified: what is common to texts and numbers, and how texts are narrowed.
#pragma once

#include <vector>

#include "network/number_relations.h"
#include "network/semantics.h"
#include "network/status.h"
#include "network/store.h"

namespace zornet {

class Relations {
 public:
  explicit Relations(Store& store);

  Status Narrow(const Constraint& constraint);

  // Of texts that must be unequal. CanRemove: target is a set that lists the one text of unequal. RemoveAll takes such
  // texts from target at once, but leaves the last of them where nothing else would be left.
  static bool AreUnequal(const Constraint& constraint);
  bool CanRemove(int target, int unequal);
  void RemoveAll(int target, std::vector<ZORString> texts);

 private:
  struct Ends {
    ZORString lowest, highest;
  };

  Status Post(Meaning meaning, int x, int y);
  Status Equal(int x, int y);
  Status Unequal(int x, int y);
  Status Ordered(int x, int y, bool strict);
  Status Reflexive(Meaning meaning, int x);
  Status Decide(Meaning meaning, int x, int y, int truth);

  void Equate(int target, int other);
  void Remove(int target, const ZORString& text);
  void NarrowBeyondEnds(int x, int y);
  Ends EndsOf(int variable) const;
  void CutAbove(int target, const Ends& ends, const ZORString& bound, bool strict);
  void CutBelow(int target, const Ends& ends, const ZORString& bound, bool strict);
  void RaiseTo(const ZORString& bound, Value& value);
  ZORString LeastFrom(int variable, const ZORString& bound);
  void RemoveFrom(Value& value, const ZORString& text);
  bool Lists(int variable, const ZORString& text);
  bool Ask(Meaning meaning, int x, int y, Value& answer);
  bool AskTexts(Meaning meaning, int x, int y, Value& answer);
  void AskEqual(const Value& left, const Value& right, Value& answer);
  void AskOrder(Meaning meaning, const Value& left, const Value& right, Value& answer);
  const Value& OperandFor(int variable, Value& plain);
  Value& Bound(const ZORString& text);

  Store& mStore;
  NumberRelations mNumbers;
  Value mSingle, mOther;  // single texts that are Exact even when they are the greatest
  Value mSet;
  Value mReified;
};

}  // namespace zornet
