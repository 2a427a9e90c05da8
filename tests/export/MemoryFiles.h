// The outputs of a writer, kept in memory.
#pragma once

#include <cstddef>
#include <map>
#include <memory>
#include <sstream>
#include <string>
#include <string_view>

#include "export/Format.h"

namespace exporttest {

class MemoryFiles : public interchange::Files {
 public:
  // `failing`: which of the outputs, counted from 1, cannot be made.
  explicit MemoryFiles(std::size_t failing = 0) : failing_(failing) {}

  std::ostream* Main() override { return Next() ? &main_ : nullptr; }

  std::ostream* Beside(std::string_view stem, std::string_view suffix, std::string* name) override {
    if (!Next()) return nullptr;
    *name = std::string(stem) + std::string(suffix);
    for (int number = 2; beside_.contains(*name); ++number) {
      *name = std::string(stem) + '_' + std::to_string(number) + std::string(suffix);
    }
    return &beside_[*name];
  }

  std::string main() const { return main_.str(); }
  const std::map<std::string, std::ostringstream>& beside() const { return beside_; }

 private:
  bool Next() { return ++made_ != failing_; }

  std::size_t failing_;
  std::size_t made_ = 0;
  std::ostringstream main_;
  std::map<std::string, std::ostringstream> beside_;
};

}  // namespace exporttest
