// The marked locators in the head, and the layers that the import made of them.
#include "check/HeadInternal.h"
#include "check/Links.h"

namespace check {
namespace {

// The nulls that stand above no layer: those of the locators, in the order in which they were made. The
// others are those of the transforms above.
std::vector<const CameOverLayer*> LowestNulls(const CameOver& cameOver) {
  std::vector<bool> above(cameOver.layers.size(), false);
  for (const CameOverLayer& layer : cameOver.layers) {
    if (layer.parent) above[*layer.parent] = true;
  }
  std::vector<const CameOverLayer*> lowest;
  for (std::size_t i = 0; i < above.size(); ++i) {
    const CameOverLayer& layer = cameOver.layers[i];
    if (layer.kind == LayerKind::Null && !above[i]) lowest.push_back(&layer);
  }
  return lowest;
}

}  // namespace

void DescribeLocators(const HeadSource& source, Head* head) {
  const scene::Scene& scene = source.scene;
  const std::vector<const CameOverLayer*> nulls = LowestNulls(source.cameOver);
  auto null = nulls.begin();
  for (const scene::NodeId id : FindMarkedLocators(scene)) {
    const std::string_view name = ImportName(scene, scene.node(id));
    const CameOverLayer* const layer = null != nulls.end() && (*null)->name == name ? *null++ : nullptr;
    AddOrCount(source, &head->locators, &head->locatorsNotShown, [&] {
      ShapeHead locator;
      DescribeShape(source, id, layer, &locator);
      return locator;
    });
  }
}

}  // namespace check
