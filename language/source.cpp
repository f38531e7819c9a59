#include "language/source.h"

#include <algorithm>
#include <utility>

namespace zornet {

Source::Source(std::string name, std::string text) : mName(std::move(name)), mText(std::move(text)), mLines{0} {
  mLines.reserve(1 + static_cast<std::size_t>(std::count(mText.begin(), mText.end(), '\n')));
  for (std::size_t end = mText.find('\n'); end != std::string::npos; end = mText.find('\n', end + 1))
    mLines.push_back(end + 1);
}

std::string_view Source::Line(std::size_t line) const {
  const std::size_t begin = LineBegin(line);
  const std::size_t end = line < mLines.size() ? LineBegin(line + 1) - 1 : mText.size();
  std::string_view text = Text().substr(begin, end - begin);
  if (text.ends_with('\r')) text.remove_suffix(1);
  return text;
}

std::string_view Source::InLine(Extent extent) const {
  const std::size_t line = LineOf(extent.begin);
  const std::string_view text = Line(line);
  return text.substr(std::min(extent.begin - LineBegin(line), text.size()), extent.length);
}

std::size_t Source::LineOf(std::size_t position) const {
  const auto next = std::upper_bound(mLines.begin(), mLines.end(), position);
  return static_cast<std::size_t>(next - mLines.begin());
}

Location Locator::operator()(std::size_t position) {
  const std::size_t line = mSource.LineOf(position);
  if (line != mLocation.line || position < mPosition) {
    mLocation = {line, 1};
    mPosition = mSource.LineBegin(line);
  }
  mLocation.column += CountCharacters(mSource.Text({mPosition, position - mPosition}));
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

std::size_t CountCharacters(std::string_view text) {
  std::size_t count = 0;
  for (; !text.empty(); ++count) text.remove_prefix(CharacterLength(text));
  return count;
}

}  // namespace zornet
