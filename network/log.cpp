#include "network/log.h"

#include <algorithm>

namespace zornet {

void Log::Narrowed(const Narrowing& narrowing) {
  Entry entry{narrowing, {}};
  if (mLast[static_cast<std::size_t>(narrowing.variable.index)] != kNone) {
    entry.causes.push_back(mLast[static_cast<std::size_t>(narrowing.variable.index)]);
  }
  if (narrowing.constraint != kNone) {
    for (const int variable : mModel.Constraints()[static_cast<std::size_t>(narrowing.constraint)].arguments) {
      const int last = mLast[static_cast<std::size_t>(variable)];
      if (last != kNone) entry.causes.push_back(last);
    }
  }
  mLast[static_cast<std::size_t>(narrowing.variable.index)] = static_cast<int>(mEntries.size());
  mEntries.push_back(std::move(entry));
}

// Causes come before their effects, so one walk backwards meets all of them.
Explanation Log::Explain(int variable) const {
  Explanation explanation;
  std::vector<char> needed(mEntries.size(), 0), used(mModel.Variables().size(), 0);
  used[static_cast<std::size_t>(variable)] = 1;
  const int last = mLast[static_cast<std::size_t>(variable)];
  if (last != kNone) needed[static_cast<std::size_t>(last)] = 1;
  for (int i = last; i >= 0; --i) {
    if (needed[static_cast<std::size_t>(i)] == 0) continue;
    const Entry& entry = mEntries[static_cast<std::size_t>(i)];
    for (const int cause : entry.causes) needed[static_cast<std::size_t>(cause)] = 1;
    explanation.narrowings.push_back(entry.narrowing);
    if (entry.narrowing.constraint == kNone) continue;
    for (const int argument : mModel.Constraints()[static_cast<std::size_t>(entry.narrowing.constraint)].arguments)
      used[static_cast<std::size_t>(argument)] = 1;
  }
  std::reverse(explanation.narrowings.begin(), explanation.narrowings.end());
  for (std::size_t v = 0; v < mModel.Variables().size(); ++v) {
    const Variable& declared = mModel.Variables()[v];
    const bool starts = !declared.texts.empty() || !declared.numbers.empty();
    if (used[v] != 0 && starts && !declared.constant) explanation.declared.push_back({{static_cast<int>(v)}, ""});
  }
  return explanation;
}

}  // namespace zornet
