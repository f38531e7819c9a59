// What the workloads on sets are put to: texts alone, from which every kind makes sets of its own.
#pragma once

#include <vector>

#include "bench/texts.h"

namespace zor::bench {

// A target, what it meets, and the other operand, the bounds of a cut or the texts to look up.
struct Case {
  Texts target, x, y;
};
using Cases = std::vector<Case>;

// clang-format off
Case Overlapping(TextMaker& maker, std::size_t size);  // half of the target is in x, half of x in the target
Case Same       (TextMaker& maker, std::size_t size);  // target and x; y holds the bounds that cut a quarter off each end
Case Shuffled   (TextMaker& maker, std::size_t size);  // the target, in no order
Case Sought     (TextMaker& maker, std::size_t size);  // y: 16 texts, 8 of them from the target
Case Few        (TextMaker& maker, std::size_t size);  // a target of 16, 8 of them in x
Case Crossed    (TextMaker& maker, std::size_t size);  // x and y of 16, whose 256 pairs differ
Case CrossedAll (TextMaker& maker, std::size_t size);  // the same, and a target that lists the pairs
Case CrossedSome(TextMaker& maker, std::size_t size);  // the same with a target of 32, 16 of them pairs
Case Runs       (TextMaker& maker, std::size_t size);  // x and y of 16, whose pairs give 31 texts
Case Folds      (TextMaker& maker, std::size_t size);  // x, and a target that lists its lower case
// clang-format on

// Count of them, kept for the next who asks.
const Cases& Cached(Case (*make)(TextMaker&, std::size_t), int size, std::size_t count);

}  // namespace zor::bench
