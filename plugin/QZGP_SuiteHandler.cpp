#include "plugin/QZGP_SuiteHandler.h"

#include "plugin/ErrorCodes.h"

namespace mayaimport {

namespace {

struct SuiteName {
  const char* name;
  std::int32_t version;
};

// By slot.
constexpr SuiteName kSuiteNames[] = {
    {QZGP_UTILITY_SUITE, QZGP_UTILITY_SUITE_7},
    {QZGP_MEMORY_SUITE, QZGP_MEMORY_SUITE_1},
    {QZGP_PERSISTENT_DATA_SUITE, QZGP_PERSISTENT_DATA_SUITE_3},
    {QZGP_REGISTER_SUITE, QZGP_REGISTER_SUITE_6},
    {QZGP_FILE_IMPORT_MANAGER_SUITE, QZGP_FILE_IMPORT_MANAGER_SUITE_3},
    {QZGP_COMP_SUITE, QZGP_COMP_SUITE_21},
    {QZGP_COMP_SUITE, QZGP_COMP_SUITE_9},
    {QZGP_LAYER_SUITE, QZGP_LAYER_SUITE_10},
    {QZGP_CAMERA_SUITE, QZGP_CAMERA_SUITE_2},
    {QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_7},
    {QZGP_STREAM_SUITE, QZGP_STREAM_SUITE_8},
    {QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_3},
    {QZGP_KEYFRAME_SUITE, QZGP_KEYFRAME_SUITE_4},
};

}  // namespace

QZGP_SuiteHandler::QZGP_SuiteHandler(const WNBasicSuite* basicSuite) : basicSuite_(basicSuite) {
  static_assert(std::size(kSuiteNames) == kSlotCount);
  if (basicSuite_ == nullptr) MissingSuiteError();
}

QZGP_SuiteHandler::~QZGP_SuiteHandler() {
  for (std::size_t slot = 0; slot < kSlotCount; ++slot) {
    if (suites_[slot] != nullptr) ReleaseSuite(kSuiteNames[slot].name, kSuiteNames[slot].version);
  }
}

void QZGP_SuiteHandler::MissingSuiteError() { ThrowCode(kMissingSuite); }

void QZGP_SuiteHandler::Acquire(Slot slot) {
  const void* suite = nullptr;
  const HostError code = basicSuite_->AcquireSuite(kSuiteNames[slot].name, kSuiteNames[slot].version, &suite);
  if (code != kNoError || suite == nullptr) MissingSuiteError();
  suites_[slot] = suite;
}

void QZGP_SuiteHandler::ReleaseSuite(const char* name, std::int32_t version) {
  basicSuite_->ReleaseSuiteByName(name, version);
}

}  // namespace mayaimport
