// Adding keys to the embedded host: as the suite calls of one stream, and as the importer does it for an
// animated transform, which has five streams. The items are keys; the bytes are those of their times and
// values.
#include <optional>

#include "bench/micro/MicroBenchmark.h"
#include "hostapi/CompSuite.h"
#include "hostapi/KeyframeSuite.h"
#include "hostapi/LayerStreams.h"
#include "hostapi/StreamSuite.h"
#include "maya/MAYA_Parse.h"
#include "plugin/Globals.h"
#include "refhost/Host.h"

using namespace mayaimport;

namespace bench {
namespace {

constexpr std::int32_t kPluginId = 1;
constexpr int kKeys = 240;

// The number of layers in a host before a new one is made, so that memory stays bounded.
constexpr int kLayersPerHost = 256;

// Streams by their numbers, with the values of a key.
constexpr std::int32_t kPosition = HOST_STREAM_POSITION;
constexpr std::int32_t kZRotation = HOST_STREAM_ROTATION_Z;
constexpr int kValuesOfFiveStreams = 3 + 3 + 1 + 1 + 1;

template <typename Suite>
const Suite& acquire(const refhost::Host& host, const char* name, std::int32_t version) {
  const void* suite = nullptr;
  require(host.basicSuite()->AcquireSuite(name, version, &suite) == 0);
  return *static_cast<const Suite*>(suite);
}

// A host in an import, with a composition.
class Stage {
 public:
  Stage() : folder_(host_.beginCallback(refhost::Callback::Import, "scene.ma")) {
    constexpr HostUTF16Unit kName[] = {'c', 0};
    constexpr HostRatio kSquare{1, 1};
    constexpr T_Time kTenSeconds{10, 1};
    constexpr HostRatio kRate{24, 1};
    const auto& comps = acquire<QZGP_CompSuite21>(host_, QZGP_COMP_SUITE, QZGP_COMP_SUITE_21);
    require(comps.CreateComp(folder_, kName, 640, 480, &kSquare, &kTenSeconds, &kRate, &comp_) == 0);
  }

  refhost::Host& host() { return host_; }
  int layers() const { return layers_; }

  VOR_Layer* newLayer() {
    constexpr T_Time kWholeLength{0, 0};
    VOR_Layer* layer = nullptr;
    require(layerSuite_.NewNullLayer("layer", comp_, &kWholeLength, &layer) == 0);
    ++layers_;
    return layer;
  }

 private:
  refhost::Host host_{{}};
  VOR_Item* folder_;
  VOR_CompItem* comp_ = nullptr;
  const QZGP_CompSuite9& layerSuite_ = acquire<QZGP_CompSuite9>(host_, QZGP_COMP_SUITE, QZGP_COMP_SUITE_9);
  int layers_ = 0;
};

void insertKeys(benchmark::State& state, std::int32_t stream, int values) {
  std::optional<Stage> stage;
  for (auto _ : state) {
    state.PauseTiming();
    if (!stage || stage->layers() == kLayersPerHost) {
      stage.reset();
      stage.emplace();
    }
    refhost::Host& host = stage->host();
    const auto& streams = acquire<QZGP_StreamSuite7>(host, QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_7);
    const auto& batches = acquire<QZGP_KeyframeSuite3>(host, QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_3);
    const auto& keys = acquire<QZGP_KeyframeSuite4>(host, QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_4);
    StreamValueRecord value{};
    require(streams.AcquireLayerStream(kPluginId, stage->newLayer(), stream, &value.stream) == 0);
    state.ResumeTiming();

    VOR_AddKeyframesInfo* batch = nullptr;
    require(batches.BeginKeyframeBatch(value.stream, &batch) == 0);
    for (int i = 0; i < kKeys; ++i) {
      const T_Time time{i * 1000, 24000};
      std::int32_t index = 0;
      value.value[0] = i;
      require(batches.AddBatchKeyframe(batch, HOST_TIME_MODE_COMP, &time, &index) == 0);
      require(keys.SetBatchKeyframeValue(batch, index, &value) == 0);
    }
    require(batches.EndKeyframeBatch(1, batch) == 0);
  }
  const auto bytes = kKeys * (sizeof(T_Time) + static_cast<std::size_t>(values) * sizeof(double));
  countWork(state, kKeys, static_cast<std::int64_t>(bytes));
}

void animateTransform(benchmark::State& state) {
  // The first transform of the workload comes after the camera's.
  constexpr int kFirstAnimated = 1;
  constexpr double kOneTransform = 0.001;
  const std::string text = sceneOf("composition", kOneTransform);
  G_plugin_idL = kPluginId;
  std::optional<Stage> stage;
  std::optional<MAYA_Parse> parser;
  std::int64_t samples = 0;
  for (auto _ : state) {
    state.PauseTiming();
    if (!stage || stage->layers() == kLayersPerHost) {
      parser.reset();
      stage.reset();
      stage.emplace();
      parser.emplace(stage->host().basicSuite(), text.data(), text.data() + text.size());
      parser->Parse();
    }
    const auto* node = static_cast<const MAYA_Transform*>(RecordListPeek(parser->transforms, kFirstAnimated));
    require(node != nullptr);
    samples = parser->VerifyAnimInfo(node);
    require(samples > 0);
    VOR_Layer* const layer = stage->newLayer();
    state.ResumeTiming();

    parser->ApplyTransformAnimation(layer, node);
  }
  constexpr std::int64_t kStreams = 5;
  countWork(
      state, samples * kStreams,
      samples * static_cast<std::int64_t>(kStreams * sizeof(T_Time) + kValuesOfFiveStreams * sizeof(double)));
}

BENCHMARK_CAPTURE(insertKeys, one_value, kZRotation, 1)->Name("keyframes/one_value");
BENCHMARK_CAPTURE(insertKeys, three_values, kPosition, 3)->Name("keyframes/three_values");
BENCHMARK(animateTransform)->Name("keyframes/transform_to_five_streams");

}  // namespace
}  // namespace bench
