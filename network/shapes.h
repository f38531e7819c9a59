// Narrowing of the shapes of texts that are not listed, and of listed texts by them. Each rule follows from what its
// constraint means on exact values, in both directions; none is exact. A constraint all of whose texts are listed costs
// a look at its arguments.
//
// The ideas are those of string solvers that reason about lengths, beginnings, ends and characters: dashed strings in
// constraint programming, and length arithmetic in solvers of satisfiability modulo theories.
#pragma once

#include <span>
#include <vector>

#include "network/store.h"

namespace zornet {

class Shapes {
 public:
  explicit Shapes(Store& store) : mStore(store) {}

  bool Narrow(const Constraint& constraint);  // whether something has changed

 private:
  void Apply(const Constraint& constraint);
  void ApplyReified(const Constraint& constraint);
  void Relate(const Constraint& constraint, bool holds);
  void Equal(int x, int y);
  void Order(int x, int y, bool strict);
  void Part(int part, int whole);
  void Prefix(int x, int y);
  void Suffix(int x, int y);
  void Matches(int x, const Expression& expression);
  void Concatenation(std::span<const int> inputs, int result);
  void Concatenated(std::span<const int> inputs, const Shape& joined, int result);
  void Slice(const Constraint& constraint);
  void SliceOf(int x, const Shape& slice, std::int64_t from, std::int64_t lastTo);
  void Length(int x, int number);
  void Case(Meaning meaning, int x, int z);
  void Extreme(Meaning meaning, std::span<const int> inputs, int result);
  void Successor(int x, int z);
  void Position(int x, int y, int number);
  void TextForm(int value, int z);

  bool IsUnlisted(int variable) const { return IsText(mStore[variable].Sort()) && !mStore.IsListed(variable); }
  Shape PlainOf(int variable) { return mStore.ShapeOf(variable).Plain(); }
  void Meet(int variable, const Shape& shape);

  Store& mStore;
  std::vector<Shape> mParts;  // of a concatenation
};

}  // namespace zornet
