#include "refhost/SuiteRegistry.h"

namespace refhost {

SuiteRegistry::SuiteRegistry()
    : suites_{{QZGP_UTILITY_SUITE, QZGP_UTILITY_SUITE_7, &kUtilitySuite7},
              {QZGP_MEMORY_SUITE, QZGP_MEMORY_SUITE_1, &kMemorySuite1},
              {QZGP_PERSISTENT_DATA_SUITE, QZGP_PERSISTENT_DATA_SUITE_3, &kPersistentDataSuite3},
              {QZGP_REGISTER_SUITE, QZGP_REGISTER_SUITE_6, &kRegisterSuite6},
              {QZGP_FILE_IMPORT_MANAGER_SUITE, QZGP_FILE_IMPORT_MANAGER_SUITE_3, &kFileImportManagerSuite3},
              {QZGP_COMP_SUITE, QZGP_COMP_SUITE_21, &kCompSuite21},
              {QZGP_COMP_SUITE, QZGP_COMP_SUITE_9, &kCompSuite9},
              {QZGP_LAYER_SUITE, QZGP_LAYER_SUITE_10, &kLayerSuite10},
              {QZGP_CAMERA_SUITE, QZGP_CAMERA_SUITE_2, &kCameraSuite2},
              {QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_7, &kStreamSuite7},
              {QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_8, &kStreamSuite8},
              {QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_3, &kKeyframeSuite3},
              {QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_4, &kKeyframeSuite4}} {}

OfferedSuite* SuiteRegistry::find(std::string_view name, std::int32_t version) {
  for (OfferedSuite& suite : suites_) {
    if (suite.version == version && suite.name == name) return &suite;
  }
  return nullptr;
}

void SuiteRegistry::giveAllBack() {
  for (OfferedSuite& suite : suites_) {
    suite.held = 0;
    suite.failedReleases = 0;
  }
}

}  // namespace refhost
