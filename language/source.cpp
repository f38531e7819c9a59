#include "language/source.h"

#include <locale.h>
#include <wchar.h>

#include <algorithm>
#include <iterator>
#include <stdexcept>
#include <utility>

namespace zornet {

namespace {

char32_t Decode(std::string_view character) {
  const auto first = static_cast<unsigned char>(character.front());
  char32_t code = character.size() == 1 ? first : first & (0x7Fu >> character.size());
  for (const char c : character.substr(1)) code = code << 6 | (static_cast<unsigned char>(c) & 0x3Fu);
  return code;
}

// The library knows widths by locale, and the one of the user need not be of UTF-8.
int WidthOf(char32_t code) {
  static const locale_t utf8 = newlocale(LC_CTYPE_MASK, "C.UTF-8", nullptr);
  if (utf8 == nullptr) return 1;
  const locale_t before = uselocale(utf8);
  const int width = wcwidth(static_cast<wchar_t>(code));
  uselocale(before);
  return width;
}

}  // namespace

std::size_t Source::Add(std::string name, std::string text) {
  constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
  if (text.starts_with(kByteOrderMark)) text.erase(0, kByteOrderMark.size());
  const std::size_t begin = mFiles.empty() ? 0 : mFiles.back().begin + mFiles.back().text.size() + 1;
  if (text.size() >= UINT32_MAX - begin) throw std::runtime_error("the files of a model have more than 4 GB together");
  mFiles.push_back({std::move(name), std::move(text), begin, {}});
  return mFiles.size() - 1;
}

const std::vector<std::uint32_t>& Source::File::Lines() const {
  if (!lines.empty()) return lines;
  lines.reserve(1 + static_cast<std::size_t>(std::count(text.begin(), text.end(), '\n')));
  lines.push_back(static_cast<std::uint32_t>(begin));
  for (std::size_t end = text.find('\n'); end != std::string::npos; end = text.find('\n', end + 1))
    lines.push_back(static_cast<std::uint32_t>(begin + end + 1));
  return lines;
}

const Source::File& Source::FileAt(std::size_t position) const {
  const auto next = std::upper_bound(mFiles.begin(), mFiles.end(), position,
                                     [](std::size_t at, const File& file) { return at < file.begin; });
  return *std::prev(next);
}

std::string_view Source::Text(Extent extent) const {
  const File& file = FileAt(extent.begin);
  return std::string_view(file.text).substr(extent.begin - file.begin, extent.length);
}

std::size_t Source::LineOf(std::size_t position) const {
  const std::vector<std::uint32_t>& lines = FileAt(position).Lines();
  return static_cast<std::size_t>(std::upper_bound(lines.begin(), lines.end(), position) - lines.begin());
}

Extent Source::LineAt(std::size_t position) const {
  const File& file = FileAt(position);
  const std::vector<std::uint32_t>& lines = file.Lines();
  const std::size_t line = LineOf(position), begin = lines[line - 1];
  std::size_t end = line < lines.size() ? lines[line] - 1 : file.begin + file.text.size();
  if (end > begin && file.text[end - file.begin - 1] == '\r') --end;
  return {begin, end - begin};
}

std::vector<Extent> Source::LinesOf(std::size_t file) const {
  std::vector<Extent> lines;
  const std::size_t end = All(file).End();
  for (const std::size_t begin : mFiles[file].Lines()) {
    if (begin < end) lines.push_back(LineAt(begin));
  }
  return lines;
}

std::string_view Source::InLine(Extent extent) const {
  const std::size_t end = LineAt(extent.begin).End(), begin = std::min<std::size_t>(extent.begin, end);
  return Text({begin, std::min<std::size_t>(extent.length, end - begin)});
}

Location Locator::operator()(std::size_t position) {
  const std::size_t line = mSource.LineAt(position).begin;
  if (line != mLine || position < mPosition) {
    mLocation = {mSource.LineOf(position), 1};
    mLine = mPosition = line;
  }
  mLocation.column += CountCells(mSource.Text({mPosition, position - mPosition}));
  mPosition = position;
  return mLocation;
}

std::size_t CharacterLength(std::string_view text) {
  const auto first = static_cast<unsigned char>(text.front());
  const std::size_t length = first < 0xC2 || first > 0xF4 ? 1 : first < 0xE0 ? 2 : first < 0xF0 ? 3 : 4;
  if (length > text.size()) return 1;
  const auto goesOn = [](char c) { return (static_cast<unsigned char>(c) & 0xC0) == 0x80; };
  return std::all_of(text.begin() + 1, text.begin() + static_cast<std::ptrdiff_t>(length), goesOn) ? length : 1;
}

// What no terminal shows stands as one character in its place.
std::size_t CountCells(std::string_view text) {
  std::size_t cells = 0;
  while (!text.empty()) {
    const std::size_t length = CharacterLength(text);
    const int width = length == 1 ? 1 : WidthOf(Decode(text.substr(0, length)));
    cells += width < 0 ? 1 : static_cast<std::size_t>(width);
    text.remove_prefix(length);
  }
  return cells;
}

}  // namespace zornet
