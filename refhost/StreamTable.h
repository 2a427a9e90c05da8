// The streams that a layer has from its creation: names, dimensions and defaults.
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "refhost/Project.h"

namespace refhost {

// The streams of a layer of that kind, in the order of their numbers, with the defaults that do not depend on
// the composition.
std::vector<Stream> makeStreams(LayerKind kind);

// The place of the stream of that number among a layer's; beyond all of them for a number that no layer has.
inline constexpr std::uint8_t kNoStreamPlace = 7;
inline constexpr std::uint8_t kStreamPlaces[] = {
    0, 1, 2, 3, kNoStreamPlace, kNoStreamPlace, kNoStreamPlace, kNoStreamPlace, 4, 5, kNoStreamPlace, 6};
constexpr std::size_t streamPlace(std::int32_t id) {
  return static_cast<std::uint32_t>(id) < sizeof kStreamPlaces ? kStreamPlaces[id] : kNoStreamPlace;
}

// "position"; a camera's anchor point is its "point of interest".
const char* streamName(std::int32_t id, LayerKind kind);

}  // namespace refhost
