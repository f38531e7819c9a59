#include "zornet/render.h"

#include <fmt/core.h>

#include <algorithm>
#include <vector>

#include "zornet/colour.h"

namespace zornet {

namespace {

constexpr std::size_t kWindow = 120;  // characters that are shown of a line
constexpr std::size_t kAhead = 40;    // of them ahead of what is marked
constexpr std::string_view kCut = "...";

std::vector<std::string_view> Split(std::string_view text) {
  std::vector<std::string_view> characters;
  for (; !text.empty(); text.remove_prefix(characters.back().size()))
    characters.push_back(text.substr(0, CharacterLength(text)));
  return characters;
}

// Control characters, also those of eight bits, and stray bytes could act on a terminal.
std::string_view Harmless(std::string_view character) {
  const char c = character.front();
  const bool good = character.size() > 1 ? character >= "\xC2\xA0" : (c >= ' ' && c <= '~') || c == '\t';
  return good ? character : "?";
}

std::string Harmless(const std::string& text) {
  std::string harmless;
  for (const std::string_view character : Split(text)) harmless += Harmless(character);
  return harmless;
}

std::string Caret(std::size_t characters) {
  std::string caret(characters, '~');
  caret.front() = '^';
  return caret;
}

// The line and below it the mark, both counted in characters. A tab stays one in the blanks ahead of the mark.
std::string MarkedLine(std::string_view line, std::size_t from, std::size_t marked, const Paint& paint) {
  const std::vector<std::string_view> characters = Split(line);
  const std::size_t size = characters.size();
  const std::size_t first = size <= kWindow ? 0 : std::min(from - std::min(from, kAhead), size - kWindow);
  const std::size_t last = std::min(first + kWindow, size);
  std::string shown(first != 0 ? kCut : "");
  std::string below(shown.size(), ' ');
  for (std::size_t i = first; i < last; ++i) {
    shown += Harmless(characters[i]);
    if (i < from) below += characters[i] == "\t" ? '\t' : ' ';
  }
  if (last != size) shown += kCut;
  const std::size_t room = std::max<std::size_t>(last - std::min(from, last), 1);
  return fmt::format("{}\n{}{}", shown, below, paint(Style::Caret, Caret(std::min(marked, room))));
}

}  // namespace

std::size_t MarkedLength(const Source& source, Extent extent) {
  return std::max<std::size_t>(CountCharacters(source.InLine(extent)), 1);
}

std::string Render(const Source& source, const Diagnostic& diagnostic, bool colour) {
  const bool error = diagnostic.severity == Diagnostic::Error;
  const Location at = source.Locate(diagnostic.extent.begin);
  const Paint paint(colour);
  return fmt::format("{} {} {}\n{}\n", paint(Style::Bold, fmt::format("{}:{}:{}:", source.Name(), at.line, at.column)),
                     error ? paint(Style::Error, "error:") : paint(Style::Note, "note:"),
                     paint(error ? Style::Bold : Style::Plain, Harmless(diagnostic.message)),
                     MarkedLine(source.Line(at.line), at.column - 1, MarkedLength(source, diagnostic.extent), paint));
}

std::string Render(const Source& source, const Diagnostics& diagnostics, bool colour) {
  std::string text;
  for (const Diagnostic& diagnostic : diagnostics.All()) text += Render(source, diagnostic, colour);
  if (diagnostics.Stopped()) {
    text += fmt::format("{}: stopped after {} errors\n", source.Name(), Diagnostics::kErrorLimit);
  }
  return text;
}

}  // namespace zornet
