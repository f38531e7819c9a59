#include "runner/diagnostics.h"

#include <fmt/core.h>

#include <algorithm>
#include <iterator>
#include <utility>

#include "runner/colour.h"

namespace zornet {

void Diagnostics::Error(Extent extent, std::string message) {
  mDropped = Full();
  if (mDropped) return;
  ++mErrors;
  mAll.push_back({Diagnostic::Error, extent, std::move(message)});
}

void Diagnostics::Note(Extent extent, std::string message) {
  if (!mDropped) mAll.push_back({Diagnostic::Note, extent, std::move(message)});
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

namespace {

// Blanks as wide as text: its tabs stay, so that what follows stands below what follows text.
std::string BlanksFor(std::string_view text) {
  std::string blanks;
  for (const char c : text) {
    if (c == '\t' || CountCharacters({&c, 1}) == 1) blanks += c == '\t' ? '\t' : ' ';
  }
  return blanks;
}

std::string Caret(std::size_t characters) {
  std::string caret(std::max<std::size_t>(characters, 1), '~');
  caret.front() = '^';
  return caret;
}

}  // namespace

std::string Render(const Source& source, const Diagnostic& diagnostic, bool colour) {
  const bool error = diagnostic.severity == Diagnostic::Error;
  const Location at = source.Locate(diagnostic.extent.begin);
  const std::string_view line = source.Line(at.line);
  const std::size_t from = std::min(diagnostic.extent.begin - source.LineBegin(at.line), line.size());
  const std::string_view extent = line.substr(from, diagnostic.extent.length);
  const Paint paint(colour);
  return fmt::format("{} {} {}\n{}\n{}{}\n",
                     paint(Style::Bold, fmt::format("{}:{}:{}:", source.Name(), at.line, at.column)),
                     error ? paint(Style::Error, "error:") : paint(Style::Note, "note:"),
                     paint(error ? Style::Bold : Style::Plain, diagnostic.message), line,
                     BlanksFor(line.substr(0, from)), paint(Style::Caret, Caret(CountCharacters(extent))));
}

std::string Render(const Source& source, const Diagnostics& diagnostics, bool colour) {
  std::string text;
  for (const Diagnostic& diagnostic : diagnostics.All()) text += Render(source, diagnostic, colour);
  if (diagnostics.Full()) text += fmt::format("{}: stopped after {} errors\n", source.Name(), diagnostics.Count());
  return text;
}

}  // namespace zornet
