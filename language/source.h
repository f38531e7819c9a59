// The texts of a model and the places in them.
#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zornet {

// A range of the source, in bytes.
struct Extent {
  constexpr Extent() = default;
  constexpr Extent(std::size_t from, std::size_t bytes)
      : begin(static_cast<std::uint32_t>(from)), length(static_cast<std::uint32_t>(bytes)) {}

  std::size_t End() const { return std::size_t{begin} + length; }

  std::uint32_t begin = 0;
  std::uint32_t length = 0;
};

// Line and column as people count them: from 1, in cells of a terminal rather than bytes.
struct Location {
  std::size_t line = 1;
  std::size_t column = 1;
};

// The file of a model and those that it names, one behind the other: a position leads to its file. Texts stay where
// they are while files are added. A byte order mark is left out.
class Source {
 public:
  Source(std::string name, std::string text) { Add(std::move(name), std::move(text)); }
  // Answers the number of the file, from 0. Throws std::runtime_error when the texts have more than 4 GB together.
  std::size_t Add(std::string name, std::string text);

  const std::string& Name() const { return mFiles.front().name; }
  const std::string& NameAt(std::size_t position) const { return FileAt(position).name; }
  std::string_view Text(Extent extent) const;  // within one file
  Extent All(std::size_t file) const { return {mFiles[file].begin, mFiles[file].text.size()}; }

  // Of the line with this position; it is without its end.
  std::size_t LineOf(std::size_t position) const;  // from 1
  Extent LineAt(std::size_t position) const;
  std::vector<Extent> LinesOf(std::size_t file) const;  // an empty one at the end is none
  std::string_view InLine(Extent extent) const;         // its part in the line where it begins

 private:
  struct File {
    std::string name, text;
    std::size_t begin;                         // its end is a position of its own
    mutable std::vector<std::uint32_t> lines;  // where each begins; empty until one is asked for

    const std::vector<std::uint32_t>& Lines() const;
  };

  const File& FileAt(std::size_t position) const;

  std::deque<File> mFiles;
};

// Finds line and column of positions. Counts on from the position before where both are in one line.
class Locator {
 public:
  explicit Locator(const Source& source) : mSource(source) {}
  Location operator()(std::size_t position);

 private:
  const Source& mSource;
  std::size_t mLine = static_cast<std::size_t>(-1);  // where it begins
  std::size_t mPosition = 0;
  Location mLocation;
};

// Characters of UTF-8, a stray byte being one. CharacterLength: bytes of the first character, of a text that is not
// empty. A terminal shows a character in 0, 1 or 2 cells.
std::size_t CharacterLength(std::string_view text);
std::size_t CountCells(std::string_view text);

}  // namespace zornet
