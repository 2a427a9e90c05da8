// Scenes of others, which lie in folders beside the source folder where somebody has them: each is read, and
// the nodes and connections are those that a look at the beginnings of the lines counts.
#include <filesystem>
#include <fstream>
#include <iterator>
#include <set>

#include "scene/Settings.h"
#include "tests/scene/CheckedScene.h"
#include "tests/scene/SceneFixture.h"
#include "tests/support/LeftOut.h"

namespace scene {
namespace {

namespace fs = std::filesystem;

struct Counts {
  int nodes = 0;
  int cameras = 0;
  int curves = 0;
  int connections = 0;

  bool operator==(const Counts&) const = default;
};

void PrintTo(const Counts& counts, std::ostream* out) {
  *out << counts.nodes << " nodes, " << counts.cameras << " cameras, " << counts.curves << " curves, "
       << counts.connections << " connections";
}

bool StartsWith(std::string_view text, std::string_view start) {
  return text.substr(0, start.size()) == start;
}

void CountType(std::string_view type, Counts* counts) {
  ++counts->nodes;
  counts->cameras += type == "camera" || type == "stereoRigCamera" ? 1 : 0;
  counts->curves += StartsWith(type, "animCurve") ? 1 : 0;
}

Counts CountLines(std::string_view text) {
  Counts counts;
  std::set<std::string_view> connections;
  for (std::size_t at = 0; at < text.size();) {
    const std::size_t end = std::min(text.find('\n', at), text.size());
    const std::string_view line = text.substr(at, end - at);
    if (StartsWith(line, "createNode ")) CountType(line.substr(11, line.find(' ', 11) - 11), &counts);
    // Both sides of a merge conflict may have the same connection.
    if (StartsWith(line, "connectAttr ")) connections.insert(line);
    at = end + 1;
  }
  counts.connections = static_cast<int>(connections.size());
  return counts;
}

Counts CountScene(const Scene& scene) {
  Counts counts;
  for (NodeId id = 0; id < scene.nodes().size(); ++id) {
    if (scene.node(id).origin == Origin::Created) CountType(scene.node(id).type, &counts);
    counts.connections += static_cast<int>(scene.ConnectionsInto(id).size());
  }
  return counts;
}

class OutsideScenesTest : public SceneTest {
 protected:
  void ReadFile(const fs::path& path) {
    std::ifstream in(path, std::ios::binary);
    text_ = std::string(std::istreambuf_iterator<char>(in), {});
    ASSERT_TRUE(in) << path;
    Read(text_);
  }

  std::string text_;
};

TEST_F(OutsideScenesTest, AreReadWhole) {
  const fs::path shared = fs::path(MAYASCENE_SOURCE_DIR) / ".." / "shared";
  int leftOut = 0;
  for (const char* folder : {"scenes", "shots", "shots/curves", "hazards"}) {
    if (!fs::is_directory(shared / folder)) {
      ++leftOut;
      continue;
    }
    for (const fs::directory_entry& entry : fs::directory_iterator(shared / folder)) {
      if (entry.path().extension() != ".ma") continue;
      SCOPED_TRACE(entry.path().filename().string());
      ReadFile(entry.path());
      EXPECT_EQ(testsupport::BrokenPromise(scene_, collector()), "");
      const Settings settings = ReadSettings(scene_, collector());
      if (folder == std::string_view("hazards")) continue;
      EXPECT_EQ(CountScene(scene_), CountLines(text_));
      EXPECT_EQ(collector().CountOf(diag::Code::UnexpectedByte), 0u);
      EXPECT_EQ(collector().CountOf(diag::Code::UnknownNode), 0u);
      EXPECT_EQ(collector().CountOf(diag::Severity::Error), 0u);
      EXPECT_GE(settings.version.value, 2000);
    }
  }
  if (leftOut > 0) {
    GTEST_SKIP() << testsupport::kLeftOut << leftOut << " folders of ../shared, beside the source folder";
  }
}

}  // namespace
}  // namespace scene
