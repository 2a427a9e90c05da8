// Compositions made by chance that are hard on writers, and a place in memory for what is written.
#pragma once

#include <cstddef>
#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <sstream>
#include <string>
#include <utility>

#include "export/Composition.h"
#include "export/Format.h"

namespace interchange_test {

// How many a writer is tested with; each has a seed from 0 on.
inline constexpr std::uint64_t kHostileCompositions = 1000;

// The same composition for the same seed, on every platform. Names of any bytes, empty, long, the same twice,
// formulas, markup, paths; numbers huge, tiny, and in some of them not finite; one frame and many, values
// that stay, that move at every frame, and that have keys here and there; no layers, no camera; parents after
// their children, deep chains, and circles in some; lenses and pictures of all sizes, and
// of none; first frames so large that the next frame has the same number in 64 bits.
interchange::Composition HostileComposition(std::uint64_t seed);

// Outputs in memory.
class FilesInMemory : public interchange::Files {
 public:
  // `stem`: the name of the main output, without a suffix.
  explicit FilesInMemory(std::string stem = "shot") : stem_(std::move(stem)) {}

  std::ostream* Main() override;
  std::ostream* Beside(std::string_view part, std::string_view suffix, std::string* name) override;

  // What was written; empty where nothing was.
  std::string main() const { return main_ ? main_->str() : ""; }
  bool hasMain() const { return main_ != nullptr; }
  std::map<std::string, std::string> beside() const;  // by name

 private:
  std::string stem_;
  std::unique_ptr<std::ostringstream> main_;
  std::map<std::string, std::unique_ptr<std::ostringstream>> beside_;
};

}  // namespace interchange_test
