// The parts that several workloads use.
#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>

#include "bench/SceneText.h"

namespace bench {

struct Channel {
  std::string_view attribute;
  std::string_view suffix;
  std::string_view curveType;
};

// The channels of a transform: three of place, of rotation, of scale.
inline constexpr std::array<Channel, 9> kChannels = {{
    {"tx", "translateX", "animCurveTL"},
    {"ty", "translateY", "animCurveTL"},
    {"tz", "translateZ", "animCurveTL"},
    {"rx", "rotateX", "animCurveTA"},
    {"ry", "rotateY", "animCurveTA"},
    {"rz", "rotateZ", "animCurveTA"},
    {"sx", "scaleX", "animCurveTU"},
    {"sy", "scaleY", "animCurveTU"},
    {"sz", "scaleZ", "animCurveTU"},
}};

// The streams to which an import writes each sample of an animated transform: place, scale and three
// rotations.
inline constexpr std::int64_t kStreams = 5;

// At least `least`.
std::int64_t scaled(double scale, double count, std::int64_t least = 1);

std::string numbered(std::string_view stem, std::int64_t number);

// At a place within 100 units.
void transform(SceneText& scene, std::string_view name, std::string_view parent = {});

// Named after its parent.
void locator(SceneText& scene, std::string_view name, std::string_view parent);

// A transform and its camera.
void camera(SceneText& scene, const std::string& name, std::string_view parent = {});

// Baked curves for channels of a node, then their connections.
void animate(SceneText& scene, const std::string& node, int keys, int decimals, std::size_t firstChannel,
             std::size_t channelCount);

// A transform and its mesh, with texture coordinates, edges, normals and faces.
void mesh(SceneText& scene, const std::string& name, std::int64_t vertices);

}  // namespace bench
