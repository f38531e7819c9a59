// Remembers every narrowing with what it followed from, and tells why a variable is what it is.
#pragma once

#include <vector>

#include "network/store.h"

namespace zornet {

class Log : public Watcher {
 public:
  explicit Log(const Model& model) : mModel(model), mLast(model.Variables().size(), kNone) {}

  void Narrowed(const Narrowing& narrowing) override;

  // What brought variable to what it is; of declared the variables alone.
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
