#include "tools/mayascene/FileSet.h"

#include <filesystem>
#include <optional>
#include <system_error>

#include <sys/stat.h>

namespace mayascene {
namespace {

namespace fs = std::filesystem;

std::optional<std::pair<dev_t, ino_t>> fileAt(const std::string& path) {
  struct stat found {};
  if (::stat(path.c_str(), &found) != 0) return std::nullopt;
  return std::pair(found.st_dev, found.st_ino);
}

std::string wholeName(const std::string& path) {
  std::error_code error;
  const fs::path absolute = fs::absolute(path, error);
  const fs::path whole = fs::weakly_canonical(absolute, error);
  return (error ? absolute.lexically_normal() : whole).string();
}

}  // namespace

void FileSet::add(const std::string& path) {
  if (const auto file = fileAt(path)) files_.insert(*file);
  paths_.insert(wholeName(path));
}

bool FileSet::contains(const std::string& path) const {
  const auto file = fileAt(path);
  return (file && files_.contains(*file)) || paths_.contains(wholeName(path));
}

}  // namespace mayascene
