// The files that a model names.
#pragma once

#include <cstdint>
#include <istream>
#include <string>

namespace zornet {

// Where they come from. What cannot be read throws std::runtime_error, which says why.
class Files {
 public:
  virtual ~Files() = default;
  virtual std::string Identity(const std::string& path) const;  // the same for all paths that lead to one file
  virtual std::string Read(const std::string& path) const = 0;
};

class NoFiles : public Files {
 public:
  std::string Read(const std::string& path) const override;
};

class DiskFiles : public Files {
 public:
  std::string Identity(const std::string& path) const override;
  std::string Read(const std::string& path) const override;
};

// All that is left, which is text of at most 256 MB. Makes room for what is expected.
std::string ReadText(std::istream& in, std::uintmax_t expected = 0);

}  // namespace zornet
