// The index of settings against a walk over all of them.
#include "scene/SettingIndex.h"

#include <gtest/gtest.h>

#include <limits>
#include <random>

namespace scene {
namespace {

constexpr std::size_t kNodes = 4;  // the last one has no setting
constexpr std::string_view kNames[] = {"weight", "weights", "offset"};

std::uint32_t LastOf(const std::vector<Setting>& settings, const Plug& plug) {
  std::uint32_t last = Setting::kNone;
  for (std::uint32_t at = 0; at < settings.size(); ++at) {
    const Setting& one = settings[at];
    if (one.node != plug.node || one.attribute != plug.attribute) continue;
    if (one.first <= plug.index && plug.index <= one.last) last = at;
  }
  return last;
}

Setting Said(NodeId node, std::string_view attribute, std::int32_t first, std::int32_t last) {
  return {.attribute = attribute, .node = node, .value = 0, .valueLength = 0, .first = first, .last = last};
}

TEST(SettingIndexTest, TheLastSettingOfEveryElementIsFound) {
  std::mt19937 random(17);
  const auto below = [&random](std::uint32_t end) { return static_cast<std::int32_t>(random() % end); };
  int found = 0;
  for (int round = 0; round < 400; ++round) {
    std::vector<Setting> settings;
    for (int count = below(24); count > 0; --count) {
      const std::int32_t first = below(12) - 1;
      settings.push_back(Said(static_cast<NodeId>(below(kNodes - 1)), kNames[below(3)], first,
                              first == kNoIndex ? kNoIndex : first + below(6)));
    }
    const SettingIndex index(settings, kNodes);
    for (NodeId node = 0; node < kNodes; ++node) {
      for (const std::string_view name : kNames) {
        for (std::int32_t element = kNoIndex; element < 18; ++element) {
          const Plug plug{node, name, element};
          const std::uint32_t expected = LastOf(settings, plug);
          found += expected == Setting::kNone ? 0 : 1;
          ASSERT_EQ(index.Find(settings, plug), expected) << round << ' ' << name << ' ' << element;
        }
      }
    }
  }
  EXPECT_GT(found, 1000);
}

TEST(SettingIndexTest, TheLastElementThatThereCanBeIsFound) {
  constexpr std::int32_t kMost = std::numeric_limits<std::int32_t>::max();
  const std::vector<Setting> settings = {Said(0, "weight", 5, kMost), Said(0, "weight", kMost, kMost),
                                         Said(0, "weight", 3, kMost - 2)};
  const SettingIndex index(settings, 1);
  EXPECT_EQ(index.Find(settings, {0, "weight", kMost}), 1u);
  EXPECT_EQ(index.Find(settings, {0, "weight", kMost - 1}), 0u);
  EXPECT_EQ(index.Find(settings, {0, "weight", kMost - 2}), 2u);
  EXPECT_EQ(index.Find(settings, {0, "weight", 2}), Setting::kNone);
}

}  // namespace
}  // namespace scene
