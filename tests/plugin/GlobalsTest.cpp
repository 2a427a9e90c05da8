// The importer's process-wide state before any host has loaded it.
#include "plugin/Globals.h"

#include <gtest/gtest.h>

namespace testsupport {
namespace {

// Read before the first test, each of which may load the importer.
struct AtStart {
  const WNBasicSuite* basicSuite = G_basic_suiteP;
  std::int32_t pluginId = G_plugin_idL;
  const HostStringTable* table = Maya_Import_G_zref;
  std::int32_t useLinearUnits = G_use_linear_unitsL;
  double timeOffset = G_time_offsetD;
} const atStart;

TEST(GlobalsTest, BeforeLoadEverythingIsNullOrZero) {
  EXPECT_EQ(atStart.basicSuite, nullptr);
  EXPECT_EQ(atStart.pluginId, 0);
  EXPECT_EQ(atStart.table, nullptr);
  EXPECT_EQ(atStart.useLinearUnits, 0);
  EXPECT_EQ(atStart.timeOffset, 0.0);
}

}  // namespace
}  // namespace testsupport
