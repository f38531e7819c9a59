#include "language/spelling.h"

#include <fmt/core.h>

#include <algorithm>
#include <numeric>
#include <vector>

namespace zornet {

namespace {

constexpr std::size_t kLongestWord = 64;  // nobody slips in a longer one, and comparing takes the square of its length

// Letters to insert, to drop, to replace or to exchange with a neighbour to make b of a.
std::size_t Distance(std::string_view a, std::string_view b) {
  std::vector<std::size_t> before(b.size() + 1), row(b.size() + 1), next(b.size() + 1);
  std::iota(row.begin(), row.end(), std::size_t{0});
  for (std::size_t i = 1; i <= a.size(); ++i) {
    next[0] = i;
    for (std::size_t j = 1; j <= b.size(); ++j) {
      next[j] = std::min({row[j] + 1, next[j - 1] + 1, row[j - 1] + (a[i - 1] != b[j - 1])});
      const bool exchanged = i > 1 && j > 1 && a[i - 1] == b[j - 2] && a[i - 2] == b[j - 1];
      if (exchanged) next[j] = std::min(next[j], before[j - 2] + 1);
    }
    std::swap(before, row);
    std::swap(row, next);
  }
  return row.back();
}

}  // namespace

std::string_view Closest(std::string_view word, std::span<const std::string_view> words) {
  if (word.size() > kLongestWord) return {};
  std::size_t nearest = word.size() / 3 + 1;  // one slip, and one more for every three letters
  std::string_view found;
  for (const std::string_view other : words) {
    if (other.size() > word.size() + nearest || word.size() > other.size() + nearest) continue;
    const std::size_t distance = Distance(word, other);
    if (distance > nearest || distance >= std::max(word.size(), other.size())) continue;
    if (distance == nearest && !found.empty()) continue;
    nearest = distance;
    found = other;
  }
  return found;
}

std::string Suggestion(std::string_view word, std::span<const std::string_view> words) {
  return Suggestion(Closest(word, words));
}

std::string Suggestion(std::string_view closest) {
  return closest.empty() ? "" : fmt::format("; did you mean '{}'?", closest);
}

}  // namespace zornet
