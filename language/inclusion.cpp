#include "language/inclusion.h"

#include <fmt/core.h>

#include <filesystem>
#include <stdexcept>

#include "network/texts.h"

namespace zornet {

namespace {

std::string Braces(const Source& source, std::size_t file) {
  std::string set;
  for (const Extent line : source.LinesOf(file)) set += (set.empty() ? "{" : ", ") + Quoted(source.Text(line));
  return set + '}';
}

}  // namespace

std::string SelfContained(const Source& source, const std::vector<Embedded>& embedded, std::size_t file) {
  const Extent all = source.All(file);
  std::string text;
  std::size_t copied = all.begin;
  for (const Embedded& named : embedded) {
    if (named.extent.begin < all.begin || named.extent.begin >= all.End()) continue;
    text += source.Text({copied, named.extent.begin - copied});
    if (named.as == Embedded::Items) text += SelfContained(source, embedded, named.file);
    if (named.as == Embedded::Set) text += Braces(source, named.file);
    copied = named.extent.End();
  }
  return text += source.Text({copied, all.End() - copied});
}

Inclusion::Inclusion(Source& source, const Files& files, Diagnostics& diagnostics)
    : mSource(source), mFiles(files), mDiagnostics(diagnostics) {
  mLoaded.emplace(files.Identity(source.Name()), 0);
  Include(0);
}

std::optional<std::size_t> Inclusion::Load(const Token& path) {
  const std::filesystem::path folder = std::filesystem::path(mSource.NameAt(path.extent.begin)).parent_path();
  const std::string name = (folder / Unescaped(path)).string();
  const auto [known, isNew] = mLoaded.try_emplace(mFiles.Identity(name), mLoaded.size());
  if (!isNew) return known->second;
  const std::optional<std::size_t> file = Add(path, name);
  if (!file) mLoaded.erase(known);
  return file;
}

std::optional<std::size_t> Inclusion::Add(const Token& path, const std::string& name) {
  try {
    if (mLoaded.size() > kFileLimit) throw std::runtime_error(fmt::format("a model has at most {} files", kFileLimit));
    return mSource.Add(name, mFiles.Read(name));
  } catch (const std::runtime_error& error) {
    mDiagnostics.Error(path.extent, fmt::format("cannot read '{}': {}", name, error.what()));
    return std::nullopt;
  }
}

}  // namespace zornet
