#include "network/order_cycles.h"

#include <algorithm>
#include <numeric>
#include <vector>

#include "network/ZORNetwork.h"
#include "network/components.h"

namespace zornet {

namespace {

// What is ordered by a posted constraint: x <= y, or x < y; equal texts are ordered both ways.
template <class Visit>
void ForEachOrder(const Model& model, Visit visit) {
  for (const Constraint& constraint : model.Constraints()) {
    const Kind& kind = *constraint.kind;
    if (!kind.IsComparison() || kind.reified || kind.meaning == Meaning::Unequal) continue;
    const auto x = static_cast<std::size_t>(constraint.arguments[kind.mirrored ? 1 : 0]);
    const auto y = static_cast<std::size_t>(constraint.arguments[kind.mirrored ? 0 : 1]);
    visit(x, y, constraint);
    if (kind.meaning == Meaning::Equal) visit(y, x, constraint);
  }
}

// The variables in strong components: two have the same one when each is ordered before the other.
Components FindComponents(const Model& model) {
  std::vector<std::size_t> first(model.Variables().size() + 1, 0);
  ForEachOrder(model, [&](std::size_t x, std::size_t, const Constraint&) { ++first[x + 1]; });
  std::partial_sum(first.begin(), first.end(), first.begin());
  std::vector<std::size_t> greater(first.back()), next(first.begin(), first.end() - 1);
  ForEachOrder(model, [&](std::size_t x, std::size_t y, const Constraint&) { greater[next[x]++] = y; });
  Components components;
  components.Find(first, greater);
  return components;
}

bool HasStrictOrder(const Model& model) {
  const auto& constraints = model.Constraints();
  return std::any_of(constraints.begin(), constraints.end(), [](const Constraint& constraint) {
    return constraint.kind->meaning == Meaning::Less && !constraint.kind->reified;
  });
}

}  // namespace

int FindOrderCycle(const Model& model) {
  if (!HasStrictOrder(model)) return kNone;
  const Components components = FindComponents(model);
  int found = kNone;
  ForEachOrder(model, [&](std::size_t x, std::size_t y, const Constraint& constraint) {
    if (found == kNone && constraint.kind->meaning == Meaning::Less && components.Of(x) == components.Of(y))
      found = static_cast<int>(&constraint - model.Constraints().data());
  });
  return found;
}

}  // namespace zornet
