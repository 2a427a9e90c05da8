// Files that appear under their names whole or not at all: written beside their places, then renamed.
#pragma once

#include <string>
#include <string_view>

namespace text {

// A name in the folder of the place that nobody else uses.
std::string NameBeside(const std::string& place);

class FileBeside {
 public:
  FileBeside() = default;
  // Removes the file where it was created and has not taken its place.
  ~FileBeside();
  FileBeside(const FileBeside&) = delete;
  FileBeside& operator=(const FileBeside&) = delete;

  // Finds the place of the target and a name beside it, and creates nothing. Symbolic links are followed, so
  // that they stay links; what the last one names need not exist. False with errno where they lead in a
  // circle, where something is there that is not a regular file, and where a file is there that its owner has
  // made read-only, although its folder would allow to replace it.
  bool FindPlace(const std::string& target);

  // Creates the file for writing, with the permissions of what it replaces. The caller closes the descriptor.
  // -1 with errno where it cannot be created. Call it once, after FindPlace.
  int Create();

  // Gives the file its place. False with errno.
  bool TakePlace();

  // Removes the file that has not taken its place; the destructor does so, too.
  void Remove();

  const std::string& place() const { return place_; }    // empty before FindPlace
  const std::string& beside() const { return beside_; }  // empty before FindPlace and after TakePlace

 private:
  std::string place_;
  std::string beside_;
};

// Writes a whole file. False with errno where it cannot be written: what was there stays.
bool ReplaceFile(const std::string& target, std::string_view content);

}  // namespace text
