#include <fmt/core.h>

#include "zornet/render.h"
#include "zornet/report.h"

namespace zornet {

namespace {

constexpr std::string_view kBlanks = " \t\r\n\v\f";

}  // namespace

OperationCount Total(const std::vector<OperationCount>& counts) {
  OperationCount total;
  for (const OperationCount& count : counts) {
    total.calls += count.calls;
    total.changes += count.changes;
    total.contradictions += count.contradictions;
  }
  return total;
}

// On one line: runs of blanks outside of quotes become one, and comments go.
std::string Names::Written(Extent extent) const {
  std::string written;
  bool quoted = false, escaped = false, comment = false;
  for (const char c : mSource.Text(extent)) {
    if (comment) {
      comment = c != '\n';
      continue;
    }
    if (c == '"' && !escaped) quoted = !quoted;
    escaped = quoted && c == '\\' && !escaped;
    comment = c == '%' && !quoted;
    const bool blank = !quoted && kBlanks.find(c) != std::string_view::npos;
    if (!comment && !(blank && written.ends_with(' '))) written += blank ? ' ' : c;
  }
  return Harmless(written);
}

std::string Names::OfConstraint(int constraint) const {
  return Written(mPlaces.constraints[static_cast<std::size_t>(constraint)]);
}

std::string Names::OfVariable(int variable) const {
  const auto at = static_cast<std::size_t>(variable);
  const Variable& declared = mModel.Variables()[at];
  return declared.constant ? Written(mPlaces.variables[at]) : declared.name;
}

std::string Names::DeclarationOf(int variable) const {
  return Written(mSource.LineAt(mPlaces.variables[static_cast<std::size_t>(variable)].begin));
}

std::size_t Names::LineOfConstraint(int constraint) const {
  return mSource.LineOf(mPlaces.constraints[static_cast<std::size_t>(constraint)].begin);
}

const std::string& Names::FileOfConstraint(int constraint) const {
  return mSource.NameAt(mPlaces.constraints[static_cast<std::size_t>(constraint)].begin);
}

std::string Names::PlaceOfConstraint(int constraint) const {
  return constraint == kNone ? Harmless(mSource.Name())
                             : Place(mPlaces.constraints[static_cast<std::size_t>(constraint)]);
}

std::string Names::PlaceOfVariable(int variable) const {
  return Place(mPlaces.variables[static_cast<std::size_t>(variable)]);
}

std::string Names::Place(Extent extent) const {
  return fmt::format("{}:{}", Harmless(mSource.NameAt(extent.begin)), mSource.LineOf(extent.begin));
}

}  // namespace zornet
