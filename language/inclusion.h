// The files that the items of a model name, each read once.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "language/diagnostics.h"
#include "language/files.h"
#include "language/lexer.h"
#include "language/source.h"

namespace zornet {

// What names a file: an item or a set.
struct Embedded {
  enum As { Items, Set, Nothing };  // Nothing: its items stand elsewhere

  Extent extent;
  As as;
  std::size_t file;
};

// The file of that number as one that names no files.
std::string SelfContained(const Source& source, const std::vector<Embedded>& embedded, std::size_t file = 0);

class Inclusion {
 public:
  static constexpr std::size_t kFileLimit = 1000;

  Inclusion(Source& source, const Files& files, Diagnostics& diagnostics);

  const Source& GetSource() const { return mSource; }

  // The file of that path, which is relative to the folder of the file that names it; added to the source if it is new.
  // None after an error, which is told.
  std::optional<std::size_t> Load(const Token& path);
  bool Include(std::size_t file) { return mIncluded.insert(file).second; }  // whether it is the first time

 private:
  std::optional<std::size_t> Add(const Token& path, const std::string& name);

  Source& mSource;
  const Files& mFiles;
  Diagnostics& mDiagnostics;
  std::unordered_map<std::string, std::size_t> mLoaded;  // by identity
  std::unordered_set<std::size_t> mIncluded;
};

}  // namespace zornet
