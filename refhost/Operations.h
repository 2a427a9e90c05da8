// The suite operations that the embedded host counts, traces and can make fail: one table of name,
// suite and version.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

#include "hostapi/CameraSuite.h"
#include "hostapi/CompSuite.h"
#include "hostapi/FileImportManagerSuite.h"
#include "hostapi/KeyframeSuite.h"
#include "hostapi/LayerSuite.h"
#include "hostapi/MemorySuite.h"
#include "hostapi/PersistentDataSuite.h"
#include "hostapi/RegisterSuite.h"
#include "hostapi/StreamSuite.h"
#include "hostapi/UtilitySuite.h"

namespace refhost {

// The two operations of the basic suite name their suite in each call, so the table holds none for them.
/* clang-format off */
#define REFHOST_OPERATION_TABLE(ENTRY)                                                              \
  ENTRY(AcquireSuite,              "", 0)                                                           \
  ENTRY(ReleaseSuiteByName,        "", 0)                                                           \
  ENTRY(ShowMessage,               QZGP_UTILITY_SUITE, QZGP_UTILITY_SUITE_7)                        \
  ENTRY(BeginSilentErrors,         QZGP_UTILITY_SUITE, QZGP_UTILITY_SUITE_7)                        \
  ENTRY(EndSilentErrors,           QZGP_UTILITY_SUITE, QZGP_UTILITY_SUITE_7)                        \
  ENTRY(NewMemHandle,              QZGP_MEMORY_SUITE, QZGP_MEMORY_SUITE_1)                          \
  ENTRY(FreeMemHandle,             QZGP_MEMORY_SUITE, QZGP_MEMORY_SUITE_1)                          \
  ENTRY(LockMemHandle,             QZGP_MEMORY_SUITE, QZGP_MEMORY_SUITE_1)                          \
  ENTRY(UnlockMemHandle,           QZGP_MEMORY_SUITE, QZGP_MEMORY_SUITE_1)                          \
  ENTRY(GetAppPrefsBlob,           QZGP_PERSISTENT_DATA_SUITE, QZGP_PERSISTENT_DATA_SUITE_3)        \
  ENTRY(GetPrefLong,               QZGP_PERSISTENT_DATA_SUITE, QZGP_PERSISTENT_DATA_SUITE_3)        \
  ENTRY(RegisterDeathHook,         QZGP_REGISTER_SUITE, QZGP_REGISTER_SUITE_6)                      \
  ENTRY(RegisterImporterName,      QZGP_FILE_IMPORT_MANAGER_SUITE, QZGP_FILE_IMPORT_MANAGER_SUITE_3) \
  ENTRY(RegisterImporterTypes,     QZGP_FILE_IMPORT_MANAGER_SUITE, QZGP_FILE_IMPORT_MANAGER_SUITE_3) \
  ENTRY(RegisterImporterCallbacks, QZGP_FILE_IMPORT_MANAGER_SUITE, QZGP_FILE_IMPORT_MANAGER_SUITE_3) \
  ENTRY(CreateComp,                QZGP_COMP_SUITE, QZGP_COMP_SUITE_21)                             \
  ENTRY(GetItemFromComp,           QZGP_COMP_SUITE, QZGP_COMP_SUITE_9)                              \
  ENTRY(NewCameraLayer,            QZGP_COMP_SUITE, QZGP_COMP_SUITE_9)                              \
  ENTRY(NewNullLayer,              QZGP_COMP_SUITE, QZGP_COMP_SUITE_9)                              \
  ENTRY(AddLayerFromItem,          QZGP_LAYER_SUITE, QZGP_LAYER_SUITE_10)                           \
  ENTRY(SetLayerFlag,              QZGP_LAYER_SUITE, QZGP_LAYER_SUITE_10)                           \
  ENTRY(SetLayerParent,            QZGP_LAYER_SUITE, QZGP_LAYER_SUITE_10)                           \
  ENTRY(SetCameraFilmSize,         QZGP_CAMERA_SUITE, QZGP_CAMERA_SUITE_2)                          \
  ENTRY(AcquireLayerStream,        QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_7)                          \
  ENTRY(ReleaseStream,             QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_7)                          \
  ENTRY(SetStreamValue,            QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_8)                          \
  ENTRY(GetStreamKeyframeCount,    QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_3)                      \
  ENTRY(BeginKeyframeBatch,        QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_3)                      \
  ENTRY(AddBatchKeyframe,          QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_3)                      \
  ENTRY(SetBatchKeyframeValue,     QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_4)                      \
  ENTRY(EndKeyframeBatch,          QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_3)
/* clang-format on */

enum class Operation : std::uint8_t {
#define REFHOST_OPERATION_ENUMERATOR(name, suite, version) name,
  REFHOST_OPERATION_TABLE(REFHOST_OPERATION_ENUMERATOR)
#undef REFHOST_OPERATION_ENUMERATOR
      Count
};

inline constexpr std::size_t kOperationCount = static_cast<std::size_t>(Operation::Count);

struct OperationFacts {
  const char* name;
  const char* suite;  // "" for the two operations of the basic suite
  std::int32_t version;
};

const OperationFacts& factsOf(Operation operation);
std::optional<Operation> findOperation(std::string_view name);

// The number of the utility service of that name (HOST_UTILITY_...).
std::optional<std::int32_t> findUtilityService(std::string_view name);

}  // namespace refhost
