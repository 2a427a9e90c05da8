// Changes scenes by their grammar: commands, node kinds, names, options, numbers.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace fuzz {

// Small, and the same everywhere for one seed.
class Dice {
 public:
  explicit Dice(std::uint64_t seed) : state_(seed) {}

  std::uint32_t Roll();
  std::size_t Below(std::size_t bound) { return Roll() % bound; }  // the bound is not 0
  bool OneIn(std::size_t count) { return Below(count) == 0; }

  template <std::size_t Count>
  std::string_view Pick(const std::string_view (&words)[Count]) {
    return words[Below(Count)];
  }

 private:
  std::uint64_t state_;
};

// A whole command, with its ";" and line end. Names come from a small set, so that commands refer to the same
// nodes.
std::string MakeCommand(Dice& dice);

// One change: a command made, taken out, doubled or moved; a token replaced, put in or taken out; the end cut
// off.
std::string MutateScene(std::string_view scene, Dice& dice);

}  // namespace fuzz
