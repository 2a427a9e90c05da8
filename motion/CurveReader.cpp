#include "motion/CurveReader.h"

#include <algorithm>
#include <cmath>
#include <optional>
#include <utility>

namespace motion {
namespace {

using scene::NodeId;
using scene::Scene;

// The numbers of an array attribute, `width` for each element, with the element's index. Of an index that is
// written twice the last one counts.
struct Elements {
  std::vector<std::int32_t> indices;  // strictly ascending
  std::vector<double> numbers;
};

Elements Sorted(const Elements& elements, std::size_t width) {
  std::vector<std::size_t> order(elements.indices.size());
  for (std::size_t i = 0; i < order.size(); ++i) order[i] = i;
  std::stable_sort(order.begin(), order.end(), [&elements](std::size_t a, std::size_t b) {
    return elements.indices[a] < elements.indices[b];
  });
  Elements sorted;
  for (std::size_t i = 0; i < order.size(); ++i) {
    const std::int32_t index = elements.indices[order[i]];
    if (i + 1 < order.size() && elements.indices[order[i + 1]] == index) continue;
    sorted.indices.push_back(index);
    const auto from = elements.numbers.begin() + static_cast<std::ptrdiff_t>(order[i] * width);
    sorted.numbers.insert(sorted.numbers.end(), from, from + static_cast<std::ptrdiff_t>(width));
  }
  return sorted;
}

Elements ReadElements(const Scene& scene, NodeId node, std::string_view attribute, std::size_t width) {
  Elements elements;
  for (const scene::Piece& piece : scene.Pieces(node, attribute)) {
    const auto wanted = static_cast<std::size_t>(std::int64_t{piece.last} - piece.first + 1);
    const std::vector<double> numbers = piece.value.Numbers(wanted * width);
    const std::size_t count = numbers.size() / width;
    for (std::size_t i = 0; i < count; ++i)
      elements.indices.push_back(piece.first + static_cast<std::int32_t>(i));
    elements.numbers.insert(elements.numbers.end(), numbers.begin(),
                            numbers.begin() + static_cast<std::ptrdiff_t>(count * width));
  }
  const bool ascending = std::adjacent_find(elements.indices.begin(), elements.indices.end(),
                                            std::greater_equal<>()) == elements.indices.end();
  return ascending ? elements : Sorted(elements, width);
}

// Elements of another array at the keys that they belong to: calls `put` with the key and the number.
template <typename Put>
void ForEachKey(const std::vector<std::int32_t>& keys, const Elements& elements, Put put) {
  std::size_t key = 0;
  for (std::size_t i = 0; i < elements.indices.size(); ++i) {
    while (key < keys.size() && keys[key] < elements.indices[i]) ++key;
    if (key < keys.size() && keys[key] == elements.indices[i]) put(key, elements.numbers[i]);
  }
}

std::uint8_t TypeCode(double number) {
  constexpr double kMost = 255.0;
  return number >= 0.0 && number <= kMost ? static_cast<std::uint8_t>(number) : tangent::kNone;
}

int Code(const Scene& scene, NodeId node, std::string_view attribute, int fallback) {
  const std::optional<double> number = scene.Number(node, attribute);
  return number && std::fabs(*number) < 1000.0 ? static_cast<int>(*number) : fallback;
}

struct SideNames {
  std::string_view type;
  std::string_view x;
  std::string_view y;
};
constexpr SideNames kIn{"keyTanInType", "keyTanInX", "keyTanInY"};
constexpr SideNames kOut{"keyTanOutType", "keyTanOutX", "keyTanOutY"};

CurveSide ReadSide(const Scene& scene, NodeId node, const SideNames& names,
                   const std::vector<std::int32_t>& keys, std::uint8_t type) {
  CurveSide side;
  const Elements types = ReadElements(scene, node, names.type, 1);
  if (!types.indices.empty()) side.types.assign(keys.size(), type);
  ForEachKey(keys, types, [&side](std::size_t key, double number) { side.types[key] = TypeCode(number); });

  const Elements x = ReadElements(scene, node, names.x, 1);
  const Elements y = ReadElements(scene, node, names.y, 1);
  ForEachKey(keys, x, [&side, &keys](std::size_t key, double number) {
    if (side.tangents.empty()) {
      side.firstTangent = key;
      side.tangents.resize(keys.size() - key);
    }
    side.tangents[key - side.firstTangent].x = number;
  });
  ForEachKey(keys, y, [&side](std::size_t key, double number) {
    const bool inside = key >= side.firstTangent && key - side.firstTangent < side.tangents.size();
    if (inside) side.tangents[key - side.firstTangent].y = number;
  });
  return side;
}

}  // namespace

CurveData ReadCurve(const Scene& scene, NodeId node, const Measures& measures) {
  const Kind input = KindOf(scene, {node, "input"});
  const Kind output = KindOf(scene, {node, "output"});
  const double timeUnits = input == Kind::kTime ? measures.framesPerSecond : 1.0;
  CurveData curve;
  curve.internalUnits =
      output == Kind::kTime ? 1.0 / measures.framesPerSecond : InternalUnits(measures, output);
  curve.type = TypeCode(scene.Number(node, "tangentType").value_or(tangent::kUnset));
  curve.weighted = scene.Number(node, "weightedTangents").value_or(1.0) != 0.0;
  curve.preInfinity = Code(scene, node, "preInfinity", infinity::kConstant);
  curve.postInfinity = Code(scene, node, "postInfinity", infinity::kConstant);
  curve.rotationInterpolation = Code(scene, node, "rotationInterpolation", 1);

  Elements keys = ReadElements(scene, node, "keyTimeValue", 2);
  curve.keys.reserve(keys.indices.size());
  for (std::size_t key = 0; key < keys.indices.size(); ++key) {
    curve.keys.push_back({keys.numbers[2 * key] / timeUnits, keys.numbers[2 * key + 1]});
  }
  curve.in = ReadSide(scene, node, kIn, keys.indices, curve.type);
  curve.out = ReadSide(scene, node, kOut, keys.indices, curve.type);
  return curve;
}

}  // namespace motion
