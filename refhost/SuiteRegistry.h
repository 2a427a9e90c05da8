// The suites that the host offers, and how often each is held.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

#include "hostapi/WNBasicSuite.h"
#include "refhost/Operations.h"

namespace refhost {

// The tables, each defined in the file that is named after its suite.
extern const WNBasicSuite kBasicSuite;
extern const QZGP_UtilitySuite7 kUtilitySuite7;
extern const QZGP_MemorySuite1 kMemorySuite1;
extern const QZGP_PersistentDataSuite3 kPersistentDataSuite3;
extern const QZGP_RegisterSuite6 kRegisterSuite6;
extern const QZGP_FileImportManagerSuite3 kFileImportManagerSuite3;
extern const QZGP_CompSuite21 kCompSuite21;
extern const QZGP_CompSuite9 kCompSuite9;
extern const QZGP_LayerSuite10 kLayerSuite10;
extern const QZGP_CameraSuite2 kCameraSuite2;
extern const QZGP_StreamSuite7 kStreamSuite7;
extern const QZGP_StreamSuite8 kStreamSuite8;
extern const QZGP_KeyframeSuite3 kKeyframeSuite3;
extern const QZGP_KeyframeSuite4 kKeyframeSuite4;

struct OfferedSuite {
  const char* name;
  std::int32_t version;
  const void* table;
  std::int64_t held = 0;            // acquisitions that were not given back
  std::int64_t failedReleases = 0;  // releases that a rehearsal made fail
};

class SuiteRegistry {
 public:
  SuiteRegistry();

  OfferedSuite* find(std::string_view name, std::int32_t version);  // null when it is not offered
  const std::vector<OfferedSuite>& all() const { return suites_; }
  void giveAllBack();

 private:
  std::vector<OfferedSuite> suites_;
};

}  // namespace refhost
