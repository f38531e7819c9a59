#include "zornet/render.h"

#include <fmt/core.h>

#include <algorithm>
#include <vector>

#include "zornet/colour.h"

namespace zornet {

namespace {

constexpr std::size_t kWindow = 120;  // characters that are shown of a line
constexpr std::size_t kAhead = 40;    // of them ahead of what is marked
constexpr std::size_t kLongestCharacter = 4;
constexpr std::string_view kCut = "...";

std::vector<std::string_view> Split(std::string_view text) {
  std::vector<std::string_view> characters;
  for (; !text.empty(); text.remove_prefix(characters.back().size()))
    characters.push_back(text.substr(0, CharacterLength(text)));
  return characters;
}

bool IsPlain(char c) { return (c >= ' ' && c <= '~') || c == '\t'; }

// What turns the direction of text, or ends a line.
bool IsFormat(std::string_view character) {
  const auto isBetween = [&](std::string_view first, std::string_view last) {
    return character >= first && character <= last;
  };
  return isBetween("\u200E", "\u200F") || isBetween("\u2028", "\u202E") || isBetween("\u2066", "\u2069");
}

std::string_view HarmlessCharacter(std::string_view character) {
  const bool good = character.size() > 1 ? character >= "\u00A0" && !IsFormat(character) : IsPlain(character.front());
  return good ? character : "?";
}

std::string Caret(std::size_t cells) {
  std::string caret(cells, '~');
  caret.front() = '^';
  return caret;
}

std::string Blank(std::string_view character) {
  return character == "\t" ? "\t" : std::string(CountCells(character), ' ');
}

// What is shown of a line is cut out of this many bytes on each side of the mark's begin.
constexpr std::size_t kReach = kWindow * kLongestCharacter;

// The line and below it the mark, of so many cells from that byte on. A tab stays one in the blanks ahead of it.
std::string MarkedLine(std::string_view line, std::size_t mark, std::size_t marked, const Paint& paint) {
  const std::size_t at = std::min(mark, line.size()), begin = at - std::min(at, kReach);
  const std::size_t end = std::min(at + kReach, line.size());
  std::vector<std::string_view> characters = Split(line.substr(begin, at - begin));
  const std::size_t from = characters.size();
  for (const std::string_view character : Split(line.substr(at, end - at))) characters.push_back(character);
  const std::size_t size = characters.size();
  const std::size_t first = size <= kWindow ? 0 : std::min(from - std::min(from, kAhead), size - kWindow);
  const std::size_t last = std::min(first + kWindow, size);
  std::string shown(begin != 0 || first != 0 ? kCut : "");
  std::string below(shown.size(), ' ');
  std::size_t room = 0;
  for (std::size_t i = first; i < last; ++i) {
    shown += HarmlessCharacter(characters[i]);
    if (i < from) {
      below += Blank(characters[i]);
    } else {
      room += CountCells(characters[i]);
    }
  }
  if (end != line.size() || last != size) shown += kCut;
  return fmt::format("{}\n{}{}", shown, below,
                     paint(Style::Caret, Caret(std::max<std::size_t>(std::min(marked, room), 1))));
}

std::string Told(const Source& source, const Diagnostic& diagnostic, const Location& at, bool colour) {
  const bool error = diagnostic.severity == Diagnostic::Error;
  const Extent marked{diagnostic.extent.begin, std::min<std::size_t>(diagnostic.extent.length, kReach)};
  const Extent line = source.LineAt(marked.begin);
  const Paint paint(colour);
  return fmt::format("{} {} {}\n{}\n",
                     paint(Style::Bold, fmt::format("{}:{}:{}:", Harmless(source.NameAt(diagnostic.extent.begin)),
                                                    at.line, at.column)),
                     error ? paint(Style::Error, "error:") : paint(Style::Note, "note:"),
                     paint(error ? Style::Bold : Style::Plain, Harmless(diagnostic.message)),
                     MarkedLine(source.Text(line), marked.begin - line.begin, MarkedLength(source, marked), paint));
}

}  // namespace

std::string Harmless(std::string_view text) {
  if (std::all_of(text.begin(), text.end(), IsPlain)) return std::string(text);
  std::string harmless;
  for (const std::string_view character : Split(text)) harmless += HarmlessCharacter(character);
  return harmless;
}

std::size_t MarkedLength(const Source& source, Extent extent) {
  return std::max<std::size_t>(CountCells(source.InLine(extent)), 1);
}

std::string Render(const Source& source, const Diagnostics& diagnostics, bool colour) {
  std::string text;
  Locator locate(source);
  for (const Diagnostic& diagnostic : diagnostics.All())
    text += Told(source, diagnostic, locate(diagnostic.extent.begin), colour);
  if (diagnostics.Stopped()) {
    text += fmt::format("{}: stopped after {} errors\n", Harmless(source.Name()), Diagnostics::kErrorLimit);
  }
  return text;
}

}  // namespace zornet
