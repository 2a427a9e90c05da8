// The shapes of the values that cross the border: another compiler on the other side lays them out alike.
#include "hostapi/HostTypes.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <type_traits>

#include "hostapi/FileImportManagerSuite.h"
#include "hostapi/PluginEntry.h"
#include "hostapi/StreamSuite.h"
#include "hostapi/UtilitySuite.h"

namespace {

template <typename Value>
constexpr bool kIsPlain = std::is_trivial_v<Value>&& std::is_standard_layout_v<Value>;

TEST(HostTypesTest, ATimeIsASignedValueOverAnUnsignedScale) {
  static_assert(kIsPlain<T_Time> && sizeof(T_Time) == 8);
  static_assert(std::is_same_v<decltype(T_Time::value), std::int32_t>);
  static_assert(std::is_same_v<decltype(T_Time::scale), std::uint32_t>);
  EXPECT_EQ(offsetof(T_Time, value), 0u);
  EXPECT_EQ(offsetof(T_Time, scale), 4u);
}

TEST(HostTypesTest, ARatioIsASignedNumeratorOverAnUnsignedDenominator) {
  static_assert(kIsPlain<HostRatio> && sizeof(HostRatio) == 8);
  static_assert(std::is_same_v<decltype(HostRatio::numerator), std::int32_t>);
  static_assert(std::is_same_v<decltype(HostRatio::denominator), std::uint32_t>);
  EXPECT_EQ(offsetof(HostRatio, numerator), 0u);
  EXPECT_EQ(offsetof(HostRatio, denominator), 4u);
}

TEST(HostTypesTest, CodesUnitsAndImporterIdsHaveTheirWidths) {
  static_assert(std::is_same_v<HostError, std::int32_t>);
  static_assert(std::is_same_v<HostUTF16Unit, std::uint16_t>);
  static_assert(std::is_same_v<HostImporterId, std::int32_t>);
}

TEST(HostTypesTest, AStreamValueIsAHandleAndFourDoubles) {
  static_assert(kIsPlain<StreamValueRecord>);
  EXPECT_EQ(offsetof(StreamValueRecord, stream), 0u);
  EXPECT_EQ(offsetof(StreamValueRecord, value), sizeof(void*));
  EXPECT_EQ(sizeof(StreamValueRecord), sizeof(void*) + 4 * sizeof(double));
}

TEST(HostTypesTest, TheCallbackSetBeginsWithAnEmptyPlace) {
  static_assert(kIsPlain<HostImporterCallbacks>);
  EXPECT_EQ(offsetof(HostImporterCallbacks, none), 0 * sizeof(void*));
  EXPECT_EQ(offsetof(HostImporterCallbacks, import), 1 * sizeof(void*));
  EXPECT_EQ(offsetof(HostImporterCallbacks, verify), 2 * sizeof(void*));
  EXPECT_EQ(sizeof(HostImporterCallbacks), 3 * sizeof(void*));
}

TEST(HostTypesTest, FileTypesAndExtensionsAreFourCharactersEach) {
  EXPECT_EQ(offsetof(HostImporterType, type), 0u);
  EXPECT_EQ(offsetof(HostImporterType, creator), 4u);
  EXPECT_EQ(sizeof(HostImporterExtension), 4u);
}

TEST(HostTypesTest, ASilentErrorStateIsTheCallersStorage) {
  static_assert(kIsPlain<HostSilentErrorState>);
  EXPECT_EQ(sizeof(HostSilentErrorState), 32u);
}

TEST(HostTypesTest, TheEntryHasItsExportedName) {
  EXPECT_STREQ(HOST_PLUGIN_ENTRY_SYMBOL, "GPMain_MayaImport");
}

}  // namespace
