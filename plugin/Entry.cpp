#include "plugin/Entry.h"

#include "plugin/Globals.h"
#include "plugin/Guarded.h"
#include "plugin/ImportDriver.h"
#include "plugin/Messages.h"
#include "plugin/QZGP_SuiteHandler.h"

namespace mayaimport {

namespace {

constexpr std::uint32_t FourCharacters(const char (&code)[5]) {
  std::uint32_t packed = 0;
  for (int i = 0; i < 4; ++i) packed = packed << 8 | static_cast<unsigned char>(code[i]);
  return packed;
}

constexpr HostImporterType kFileType{FourCharacters("MAYA"), FourCharacters("MaYa")};
constexpr HostImporterExtension kExtension{{'.', 'm', 'a', '\0'}};
constexpr HostImporterCallbacks kCallbacks{nullptr, ImportFileCallback, VerifyFileCallback};
constexpr std::int32_t kCallbackCount = 2;

// Whatever fails here, the preference keeps its default.
void ReadPreference(QZGP_SuiteHandler& suites) {
  HostPrefsStore* store = nullptr;
  suites.PersistentDataSuite3().GetAppPrefsBlob(&store);
  suites.PersistentDataSuite3().GetPrefLong(store, HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS,
                                            G_use_linear_unitsL, &G_use_linear_unitsL);
}

HostError RegisterImporter(QZGP_SuiteHandler& suites, const char* name) {
  const QZGP_FileImportManagerSuite3& manager = suites.FileImportManagerSuite3();
  HostImporterId importer = 0;
  HostError code = manager.RegisterImporterName(name, &importer);
  if (code == kNoError) code = manager.RegisterImporterTypes(importer, 1, &kFileType, 1, &kExtension);
  if (code == kNoError) code = manager.RegisterImporterCallbacks(importer, kCallbackCount, &kCallbacks);
  return code;
}

}  // namespace

HostError MayaImportEntry(const WNBasicSuite* basicSuite, std::int32_t, std::int32_t, std::int32_t pluginId,
                          void*) {
  return GuardedAtBorder([&] {
    G_basic_suiteP = basicSuite;
    G_plugin_idL = pluginId;
    QZGP_SuiteHandler suites(basicSuite);
    const HostError tableCode = RegisterMessages();
    ReadPreference(suites);
    suites.RegisterSuite6().RegisterDeathHook(pluginId, DeathHook, 0);
    const char* const name = LocalizedText(kImporterName);
    return tableCode == kNoError ? RegisterImporter(suites, name) : tableCode;
  });
}

HostError DeathHook(std::intptr_t) {
  return GuardedAtBorder([] { UnregisterMessages(); });
}

}  // namespace mayaimport
