// Layers, their streams and their parents.
#include <chrono>
#include <deque>

#include "refhost/ProjectEditor.h"
#include "refhost/StreamTable.h"
#include "tests/refhost/StandIn.h"

namespace refhost {
namespace {

using ::testing::ElementsAre;

std::vector<std::int32_t> streamIds(const Layer& layer) {
  std::vector<std::int32_t> ids;
  for (const Stream& stream : layer.streams) ids.push_back(stream.id);
  return ids;
}

void expectValue(const Layer& layer, std::int32_t id, double x, double y, double z) {
  const Stream* stream = layer.findStream(id);
  ASSERT_NE(stream, nullptr);
  EXPECT_DOUBLE_EQ(stream->value[0], x) << "stream " << id;
  EXPECT_DOUBLE_EQ(stream->value[1], y) << "stream " << id;
  EXPECT_DOUBLE_EQ(stream->value[2], z) << "stream " << id;
}

TEST(Layers, CameraStreamsExistWithTheirDefaults) {
  StandIn plugin;
  plugin.makeCamera(plugin.makeComp());
  const Layer& camera = plugin.host().project().layers().back();
  EXPECT_EQ(camera.kind, LayerKind::Camera);
  EXPECT_THAT(streamIds(camera), ElementsAre(0, 1, 2, 3, 8, 9, 11));
  expectValue(camera, HOST_STREAM_ANCHOR_POINT, 320.0, 240.0, 0.0);
  expectValue(camera, HOST_STREAM_POSITION, 0.0, 0.0, 0.0);
  expectValue(camera, HOST_STREAM_SCALE, 100.0, 100.0, 100.0);
  expectValue(camera, HOST_STREAM_ROTATION_Z, 0.0, 0.0, 0.0);
  expectValue(camera, HOST_STREAM_ROTATION_X, 0.0, 0.0, 0.0);
  expectValue(camera, HOST_STREAM_ROTATION_Y, 0.0, 0.0, 0.0);
  expectValue(camera, HOST_STREAM_ZOOM, 640.0, 0.0, 0.0);
}

TEST(Layers, CentreOfACameraIsItsPointOfInterest) {
  StandIn plugin;
  VOR_Layer* layer = nullptr;
  kCompSuite9.NewCameraLayer("cam", plugin.makeComp(), 12.5, -3.0, &layer);
  expectValue(plugin.host().project().layers().back(), HOST_STREAM_ANCHOR_POINT, 12.5, -3.0, 0.0);
}

TEST(Layers, NullStreamsExistWithTheirDefaults) {
  StandIn plugin;
  plugin.makeNull(plugin.makeComp());
  const Layer& null = plugin.host().project().layers().back();
  EXPECT_EQ(null.kind, LayerKind::Null);
  EXPECT_THAT(streamIds(null), ElementsAre(0, 1, 2, 3, 8, 9));
  expectValue(null, HOST_STREAM_ANCHOR_POINT, 0.0, 0.0, 0.0);
  expectValue(null, HOST_STREAM_POSITION, 0.0, 0.0, 0.0);
  expectValue(null, HOST_STREAM_SCALE, 100.0, 100.0, 100.0);
  EXPECT_EQ(null.findStream(HOST_STREAM_ZOOM), nullptr);
  EXPECT_EQ(null.findStream(HOST_STREAM_SCALE)->dimension, 3);
  EXPECT_EQ(null.findStream(HOST_STREAM_ROTATION_Y)->dimension, 1);
}

TEST(Layers, ZoomKeysAreThereFromTheStart) {
  HostOptions options;
  options.zoomKeys = 3;
  StandIn plugin(options);
  plugin.makeCamera(plugin.makeComp());
  const Stream& zoom = *plugin.host().project().layers().back().findStream(HOST_STREAM_ZOOM);
  ASSERT_EQ(zoom.keyCount(), 3U);
  EXPECT_EQ(zoom.keys->times[2].value, 2);
  EXPECT_EQ(zoom.keys->times[2].scale, 1U);
  EXPECT_THAT(zoom.keys->values, ElementsAre(640.0, 640.0, 640.0));
}

TEST(Layers, NestedCompositionIsALayerWithItsName) {
  StandIn plugin;
  VOR_CompItem* inner = plugin.makeComp();
  VOR_CompItem* outer = plugin.makeComp();
  VOR_Item* item = nullptr;
  VOR_Layer* layer = nullptr;
  ASSERT_EQ(kCompSuite9.GetItemFromComp(inner, &item), 0);
  ASSERT_EQ(kLayerSuite10.AddLayerFromItem(item, outer, &layer), 0);
  const Project& project = plugin.host().project();
  const Layer& nested = project.layers().back();
  EXPECT_EQ(nested.kind, LayerKind::Composition);
  EXPECT_EQ(nested.name, "shot");
  EXPECT_EQ(nested.source, &project.compositions()[0]);
  EXPECT_EQ(nested.composition, &project.compositions()[1]);
  EXPECT_THAT(streamIds(nested), ElementsAre(0, 1, 2, 3, 8, 9));
}

TEST(Layers, ItemOfACompositionIsTheSameWheneverItIsAskedFor) {
  StandIn plugin;
  VOR_CompItem* comp = plugin.makeComp();
  EXPECT_EQ(plugin.host().project().compositions()[0].itemNumber, 0);
  VOR_Item* first = nullptr;
  VOR_Item* second = nullptr;
  kCompSuite9.GetItemFromComp(comp, &first);
  kCompSuite9.GetItemFromComp(comp, &second);
  EXPECT_EQ(first, second);
  EXPECT_EQ(plugin.host().project().compositions()[0].itemNumber, 2);
}

TEST(Layers, FlagsSwitchOnAndOff) {
  StandIn plugin;
  VOR_Layer* layer = plugin.makeCamera(plugin.makeComp());
  const Layer& camera = plugin.host().project().layers().back();
  EXPECT_FALSE(camera.threeDimensional);
  kLayerSuite10.SetLayerFlag(layer, HOST_LAYER_FLAG_3D, 1);
  EXPECT_TRUE(camera.threeDimensional);
  EXPECT_FALSE(camera.aimed);
  kLayerSuite10.SetLayerFlag(layer, HOST_LAYER_FLAG_AIMED, 1);
  kLayerSuite10.SetLayerFlag(layer, HOST_LAYER_FLAG_3D, 0);
  EXPECT_FALSE(camera.threeDimensional);
  EXPECT_TRUE(camera.aimed);
}

TEST(Layers, NamesAreKeptByteForByte) {
  StandIn plugin;
  VOR_CompItem* comp = plugin.makeComp();
  plugin.makeNull(comp, "");
  plugin.makeNull(comp, "\xFF\x01");
  EXPECT_EQ(plugin.host().project().layers()[0].name, "");
  EXPECT_EQ(plugin.host().project().layers()[1].name, "\xFF\x01");
}

TEST(Layers, ParentChangesNoValue) {
  StandIn plugin;
  VOR_CompItem* comp = plugin.makeComp();
  VOR_Layer* child = plugin.makeNull(comp);
  VOR_Stream* stream = plugin.acquire(child, HOST_STREAM_POSITION);
  const StreamValueRecord value{stream, {1.0, 2.0, 3.0, 0.0}};
  kStreamSuite8.SetStreamValue(kPluginId, stream, &value);
  ASSERT_EQ(kLayerSuite10.SetLayerParent(child, plugin.makeNull(comp)), 0);
  expectValue(plugin.host().project().layers()[0], HOST_STREAM_POSITION, 1.0, 2.0, 3.0);
}

TEST(Layers, LayerCanMoveToAnotherParent) {
  StandIn plugin;
  VOR_CompItem* comp = plugin.makeComp();
  VOR_Layer* a = plugin.makeNull(comp, "a");
  VOR_Layer* b = plugin.makeNull(comp, "b");
  VOR_Layer* c = plugin.makeNull(comp, "c");
  EXPECT_EQ(kLayerSuite10.SetLayerParent(a, b), 0);
  EXPECT_EQ(kLayerSuite10.SetLayerParent(a, c), 0);
  const Project& project = plugin.host().project();
  EXPECT_EQ(project.layers()[0].parent, &project.layers()[2]);
  EXPECT_EQ(project.layers()[1].childCount, 0);
  // b has no child any more, so it may go below a.
  EXPECT_EQ(kLayerSuite10.SetLayerParent(b, a), 0);
  EXPECT_EQ(kLayerSuite10.SetLayerParent(c, b), HOST_ERR_PARENT_CIRCLE);
}

TEST(Layers, DeepChainStaysCheapToParent) {
  // Two chains, one built from the root downwards, one from the leaf upwards. Walked from end to end at each
  // step, a chain of this depth takes 45 thousand million steps.
  constexpr int depth = 300000;
  ProjectEditor editor;
  Composition& composition = editor.addComposition(editor.addFolder(), {});
  const auto start = std::chrono::steady_clock::now();
  for (const bool downwards : {true, false}) {
    Layer* last = &editor.addNullLayer(composition, "");
    for (int level = 1; level < depth; ++level) {
      Layer* next = &editor.addNullLayer(composition, "");
      Layer* child = downwards ? next : last;
      Layer* parent = downwards ? last : next;
      ASSERT_FALSE(ProjectEditor::isSameOrAbove(*child, *parent));
      ProjectEditor::setParent(*child, *parent);
      last = next;
    }
  }
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(60));
  const std::deque<Layer>& layers = editor.project().layers();
  EXPECT_TRUE(ProjectEditor::isSameOrAbove(layers[0], layers[depth - 1]));
  EXPECT_FALSE(ProjectEditor::isSameOrAbove(layers[depth - 1], layers[0]));
}

TEST(Layers, NullLayerTakesAtMost400Bytes) {
  constexpr std::size_t streams = 6;
  constexpr std::size_t allocation = 16;  // what an allocator adds to a block
  const std::size_t bytes = sizeof(Layer) + sizeof(Layer*) + streams * sizeof(Stream) + allocation;
  EXPECT_LE(bytes, 400U);
  EXPECT_EQ(makeStreams(LayerKind::Null).capacity(), streams);
}

}  // namespace
}  // namespace refhost
