#include "network/all_different.h"

#include <algorithm>
#include <numeric>

namespace zornet {

Status AllDifferent::Narrow(const Constraint& constraint) {
  mStore.StartOperation(Operation::Matching);
  if (HasRepeats(constraint.arguments)) {
    mStore.Fail(constraint.arguments.front());
    return Status::Subsumed;
  }
  List(constraint.arguments);
  for (std::size_t variable = 0; variable < mVariables.size(); ++variable) {
    if (mStop.IsAsked()) return Status::Again;
    if (Match(variable)) continue;
    mStore.Fail(mVariables[variable]);
    return Status::Subsumed;
  }
  FindComponents();
  for (std::size_t variable = 0; variable < mVariables.size() && !mStore.HasFailed(); ++variable) Drop(variable);
  const auto isOne = [this](int variable) { return mStore[variable].IsOne(); };
  return std::all_of(constraint.arguments.begin(), constraint.arguments.end(), isOne) ? Status::Subsumed
                                                                                      : Status::Fixpoint;
}

bool AllDifferent::HasRepeats(std::span<const int> variables) {
  mSorted.assign(variables.begin(), variables.end());
  std::sort(mSorted.begin(), mSorted.end());
  return std::adjacent_find(mSorted.begin(), mSorted.end()) != mSorted.end();
}

void AllDifferent::List(std::span<const int> variables) {
  ++mPass;
  mVariables.clear();
  mListed.clear();
  mFirst.assign(1, 0);
  for (const int variable : variables) {
    const Listing& listing = mStore.List(variable);
    if (!listing.known) continue;
    mVariables.push_back(variable);
    for (const ZORString& text : listing.texts) mListed.push_back(NumberOf(ToView(text)));
    mFirst.push_back(mListed.size());
  }
  mTextOf.assign(mVariables.size(), kNone);
  mPassed.assign(mVariables.size(), 0);
}

std::size_t AllDifferent::NumberOf(std::string_view text) {
  auto found = mNumbers.find(text);
  if (found == mNumbers.end()) {
    found = mNumbers.emplace(text, mTexts.size()).first;
    mTexts.emplace_back();
  }
  Text& state = mTexts[found->second];
  if (state.pass != mPass) {
    state.pass = mPass;
    state.owner = kNone;
  }
  return found->second;
}

// Gives the variable a text, for which others may have to change theirs. False when there is none for all of them.
bool AllDifferent::Match(std::size_t variable) {
  ++mSearch;
  mQueue.assign(1, variable);
  for (std::size_t i = 0; i < mQueue.size(); ++i) {
    const std::size_t finder = mQueue[i];
    if (const std::size_t text = FindFree(finder); text != kNone) {
      mTexts[text].finder = finder;
      GiveAlong(text);
      return true;
    }
    for (const std::size_t text : TextsOf(finder)) {
      Text& state = mTexts[text];
      if (state.search == mSearch) continue;
      state.search = mSearch;
      state.finder = finder;
      mQueue.push_back(state.owner);
    }
  }
  return false;
}

// A text that has an owner once has one ever after, so those that were passed are not looked at again.
std::size_t AllDifferent::FindFree(std::size_t variable) {
  const auto texts = TextsOf(variable);
  std::size_t& passed = mPassed[variable];
  while (passed < texts.size() && mTexts[texts[passed]].owner != kNone) ++passed;
  return passed < texts.size() ? texts[passed] : kNone;
}

// Each finder gets the text that it found and leaves its own to the one before it.
void AllDifferent::GiveAlong(std::size_t text) {
  while (text != kNone) {
    const std::size_t finder = mTexts[text].finder, left = mTextOf[finder];
    mTexts[text].owner = finder;
    mTextOf[finder] = text;
    text = left;
  }
}

void AllDifferent::FindComponents() {
  mFirstEdge.assign(1, 0);
  mEdges.clear();
  for (std::size_t variable = 0; variable < mVariables.size(); ++variable) {
    for (const std::size_t text : TextsOf(variable)) {
      if (mTexts[text].owner != kNone && mTexts[text].owner != variable) mEdges.push_back(mTexts[text].owner);
    }
    mFirstEdge.push_back(mEdges.size());
  }
  mComponents.Find(mFirstEdge, mEdges);
  mOrder.resize(mVariables.size());
  std::iota(mOrder.begin(), mOrder.end(), 0);
  std::sort(mOrder.begin(), mOrder.end(),
            [this](std::size_t a, std::size_t b) { return mComponents.Of(a) < mComponents.Of(b); });
  mEscapes.assign(mComponents.Count() + 1, 0);
  for (const std::size_t variable : mOrder) {
    char& escapes = mEscapes[mComponents.Of(variable)];
    for (const std::size_t text : TextsOf(variable)) {
      const std::size_t owner = mTexts[text].owner;
      if (owner == kNone || mEscapes[mComponents.Of(owner)] != 0) escapes = 1;
    }
  }
}

// The owner of the text must find another, or one in a circle that ends with the text that the variable has now.
bool AllDifferent::CanTake(std::size_t variable, std::size_t text) const {
  const std::size_t owner = mTexts[text].owner;
  if (owner == kNone || owner == variable) return true;
  const std::size_t component = mComponents.Of(owner);
  return mEscapes[component] != 0 || component == mComponents.Of(variable);
}

void AllDifferent::Drop(std::size_t variable) {
  const auto texts = TextsOf(variable);
  if (std::all_of(texts.begin(), texts.end(), [&](std::size_t text) { return CanTake(variable, text); })) return;
  const Listing& listing = mStore.List(mVariables[variable]);
  std::vector<ZORString> kept;
  for (std::size_t i = 0; i < texts.size(); ++i) {
    if (CanTake(variable, texts[i])) kept.push_back(listing.texts[i]);
  }
  mStore.MeetTexts(mVariables[variable], std::move(kept));
}

}  // namespace zornet
