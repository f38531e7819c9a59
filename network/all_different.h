// Narrowing of texts that all differ, by a matching of variables and texts: a text is dropped where no matching gives
// it to the variable and a text of its own to every other one (Regin). Memory is linear in what is listed. A variable
// of which nothing is known takes no part until something is.
#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "network/components.h"
#include "network/status.h"
#include "network/stop.h"
#include "network/store.h"

namespace zornet {

class AllDifferent {
 public:
  AllDifferent(Store& store, Stop& stop) : mStore(store), mStop(stop) {}

  Status Narrow(const Constraint& constraint);

 private:
  static constexpr std::size_t kNone = static_cast<std::size_t>(-1);

  struct Hash {
    using is_transparent = void;
    std::size_t operator()(std::string_view text) const { return std::hash<std::string_view>()(text); }
  };
  struct Text {
    std::size_t pass = 0;    // that used it last
    std::size_t owner = 0;   // the variable that has it, or kNone
    std::size_t search = 0;  // that saw it last
    std::size_t finder = 0;  // the variable from which that search saw it
  };

  bool HasRepeats(std::span<const int> variables);
  void List(std::span<const int> variables);
  std::size_t NumberOf(std::string_view text);
  bool Match(std::size_t variable);
  std::size_t FindFree(std::size_t variable);
  void GiveAlong(std::size_t text);
  void FindComponents();
  bool CanTake(std::size_t variable, std::size_t text) const;
  void Drop(std::size_t variable);
  std::span<const std::size_t> TextsOf(std::size_t variable) const {
    return std::span(mListed).subspan(mFirst[variable], mFirst[variable + 1] - mFirst[variable]);
  }

  Store& mStore;
  Stop& mStop;
  std::unordered_map<std::string, std::size_t, Hash, std::equal_to<>> mNumbers;  // of all texts that were met
  std::vector<Text> mTexts;                                                      // by number
  std::size_t mPass = 0, mSearch = 0;

  std::vector<int> mSorted;
  std::vector<int> mVariables;       // those that are listed; below they are meant by their place here
  std::vector<std::size_t> mFirst;   // their texts stand from here on
  std::vector<std::size_t> mListed;  // in this row
  std::vector<std::size_t> mTextOf;  // the matching
  std::vector<std::size_t> mPassed;  // by variable, how many of its first texts have an owner
  std::vector<std::size_t> mQueue;

  // From a variable that takes a text an edge leads to the one that has to give it up.
  std::vector<std::size_t> mFirstEdge, mEdges, mOrder;
  Components mComponents;
  std::vector<char> mEscapes;  // by component, whether it reaches a text that nobody has
};

}  // namespace zornet
