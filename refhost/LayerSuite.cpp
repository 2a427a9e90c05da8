// "QZGP Layer Suite" 10: nesting, flags and parents.
#include <string>

#include "refhost/Call.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

HostError SetLayerFlag(VOR_Layer* layer, std::int32_t flag, std::uint8_t value) {
  Call call(Operation::SetLayerFlag);
  if (call.goesOn()) {
    if (Layer* found = call.layer(layer)) ProjectEditor::setFlag(*found, flag, value != 0);
  }
  if (TraceLine* line = call.traced()) {
    line->handle("layer", layer).integer("flag", flag).integer("value", value);
  }
  return call.finish();
}

void addLayerFromItem(Call& call, VOR_Item* item, VOR_CompItem* comp, VOR_Layer** layer) {
  const HandleCodec& codec = call.host().codec;
  Item* source = call.item(item, "the item");
  if (source == nullptr) return;
  Composition* target = call.composition(comp);
  if (target == nullptr || !call.given(layer, "the place for the layer")) return;
  if (source->composition == nullptr) {
    call.refuse(HOST_ERR_NOT_A_COMP, codec.describe(item) + " is a folder and cannot be a layer");
    return;
  }
  if (ProjectEditor::contains(*source->composition, *target)) {
    call.refuse(HOST_ERR_NOT_A_COMP, codec.describe(comp) + " would contain itself");
    return;
  }
  if (!takesLayer(call)) return;
  const Layer& made = call.host().editor.addCompositionLayer(*target, *source->composition);
  --call.host().allowance.layers;
  *layer =
      reinterpret_cast<VOR_Layer*>(codec.lasting(HandleKind::Layer, static_cast<std::size_t>(made.number)));
}

HostError AddLayerFromItem(VOR_Item* item, VOR_CompItem* comp, VOR_Layer** layer) {
  Call call(Operation::AddLayerFromItem);
  if (call.goesOn(layer)) addLayerFromItem(call, item, comp, layer);
  if (TraceLine* line = call.traced()) {
    line->handle("item", item).handle("comp", comp).handed("layer", layer);
  }
  return call.finish();
}

void setLayerParent(Call& call, VOR_Layer* layer, VOR_Layer* parent) {
  Layer* child = call.layer(layer);
  if (child == nullptr) return;
  Layer* above = call.layer(parent, "the parent");
  if (above == nullptr) return;
  const HandleCodec& codec = call.host().codec;
  if (child->composition != above->composition) {
    call.refuse(HOST_ERR_WRONG_COMP,
                codec.describe(layer) + " and " + codec.describe(parent) + " are not of one composition");
  } else if (ProjectEditor::isSameOrAbove(*child, *above)) {
    call.refuse(HOST_ERR_PARENT_CIRCLE, codec.describe(layer) + " would become its own ancestor");
  } else {
    ProjectEditor::setParent(*child, *above);
  }
}

HostError SetLayerParent(VOR_Layer* layer, VOR_Layer* parent) {
  Call call(Operation::SetLayerParent);
  if (call.goesOn()) setLayerParent(call, layer, parent);
  if (TraceLine* line = call.traced()) line->handle("layer", layer).handle("parent", parent);
  return call.finish();
}

constexpr QZGP_LayerSuite10 table() {
  QZGP_LayerSuite10 suite{};
  suite.SetLayerFlag = SetLayerFlag;
  suite.AddLayerFromItem = AddLayerFromItem;
  suite.SetLayerParent = SetLayerParent;
  return suite;
}

}  // namespace

constinit const QZGP_LayerSuite10 kLayerSuite10 = table();

}  // namespace refhost
