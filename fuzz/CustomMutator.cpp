// The function that the fuzzer's library calls for a changed scene. Linked to the targets that read scenes.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>

#include "fuzz/Bytes.h"
#include "fuzz/SceneMutator.h"

extern "C" {

// The library's own changes, which know bytes and the dictionary.
std::size_t LLVMFuzzerMutate(std::uint8_t* data, std::size_t size, std::size_t maxSize);

std::size_t LLVMFuzzerCustomMutator(std::uint8_t* data, std::size_t size, std::size_t maxSize, unsigned seed);
}

std::size_t LLVMFuzzerCustomMutator(std::uint8_t* data, std::size_t size, std::size_t maxSize,
                                    unsigned seed) {
  fuzz::Dice dice(seed);
  if (dice.OneIn(3)) return LLVMFuzzerMutate(data, size, maxSize);
  std::string scene(fuzz::TextOf(data, size));
  for (std::size_t changes = 1 + dice.Below(4); changes > 0; --changes)
    scene = fuzz::MutateScene(scene, dice);
  const std::size_t newSize = std::min(scene.size(), maxSize);
  std::copy_n(scene.begin(), newSize, data);
  return newSize;
}
