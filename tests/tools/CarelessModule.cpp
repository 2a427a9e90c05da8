// An import module that breaks its promises, for the tests of the tool's complaints.
//
// Importing a file leaves a block of memory behind, shows a message and passes a null handle. For a file
// whose name ends in "throws", an exception leaves the module.
#include <cstdint>
#include <stdexcept>

#include "hostapi/FileImportManagerSuite.h"
#include "hostapi/MemorySuite.h"
#include "hostapi/PluginEntry.h"
#include "hostapi/UtilitySuite.h"

namespace {

const WNBasicSuite* basic = nullptr;
std::int32_t ownId = 0;

template <typename Suite>
const Suite* acquire(const char* name, std::int32_t version) {
  const void* suite = nullptr;
  return basic->AcquireSuite(name, version, &suite) == 0 ? static_cast<const Suite*>(suite) : nullptr;
}

bool endsInThrows(const HostUTF16Unit* path) {
  const HostUTF16Unit* end = path;
  while (*end != 0) ++end;
  return end > path && end[-1] == 's';
}

HostError importFile(const HostUTF16Unit* path, void*, void*, VOR_Item*) {
  if (endsInThrows(path)) throw std::runtime_error("out of the module");
  const auto* memory = acquire<QZGP_MemorySuite1>(QZGP_MEMORY_SUITE, QZGP_MEMORY_SUITE_1);
  const auto* utility = acquire<QZGP_UtilitySuite7>(QZGP_UTILITY_SUITE, QZGP_UTILITY_SUITE_7);
  HostMemHandle* block = nullptr;
  memory->NewMemHandle(ownId, "forgotten", 12, 0, &block);
  memory->FreeMemHandle(nullptr);
  utility->ShowMessage(ownId, "look\x1b[5m here");
  basic->ReleaseSuiteByName(QZGP_MEMORY_SUITE, QZGP_MEMORY_SUITE_1);
  basic->ReleaseSuiteByName(QZGP_UTILITY_SUITE, QZGP_UTILITY_SUITE_7);
  return 0;
}

HostError verifyFile(const HostUTF16Unit*, void*, std::uint8_t* canImport) {
  *canImport = 1;
  return 0;
}

}  // namespace

extern "C" __attribute__((visibility("default"))) HostError GPMain_MayaImport(const WNBasicSuite* basicSuite,
                                                                              std::int32_t, std::int32_t,
                                                                              std::int32_t pluginId, void*) {
  basic = basicSuite;
  ownId = pluginId;
  const auto* manager =
      acquire<QZGP_FileImportManagerSuite3>(QZGP_FILE_IMPORT_MANAGER_SUITE, QZGP_FILE_IMPORT_MANAGER_SUITE_3);
  HostImporterId importer = 0;
  const HostImporterType type = {0x4d415941, 0x4d615961};
  const HostImporterExtension extension = {{'.', 'm', 'a', 0}};
  const HostImporterCallbacks callbacks = {nullptr, importFile, verifyFile};
  manager->RegisterImporterName("Careless", &importer);
  manager->RegisterImporterTypes(importer, 1, &type, 1, &extension);
  return manager->RegisterImporterCallbacks(importer, 2, &callbacks);  // and keeps the suite
}
