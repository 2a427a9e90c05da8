#include "tools/mayascene/SceneSearch.h"

#include <dirent.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <set>
#include <string_view>
#include <utility>

namespace mayascene {
namespace {

constexpr std::string_view kEnding = ".ma";

char lowered(char letter) {
  return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
}

bool namesScene(std::string_view path) {
  if (path.size() < kEnding.size()) return false;
  path.remove_prefix(path.size() - kEnding.size());
  return std::equal(path.begin(), path.end(), kEnding.begin(),
                    [](char letter, char wanted) { return lowered(letter) == wanted; });
}

std::string joined(const std::string& folder, const std::string& name) {
  return folder.back() == '/' ? folder + name : folder + '/' + name;
}

// The names in a folder that do not begin with ".", sorted. False with errno set when there may be more. The
// folder is closed before another one is opened, so that depth needs no descriptors.
bool readNames(const std::string& folder, std::vector<std::string>* names) {
  DIR* const opened = ::opendir(folder.c_str());
  if (opened == nullptr) return false;
  errno = 0;
  for (const dirent* entry = ::readdir(opened); entry != nullptr; entry = ::readdir(opened)) {
    if (entry->d_name[0] != '.') names->emplace_back(entry->d_name);
    errno = 0;
  }
  const int failure = errno;
  ::closedir(opened);
  std::sort(names->begin(), names->end());
  errno = failure;
  return failure == 0;
}

class Search {
 public:
  explicit Search(FoundScenes* found) : found_(found) {}

  // A stack instead of recursion: folders may be nested as deeply as a path is long.
  void argument(const std::string& path) {
    struct stat status {};
    if (::stat(path.c_str(), &status) != 0 || !S_ISDIR(status.st_mode)) {
      found_->scenes.push_back(path);
      return;
    }
    const std::size_t before = found_->scenes.size() + found_->unread.size();
    searchedBefore_ = false;
    waiting_.push_back(path);
    while (!waiting_.empty()) {
      const std::string next = std::move(waiting_.back());
      waiting_.pop_back();
      visit(next);
    }
    const bool nothing = found_->scenes.size() + found_->unread.size() == before;
    if (nothing && !searchedBefore_) found_->empty.push_back(path);
  }

 private:
  void visit(const std::string& path) {
    struct stat status {};
    const bool known = ::stat(path.c_str(), &status) == 0;
    const int failure = errno;
    if (known && S_ISDIR(status.st_mode)) {
      if (!searched_.insert({status.st_dev, status.st_ino}).second) {
        searchedBefore_ = true;
        return;
      }
      open(path);
    } else if (namesScene(path)) {
      found_->scenes.push_back(path);
    } else if (!known && failure != ENOENT && failure != ELOOP) {
      found_->unread.push_back({path, sentence(failure)});
    }
  }

  void open(const std::string& folder) {
    std::vector<std::string> names;
    if (!readNames(folder, &names)) found_->unread.push_back({folder, sentence(errno)});
    // The first name is pushed last, because the last one is taken first.
    for (auto name = names.rbegin(); name != names.rend(); ++name) {
      waiting_.push_back(joined(folder, *name));
    }
  }

  static std::string sentence(int failure) {
    return std::string("cannot be searched: ") + std::strerror(failure);
  }

  FoundScenes* found_;
  std::vector<std::string> waiting_;
  std::set<std::pair<dev_t, ino_t>> searched_;
  bool searchedBefore_ =
      false;  // whether a folder of this argument was already searched for another argument
};

}  // namespace

FoundScenes findScenes(const std::vector<std::string>& arguments) {
  FoundScenes found;
  Search search(&found);
  for (const std::string& path : arguments) search.argument(path);
  return found;
}

}  // namespace mayascene
