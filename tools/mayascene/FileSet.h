// A set of files, whatever paths lead to them.
#pragma once

#include <set>
#include <string>
#include <utility>

#include <sys/types.h>

namespace mayascene {

// A file that exists is found under every path that leads to it. One that does not exist is found under its
// whole path, with the links of its folders followed.
class FileSet {
 public:
  void add(const std::string& path);
  bool contains(const std::string& path) const;

 private:
  std::set<std::pair<dev_t, ino_t>> files_;  // that are there
  std::set<std::string> paths_;
};

}  // namespace mayascene
