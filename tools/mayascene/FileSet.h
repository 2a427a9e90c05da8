// A set of files, by what their paths lead to.
#pragma once

#include <set>
#include <string>
#include <utility>

#include <sys/types.h>

namespace mayascene {

// The files need not be there: a file that is there counts under every path that leads to it, and any other
// under its own path, from the root and with the links of its folders followed.
class FileSet {
 public:
  void add(const std::string& path);
  bool contains(const std::string& path) const;

 private:
  std::set<std::pair<dev_t, ino_t>> files_;  // that are there
  std::set<std::string> paths_;
};

}  // namespace mayascene
