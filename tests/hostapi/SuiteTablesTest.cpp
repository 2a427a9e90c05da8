// Names, versions and slots of every suite. A plug-in built against other slots calls the wrong operation.
#include <gtest/gtest.h>

#include <cstddef>
#include <map>
#include <string>
#include <vector>

#include "hostapi/CameraSuite.h"
#include "hostapi/CompSuite.h"
#include "hostapi/FileImportManagerSuite.h"
#include "hostapi/KeyframeSuite.h"
#include "hostapi/LayerStreams.h"
#include "hostapi/LayerSuite.h"
#include "hostapi/MemorySuite.h"
#include "hostapi/PersistentDataSuite.h"
#include "hostapi/RegisterSuite.h"
#include "hostapi/StreamSuite.h"
#include "hostapi/UtilitySuite.h"
#include "hostapi/WNBasicSuite.h"

namespace {

using Operation = void (*)(void);

struct Slot {
  const char* operation;
  std::size_t expected;
  std::size_t offset;
};

#define SLOT(suite, operation, slot) \
  { #operation, slot, offsetof(suite, operation) }

const Slot kSlots[] = {
    SLOT(WNBasicSuite, AcquireSuite, 0),
    SLOT(WNBasicSuite, ReleaseSuiteByName, 1),
    SLOT(QZGP_UtilitySuite7, ShowMessage, 0),
    SLOT(QZGP_UtilitySuite7, BeginSilentErrors, 3),
    SLOT(QZGP_UtilitySuite7, EndSilentErrors, 4),
    SLOT(QZGP_MemorySuite1, NewMemHandle, 0),
    SLOT(QZGP_MemorySuite1, FreeMemHandle, 1),
    SLOT(QZGP_MemorySuite1, LockMemHandle, 2),
    SLOT(QZGP_MemorySuite1, UnlockMemHandle, 3),
    SLOT(QZGP_PersistentDataSuite3, GetAppPrefsBlob, 0),
    SLOT(QZGP_PersistentDataSuite3, GetPrefLong, 9),
    SLOT(QZGP_RegisterSuite6, RegisterDeathHook, 2),
    SLOT(QZGP_FileImportManagerSuite3, RegisterImporterName, 0),
    SLOT(QZGP_FileImportManagerSuite3, RegisterImporterTypes, 1),
    SLOT(QZGP_FileImportManagerSuite3, RegisterImporterCallbacks, 2),
    SLOT(QZGP_CompSuite21, CreateComp, 25),
    SLOT(QZGP_CompSuite9, GetItemFromComp, 1),
    SLOT(QZGP_CompSuite9, NewCameraLayer, 14),
    SLOT(QZGP_CompSuite9, NewNullLayer, 22),
    SLOT(QZGP_LayerSuite10, SetLayerFlag, 11),
    SLOT(QZGP_LayerSuite10, AddLayerFromItem, 25),
    SLOT(QZGP_LayerSuite10, SetLayerParent, 42),
    SLOT(QZGP_CameraSuite2, SetCameraFilmSize, 1),
    SLOT(QZGP_StreamSuite7, AcquireLayerStream, 3),
    SLOT(QZGP_StreamSuite7, ReleaseStream, 8),
    SLOT(QZGP_StreamSuite8, SetStreamValue, 5),
    SLOT(QZGP_KeyframeSuite3, GetStreamKeyframeCount, 0),
    SLOT(QZGP_KeyframeSuite3, BeginKeyframeBatch, 12),
    SLOT(QZGP_KeyframeSuite3, AddBatchKeyframe, 13),
    SLOT(QZGP_KeyframeSuite3, EndKeyframeBatch, 15),
    SLOT(QZGP_KeyframeSuite4, SetBatchKeyframeValue, 14),
};
#undef SLOT

TEST(SuiteTablesTest, EveryOperationIsInItsSlot) {
  for (const Slot& slot : kSlots) EXPECT_EQ(slot.offset, slot.expected * sizeof(Operation)) << slot.operation;
}

// A suite ends with its last operation that is used, and holds nothing but operations.
TEST(SuiteTablesTest, EverySuiteEndsAfterItsLastOperation) {
  EXPECT_EQ(sizeof(WNBasicSuite), 2 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_UtilitySuite7), 5 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_MemorySuite1), 4 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_PersistentDataSuite3), 10 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_RegisterSuite6), 3 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_FileImportManagerSuite3), 3 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_CompSuite21), 26 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_CompSuite9), 23 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_LayerSuite10), 43 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_CameraSuite2), 2 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_StreamSuite7), 9 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_StreamSuite8), 6 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_KeyframeSuite3), 16 * sizeof(Operation));
  EXPECT_EQ(sizeof(QZGP_KeyframeSuite4), 15 * sizeof(Operation));
}

TEST(SuiteTablesTest, EverySuiteHasItsNameAndVersion) {
  const std::map<std::string, std::vector<int>> offered = {
      {QZGP_UTILITY_SUITE, {QZGP_UTILITY_SUITE_7}},
      {QZGP_MEMORY_SUITE, {QZGP_MEMORY_SUITE_1}},
      {QZGP_PERSISTENT_DATA_SUITE, {QZGP_PERSISTENT_DATA_SUITE_3}},
      {QZGP_REGISTER_SUITE, {QZGP_REGISTER_SUITE_6}},
      {QZGP_FILE_IMPORT_MANAGER_SUITE, {QZGP_FILE_IMPORT_MANAGER_SUITE_3}},
      {QZGP_COMP_SUITE, {QZGP_COMP_SUITE_21, QZGP_COMP_SUITE_9}},
      {QZGP_LAYER_SUITE, {QZGP_LAYER_SUITE_10}},
      {QZGP_CAMERA_SUITE, {QZGP_CAMERA_SUITE_2}},
      {QZGP_STREAM_SUITE, {QZGP_STREAM_SUITE_7, QZGP_STREAM_SUITE_8}},
      {QZGP_KEYFRAME_SUITE, {QZGP_KEYFRAME_SUITE_3, QZGP_KEYFRAME_SUITE_4}}};
  const std::map<std::string, std::vector<int>> expected = {{"QZGP Utility Suite", {7}},
                                                            {"QZGP Memory Suite", {1}},
                                                            {"QZGP Persistent Data Suite", {3}},
                                                            {"QZGP Register Suite", {6}},
                                                            {"QZGP File Import Manager Suite", {3}},
                                                            {"QZGP Comp Suite", {21, 9}},
                                                            {"QZGP Layer Suite", {10}},
                                                            {"QZGP Camera Suite", {2}},
                                                            {"QZGP Stream Suite", {7, 8}},
                                                            {"QZGP Keyframe Suite", {3, 4}}};
  EXPECT_EQ(offered, expected);
}

TEST(SuiteTablesTest, ConstantsOfTheSuitesHaveTheirValues) {
  EXPECT_EQ(HOST_LAYER_FLAG_3D, 0x800);
  EXPECT_EQ(HOST_LAYER_FLAG_AIMED, 8192);
  EXPECT_EQ(HOST_CAMERA_CENTER_ANYWHERE, -2147483648.0);
  EXPECT_EQ(HOST_FILM_HORIZONTAL, 1);
  EXPECT_EQ(HOST_FILM_VERTICAL, 2);
  EXPECT_EQ(HOST_TIME_MODE_COMP, 0);
  EXPECT_STREQ(HOST_PREF_SECTION, "Maya Camera");
  EXPECT_STREQ(HOST_PREF_LINEAR_UNITS, "Use Linear Units");
}

TEST(SuiteTablesTest, StreamsHaveTheirNumbers) {
  EXPECT_EQ(HOST_STREAM_ANCHOR_POINT, 0);
  EXPECT_EQ(HOST_STREAM_POSITION, 1);
  EXPECT_EQ(HOST_STREAM_SCALE, 2);
  EXPECT_EQ(HOST_STREAM_ROTATION_Z, 3);
  EXPECT_EQ(HOST_STREAM_ROTATION_X, 8);
  EXPECT_EQ(HOST_STREAM_ROTATION_Y, 9);
  EXPECT_EQ(HOST_STREAM_ZOOM, 11);
}

}  // namespace
