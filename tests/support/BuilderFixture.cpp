#include "tests/support/BuilderFixture.h"

#include <utility>

#include "plugin/Globals.h"
#include "plugin/Messages.h"
#include "tests/support/BuilderRun.h"

using namespace mayaimport;

namespace testsupport {
namespace {

template <typename Record>
Record RecordAt(const RecordList* list, std::int64_t index) {
  const void* const record = list != nullptr ? RecordListPeek(list, index) : nullptr;
  EXPECT_NE(record, nullptr) << "no record " << index;
  return record != nullptr ? *static_cast<const Record*>(record) : Record{};
}

}  // namespace

BuilderTest::BuilderTest() {
  G_plugin_idL = kBuilderPluginId;
  G_use_linear_unitsL = 0;
  MAYA_Parse::ResetOffset();
  EXPECT_EQ(RegisterMessages(), 0);
}

BuilderTest::~BuilderTest() {
  if (parser_ != nullptr) End();
  host_.reset();
  UnregisterMessages();
  G_use_linear_unitsL = 0;
}

void BuilderTest::Begin(std::string_view text, refhost::HostOptions options) {
  BeginCold(text, std::move(options));
  parser_->CompSuite21();
  parser_->CompSuite9();
  parser_->LayerSuite10();
  parser_->CameraSuite2();
  parser_->StreamSuite7();
  parser_->StreamSuite8();
  parser_->KeyframeSuite3();
  parser_->KeyframeSuite4();
  TakeTrace();
}

void BuilderTest::BeginCold(std::string_view text, refhost::HostOptions options) {
  if (parser_ != nullptr) End();
  host_.reset();
  comp_ = nullptr;
  options.trace = &written_;
  options.pluginId = kBuilderPluginId;
  host_ = std::make_unique<refhost::Host>(std::move(options));
  text_ = text;
  folder_ = host_->beginCallback(refhost::Callback::Import, "scene.ma");
  parser_ = std::make_unique<MAYA_Parse>(host_->basicSuite(), text_.c_str());
  parser_->Parse();
  TakeTrace();
}

refhost::CallbackResult BuilderTest::End(HostError code) {
  parser_.reset();
  refhost::CallbackResult result = host_->endCallback(code);
  for (const refhost::Leftover& leftover : result.leftovers) {
    EXPECT_TRUE(leftover.keptByDesign) << leftover.description;
  }
  return result;
}

VOR_CompItem* BuilderTest::Comp() {
  if (comp_ != nullptr) return comp_;
  constexpr HostUTF16Unit kName[] = {'c', 'o', 'm', 'p', 0};
  constexpr HostRatio kSquare{1, 1};
  constexpr T_Time kTenSeconds{10, 1};
  constexpr HostRatio kRate{24, 1};
  EXPECT_EQ(
      parser_->CompSuite21().CreateComp(folder_, kName, 640, 480, &kSquare, &kTenSeconds, &kRate, &comp_), 0);
  return comp_;
}

VOR_Layer* BuilderTest::NewCamera(const char* name) {
  VOR_Layer* layer = nullptr;
  EXPECT_EQ(parser_->CompSuite9().NewCameraLayer(name, Comp(), 320.0, 240.0, &layer), 0);
  TakeTrace();
  return layer;
}

VOR_Layer* BuilderTest::NewNull(const char* name) {
  constexpr T_Time kOwnLength{0, 0};
  VOR_Layer* layer = nullptr;
  EXPECT_EQ(parser_->CompSuite9().NewNullLayer(name, Comp(), &kOwnLength, &layer), 0);
  TakeTrace();
  return layer;
}

std::vector<std::string> BuilderTest::TakeTrace() {
  const std::string all = written_.str();
  std::vector<std::string> lines = LinesOf(all.substr(taken_));
  taken_ = all.size();
  return lines;
}

MAYA_Transform BuilderTest::TransformAt(std::int64_t index) {
  return RecordAt<MAYA_Transform>(parser_->transforms, index);
}

MAYA_Camera BuilderTest::CameraAt(std::int64_t index) {
  return RecordAt<MAYA_Camera>(parser_->cameras, index);
}

const refhost::Stream& BuilderTest::StreamOf(int id) {
  static const refhost::Stream kNone;
  const auto& layers = host_->project().layers();
  const refhost::Stream* const stream = layers.empty() ? nullptr : layers.back().findStream(id);
  EXPECT_NE(stream, nullptr) << "no stream " << id;
  return stream != nullptr ? *stream : kNone;
}

std::vector<T_Time> BuilderTest::KeyTimes(int id) {
  const refhost::Stream& stream = StreamOf(id);
  if (stream.keys == nullptr) return {};
  return stream.keys->times;
}

std::vector<double> BuilderTest::KeyValues(int id, std::size_t component) {
  const refhost::Stream& stream = StreamOf(id);
  std::vector<double> values;
  const auto dimension = static_cast<std::size_t>(stream.dimension);
  for (std::size_t key = 0; key < stream.keyCount(); ++key) {
    values.push_back(stream.keys->values[key * dimension + component]);
  }
  return values;
}

}  // namespace testsupport
