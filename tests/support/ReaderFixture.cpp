#include "tests/support/ReaderFixture.h"

#include <algorithm>
#include <cctype>

#include "hostutil/HostSetup.h"
#include "plugin/Globals.h"
#include "plugin/Messages.h"

using namespace mayaimport;

namespace testsupport {

ReaderTest::ReaderTest() {
  G_plugin_idL = kTestPluginId;
  EXPECT_EQ(RegisterMessages(), 0);
}

ReaderTest::~ReaderTest() {
  EndScene();
  EXPECT_THAT(HeldObjects(), ::testing::IsEmpty());
  HostReleaseLeftovers();
  EXPECT_THAT(host_.held, ::testing::IsEmpty());
  UnregisterMessages();
}

HostError ReaderTest::Read(std::string_view text) {
  EndScene();
  text_.emplace(text);
  host_.messages.clear();
  scene_ = std::make_unique<MAYA_Parse>(host_.basicSuite(), text_->begin(), text_->end());
  try {
    scene_->Parse();
    return 0;
  } catch (int code) {
    return code;
  }
}

void ReaderTest::EndScene() {
  scene_.reset();
  text_.reset();
}

std::vector<std::string> ReaderTest::Messages() const {
  std::vector<std::string> texts;
  for (const ShownMessage& message : host_.messages) texts.push_back(message.text);
  return texts;
}

Keys ReaderTest::KeysIn(const RecordList* list) {
  Keys keys;
  for (std::int64_t index = 0; index < Count(list); ++index) {
    const MAYA_Key key = At<MAYA_Key>(list, index);
    keys.emplace_back(key.time, key.value);
  }
  return keys;
}

bool ReaderTest::CurrentIsZero() {
  const unsigned char* const bytes = reinterpret_cast<const unsigned char*>(&scene().current);
  return std::all_of(bytes, bytes + sizeof(scene().current), [](unsigned char byte) { return byte == 0; });
}

std::int64_t ReaderTest::Count(const RecordList* list) {
  std::int64_t count = 0;
  if (list != nullptr) {
    EXPECT_EQ(RecordListCount(list, &count), 0);
  }
  return count;
}

std::vector<std::string> CaseChanges(std::string_view word) {
  std::string lower(word), upper(word), mixed(word);
  for (std::size_t index = 0; index < word.size(); ++index) {
    const unsigned char byte = static_cast<unsigned char>(word[index]);
    lower[index] = static_cast<char>(std::tolower(byte));
    upper[index] = static_cast<char>(std::toupper(byte));
    mixed[index] = index % 2 == 0 ? upper[index] : lower[index];
  }
  return {std::string(word), lower, upper, mixed};
}

}  // namespace testsupport
