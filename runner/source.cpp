#include "runner/source.h"

#include <algorithm>
#include <utility>

namespace zornet {

Source::Source(std::string name, std::string text) : mName(std::move(name)), mText(std::move(text)), mLines{0} {
  for (std::size_t i = 0; i < mText.size(); ++i) {
    if (mText[i] == '\n') mLines.push_back(i + 1);
  }
}

std::string_view Source::Line(std::size_t line) const {
  const std::size_t begin = LineBegin(line);
  std::string_view text = Text().substr(begin, Text().find('\n', begin) - begin);
  if (text.ends_with('\r')) text.remove_suffix(1);
  return text;
}

Location Source::Locate(std::size_t position) const {
  position = std::min(position, mText.size());
  const auto next = std::upper_bound(mLines.begin(), mLines.end(), position);
  const auto line = static_cast<std::size_t>(next - mLines.begin());
  const std::size_t begin = LineBegin(line);
  return {line, 1 + CountCharacters(Text().substr(begin, position - begin))};
}

std::size_t CountCharacters(std::string_view text) {
  return static_cast<std::size_t>(
      std::count_if(text.begin(), text.end(), [](char c) { return (static_cast<unsigned char>(c) & 0xC0) != 0x80; }));
}

}  // namespace zornet
