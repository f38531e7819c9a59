// Records every narrowing with its causes, to explain the value of a variable.
#pragma once

#include <vector>

#include "network/store.h"

namespace zornet {

class Log : public Watcher {
 public:
  explicit Log(const Model& model) : mModel(model), mLast(model.Variables().size(), kNone) {}

  void Narrowed(const Narrowing& narrowing) override;

  // The narrowings that led to the value; of `declared` only the variables.
  Explanation Explain(int variable) const;

 private:
  struct Entry {
    Narrowing narrowing;
    std::vector<int> causes;  // entries
  };

  const Model& mModel;
  std::vector<Entry> mEntries;
  std::vector<int> mLast;  // entry of each variable
};

}  // namespace zornet
