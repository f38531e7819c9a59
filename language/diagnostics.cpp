#include "language/diagnostics.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace zornet {

namespace {

// A message may quote a name as long as the model.
std::string Shortened(std::string message) {
  constexpr std::size_t kLongest = 1000, kCut = kLongest / 2;
  if (message.size() <= kLongest) return message;
  return message.substr(0, kCut) + "..." + message.substr(message.size() - kCut);
}

}  // namespace

void Diagnostics::Error(Extent extent, std::string message) {
  ++mErrors;
  if (!Stopped()) mAll.push_back({Diagnostic::Error, extent, Shortened(std::move(message))});
}

void Diagnostics::Note(Extent extent, std::string message) {
  if (!Stopped()) mAll.push_back({Diagnostic::Note, extent, Shortened(std::move(message))});
}

void Diagnostics::Sort() {
  std::vector<std::vector<Diagnostic>> groups;
  for (Diagnostic& diagnostic : mAll) {
    if (diagnostic.severity == Diagnostic::Error) groups.emplace_back();
    groups.back().push_back(std::move(diagnostic));
  }
  std::stable_sort(groups.begin(), groups.end(),
                   [](const auto& a, const auto& b) { return a.front().extent.begin < b.front().extent.begin; });
  mAll.clear();
  for (auto& group : groups) std::move(group.begin(), group.end(), std::back_inserter(mAll));
}

}  // namespace zornet
