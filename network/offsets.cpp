#include "network/offsets.h"

#include <algorithm>
#include <numeric>
#include <optional>
#include <utility>
#include <vector>

#include "network/ZORNetwork.h"

namespace zornet {

namespace {

// Disjoint sets of integers whose distances are known.
class Offsets {
 public:
  explicit Offsets(std::size_t variables) : mParents(variables), mOffsets(variables, 0) {
    std::iota(mParents.begin(), mParents.end(), 0);
  }

  // y - x, where it is known.
  std::optional<std::int64_t> Distance(int x, int y) {
    const Place from = Find(x), to = Find(y);
    if (from.root != to.root) return std::nullopt;
    return to.offset - from.offset;
  }

  // Takes y - x = distance. False when it is known to be another.
  bool Join(int x, int y, std::int64_t distance) {
    const Place from = Find(x), to = Find(y);
    if (from.root == to.root) return to.offset - from.offset == distance;
    mParents[to.root] = from.root;
    mOffsets[to.root] = from.offset + distance - to.offset;
    return true;
  }

 private:
  struct Place {
    std::size_t root;
    std::int64_t offset;  // from the root
  };

  Place Find(int variable) {
    const auto start = static_cast<std::size_t>(variable);
    Place place{start, 0};
    while (mParents[place.root] != place.root) {
      place.offset += mOffsets[place.root];
      place.root = mParents[place.root];
    }
    std::int64_t offset = place.offset;
    for (std::size_t v = start; v != place.root;) {
      const std::size_t next = std::exchange(mParents[v], place.root);
      offset -= std::exchange(mOffsets[v], offset);
      v = next;
    }
    return place;
  }

  std::vector<std::size_t> mParents;
  std::vector<std::int64_t> mOffsets;  // from the parent
};

bool IsPosted(const Constraint& constraint, Meaning meaning) {
  return constraint.kind->meaning == meaning && constraint.kind->IsOfNumbers() && !constraint.kind->reified;
}

std::optional<std::int64_t> ConstantOf(const Model& model, int variable) {
  const std::vector<std::int32_t>& numbers = model.Variables()[static_cast<std::size_t>(variable)].numbers;
  if (numbers.empty() || numbers.front() != numbers.back()) return std::nullopt;
  return numbers.front();
}

// Whether a sum has two inputs, of which one is a constant.
bool IsOffset(const Model& model, const Constraint& constraint) {
  return IsPosted(constraint, Meaning::Sum) && constraint.Inputs() == 2 &&
         (ConstantOf(model, constraint.arguments[0]) || ConstantOf(model, constraint.arguments[1]));
}

// False when it contradicts what was taken before.
bool Take(const Model& model, const Constraint& constraint, Offsets& offsets) {
  const auto arguments = constraint.arguments;
  if (IsPosted(constraint, Meaning::Equal)) return offsets.Join(arguments[0], arguments[1], 0);
  if (!IsOffset(model, constraint)) return true;
  const bool behind = ConstantOf(model, arguments[1]).has_value();
  return offsets.Join(arguments[behind ? 0 : 1], arguments[2], *ConstantOf(model, arguments[behind ? 1 : 0]));
}

bool Allows(const Constraint& constraint, Offsets& offsets) {
  const auto distance = [&] { return offsets.Distance(constraint.arguments[0], constraint.arguments[1]); };
  if (IsPosted(constraint, Meaning::Less)) return distance().value_or(1) > 0;
  if (IsPosted(constraint, Meaning::LessOrEqual)) return distance().value_or(0) >= 0;
  return !IsPosted(constraint, Meaning::Unequal) || distance() != 0;
}

}  // namespace

int FindOffsetConflict(const Model& model) {
  const auto& constraints = model.Constraints();
  const auto isOffset = [&](const Constraint& constraint) { return IsOffset(model, constraint); };
  if (std::none_of(constraints.begin(), constraints.end(), isOffset)) return kNone;
  Offsets offsets(model.Variables().size());
  const auto find = [&](auto good) {
    const auto found = std::find_if_not(constraints.begin(), constraints.end(), good);
    return found != constraints.end() ? static_cast<int>(found - constraints.begin()) : kNone;
  };
  const int taken = find([&](const Constraint& constraint) { return Take(model, constraint, offsets); });
  if (taken != kNone) return taken;
  return find([&](const Constraint& constraint) { return Allows(constraint, offsets); });
}

}  // namespace zornet
