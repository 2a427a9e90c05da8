// The one way to the host's suites: acquires each on its first use, keeps it, and releases it at the end.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

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
#include "hostapi/WNBasicSuite.h"

namespace mayaimport {

class QZGP_SuiteHandler {
 public:
  // The basic suite outlives the handler. Throws 13 when it is null.
  explicit QZGP_SuiteHandler(const WNBasicSuite* basicSuite);

  // Releases every suite that was acquired, in the order of the accessors below. Deliberate: an exception
  // out of a release ends the process; a destructor that dropped it would leave the host with a wrong count
  // of acquisitions for good.
  ~QZGP_SuiteHandler();

  QZGP_SuiteHandler(const QZGP_SuiteHandler&) = delete;
  QZGP_SuiteHandler& operator=(const QZGP_SuiteHandler&) = delete;

  // The suites, by name and version. Each throws 13 when the host does not offer it; the next use asks again.
  const QZGP_UtilitySuite7& UtilitySuite7() { return Suite<QZGP_UtilitySuite7>(kUtility7); }
  const QZGP_MemorySuite1& MemorySuite1() { return Suite<QZGP_MemorySuite1>(kMemory1); }
  const QZGP_PersistentDataSuite3& PersistentDataSuite3() {
    return Suite<QZGP_PersistentDataSuite3>(kPersistentData3);
  }
  const QZGP_RegisterSuite6& RegisterSuite6() { return Suite<QZGP_RegisterSuite6>(kRegister6); }
  const QZGP_FileImportManagerSuite3& FileImportManagerSuite3() {
    return Suite<QZGP_FileImportManagerSuite3>(kFileImportManager3);
  }
  const QZGP_CompSuite21& CompSuite21() { return Suite<QZGP_CompSuite21>(kComp21); }
  const QZGP_CompSuite9& CompSuite9() { return Suite<QZGP_CompSuite9>(kComp9); }
  const QZGP_LayerSuite10& LayerSuite10() { return Suite<QZGP_LayerSuite10>(kLayer10); }
  const QZGP_CameraSuite2& CameraSuite2() { return Suite<QZGP_CameraSuite2>(kCamera2); }
  const QZGP_StreamSuite7& StreamSuite7() { return Suite<QZGP_StreamSuite7>(kStream7); }
  const QZGP_StreamSuite8& StreamSuite8() { return Suite<QZGP_StreamSuite8>(kStream8); }
  const QZGP_KeyframeSuite3& KeyframeSuite3() { return Suite<QZGP_KeyframeSuite3>(kKeyframe3); }
  const QZGP_KeyframeSuite4& KeyframeSuite4() { return Suite<QZGP_KeyframeSuite4>(kKeyframe4); }

  // Throws 13.
  [[noreturn]] static void MissingSuiteError();

 private:
  // One cache slot per suite in use, in the order of release.
  enum Slot : std::size_t {
    kUtility7,
    kMemory1,
    kPersistentData3,
    kRegister6,
    kFileImportManager3,
    kComp21,
    kComp9,
    kLayer10,
    kCamera2,
    kStream7,
    kStream8,
    kKeyframe3,
    kKeyframe4,
    kSlotCount,
  };

  template <typename Table>
  const Table& Suite(Slot slot) {
    if (suites_[slot] == nullptr) Acquire(slot);
    return *static_cast<const Table*>(suites_[slot]);
  }

  void Acquire(Slot slot);
  void ReleaseSuite(const char* name, std::int32_t version);

  const WNBasicSuite* basicSuite_;
  std::array<const void*, kSlotCount> suites_{};
};

}  // namespace mayaimport
