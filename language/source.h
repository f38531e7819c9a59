// The text of a model and the places in it.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace zornet {

// A range of the source, in bytes.
struct Extent {
  std::size_t begin = 0;
  std::size_t length = 0;

  std::size_t End() const { return begin + length; }
};

// Line and column as people count them: from 1, in characters rather than bytes.
struct Location {
  std::size_t line = 1;
  std::size_t column = 1;
};

class Source {
 public:
  Source(std::string name, std::string text);

  const std::string& Name() const { return mName; }
  std::string_view Text() const { return mText; }
  std::string_view Text(Extent extent) const { return Text().substr(extent.begin, extent.length); }
  std::string_view Line(std::size_t line) const;  // without its end; lines count from 1
  std::size_t LineBegin(std::size_t line) const { return mLines[line - 1]; }
  std::string_view InLine(Extent extent) const;  // its part in the line where it begins
  std::size_t LineOf(std::size_t position) const;

 private:
  std::string mName;
  std::string mText;
  std::vector<std::size_t> mLines;  // where each begins
};

// Finds line and column of positions. Counts on from the position before where both are in one line.
class Locator {
 public:
  explicit Locator(const Source& source) : mSource(source) {}
  Location operator()(std::size_t position);

 private:
  const Source& mSource;
  std::size_t mPosition = 0;
  Location mLocation;
};

// Characters of UTF-8; a stray byte counts as one. CharacterLength: bytes of the first character, of a text that is not
// empty.
std::size_t CharacterLength(std::string_view text);
std::size_t CountCharacters(std::string_view text);

}  // namespace zornet
