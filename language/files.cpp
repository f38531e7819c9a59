#include "language/files.h"

#include <fmt/core.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <stdexcept>

namespace zornet {

namespace fs = std::filesystem;

std::string Files::Identity(const std::string& path) const { return fs::path(path).lexically_normal().string(); }

std::string NoFiles::Read(const std::string&) const { throw std::runtime_error("files are not read here"); }

std::string DiskFiles::Identity(const std::string& path) const {
  std::error_code error;
  const fs::path canonical = fs::weakly_canonical(path, error);
  return error ? path : canonical.string();
}

std::string DiskFiles::Read(const std::string& path) const {
  std::error_code error;
  if (fs::is_directory(path, error)) throw std::runtime_error("is a folder");
  std::ifstream in(path, std::ios::binary);
  if (!in) throw std::runtime_error(std::strerror(errno));
  const std::uintmax_t size = fs::file_size(path, error);
  std::string text = ReadText(in, error ? 0 : size);
  if (in.bad()) throw std::runtime_error(std::strerror(errno));
  return text;
}

// In pieces, since some files have no end. A file of the expected size is read with one byte more, which meets its end.
std::string ReadText(std::istream& in, std::uintmax_t expected) {
  constexpr std::size_t kMegabyte = 1 << 20, kMostMegabytes = 256, kPiece = 1 << 16;
  std::string text;
  const auto whole = static_cast<std::size_t>(std::min<std::uintmax_t>(expected, kMostMegabytes * kMegabyte));
  text.reserve(whole + kPiece);
  for (std::size_t size = 0; in; text.resize(size)) {
    if (size > kMostMegabytes * kMegabyte)
      throw std::runtime_error(fmt::format("is larger than {} MB", kMostMegabytes));
    const std::size_t piece = size < whole ? std::min(whole - size + 1, kMegabyte) : kPiece;
    text.resize(size + piece);
    size += static_cast<std::size_t>(in.read(text.data() + size, static_cast<std::streamsize>(piece)).gcount());
  }
  if (text.find('\0') != std::string::npos)
    throw std::runtime_error("is no text: it is binary, or in UTF-16 and not UTF-8");
  return text;
}

}  // namespace zornet
