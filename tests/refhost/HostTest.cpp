// The host's own calls into a plug-in, with a small plug-in of the test's own.
#include <stdexcept>

#include "hostutil/HostStrings.h"
#include "tests/refhost/StandIn.h"
#include "tests/support/TemporaryFolder.h"

namespace refhost {
namespace {

using testsupport::TemporaryFolder;

using ::testing::ElementsAre;
using ::testing::IsEmpty;

// What the plug-in saw, and what a test makes it do.
struct Plugin {
  const WNBasicSuite* basic = nullptr;
  std::int32_t pluginId = 0;
  void* reserved = nullptr;
  std::int32_t linearUnits = -1;
  std::u16string importPath;
  VOR_Item* folder = nullptr;
  std::intptr_t deathRefcon = 0;
  int deaths = 0;
  HostError entryCode = 0;
  HostError importCode = 0;
  bool accepts = true;
  bool throwsInImport = false;
};

Plugin* seen = nullptr;

HostError deathHook(std::intptr_t refcon) {
  ++seen->deaths;
  seen->deathRefcon = refcon;
  return 31;
}

HostError importFile(const HostUTF16Unit* path, void* ignored1, void* ignored2, VOR_Item* folder) {
  EXPECT_EQ(ignored1, nullptr);
  EXPECT_EQ(ignored2, nullptr);
  for (; *path != 0; ++path) seen->importPath += static_cast<char16_t>(*path);
  seen->folder = folder;
  kUtilitySuite7.ShowMessage(seen->pluginId, "imported");
  if (seen->throwsInImport) throw std::runtime_error("out of the plug-in");
  return seen->importCode;
}

HostError verifyFile(const HostUTF16Unit*, void* ignored, std::uint8_t* canImport) {
  EXPECT_EQ(ignored, nullptr);
  *canImport = seen->accepts ? 1 : 0;
  return 0;
}

HostError entry(const WNBasicSuite* basic, std::int32_t, std::int32_t, std::int32_t pluginId,
                void* reserved) {
  seen->basic = basic;
  seen->pluginId = pluginId;
  seen->reserved = reserved;
  HostPrefsStore* store = nullptr;
  kPersistentDataSuite3.GetAppPrefsBlob(&store);
  kPersistentDataSuite3.GetPrefLong(store, HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS, 0, &seen->linearUnits);
  kRegisterSuite6.RegisterDeathHook(pluginId, deathHook, 77);
  if (seen->entryCode != 0) return seen->entryCode;
  HostImporterId importer = 0;
  kFileImportManagerSuite3.RegisterImporterName("Test Scene", &importer);
  const HostImporterType type{1, 2};
  const HostImporterExtension extensions[] = {{{'.', 'm', 'a', 0}}, {{'.', 'a', 'b', 'c'}}};
  kFileImportManagerSuite3.RegisterImporterTypes(importer, 1, &type, 2, extensions);
  const HostImporterCallbacks callbacks{nullptr, importFile, verifyFile};
  return kFileImportManagerSuite3.RegisterImporterCallbacks(importer, 2, &callbacks);
}

class HostCalls : public ::testing::Test {
 protected:
  HostCalls() { seen = &plugin; }
  ~HostCalls() override { seen = nullptr; }

  static HostOptions options() {
    HostOptions options;
    options.pluginId = 19;
    return options;
  }

  Plugin plugin;
  CallbackResult loaded;
};

TEST_F(HostCalls, EntryGetsTheBasicSuiteAndThePluginId) {
  Host host(options());
  ASSERT_TRUE(host.load(entry, &loaded));
  EXPECT_EQ(loaded.code, 0);
  EXPECT_EQ(plugin.basic, host.basicSuite());
  EXPECT_EQ(plugin.pluginId, 19);
  EXPECT_EQ(plugin.reserved, nullptr);
  EXPECT_EQ(loaded.suiteCalls, 6);
}

TEST_F(HostCalls, RegistrationIsKnownAfterTheEntry) {
  Host host(options());
  EXPECT_EQ(host.importerName(), "");
  EXPECT_THAT(host.importerExtensions(), IsEmpty());
  host.load(entry, &loaded);
  EXPECT_EQ(host.importerName(), "Test Scene");
  EXPECT_THAT(host.importerExtensions(), ElementsAre(".ma", ".abc"));
}

TEST_F(HostCalls, EachImportHasAFolderOfItsOwn) {
  Host host(options());
  host.load(entry, &loaded);
  const CallbackResult first = host.importScene("first.ma");
  VOR_Item* firstFolder = plugin.folder;
  plugin.importCode = 13;
  const CallbackResult second = host.importScene("second.ma");
  EXPECT_EQ(first.code, 0);
  EXPECT_EQ(second.code, 13);
  EXPECT_THAT(first.messages, ElementsAre("imported"));
  ASSERT_EQ(host.project().folders().size(), 2U);
  EXPECT_EQ(first.folder, &host.project().folders()[0]);
  EXPECT_EQ(second.folder, &host.project().folders()[1]);
  EXPECT_EQ(second.folder->itemNumber, 2);
  EXPECT_NE(firstFolder, plugin.folder);
  EXPECT_EQ(plugin.importPath, u"first.masecond.ma");
}

TEST_F(HostCalls, PathKeepsBytesThatAreNoUtf8AsLoneSurrogates) {
  Host host(options());
  host.load(entry, &loaded);
  host.importScene("\xC3\xA9\xFF.ma");
  EXPECT_EQ(plugin.importPath, std::u16string(u"é") + char16_t{0xDCFF} + u".ma");
}

TEST_F(HostCalls, VerificationAnswersWithoutAFolder) {
  Host host(options());
  host.load(entry, &loaded);
  EXPECT_TRUE(host.verifyScene("a.ma").canImport);
  plugin.accepts = false;
  const CallbackResult result = host.verifyScene("a.ma");
  EXPECT_FALSE(result.canImport);
  EXPECT_EQ(result.folder, nullptr);
  EXPECT_THAT(host.project().folders(), IsEmpty());
}

TEST_F(HostCalls, VerificationsAnswerIsInTheTrace) {
  std::ostringstream trace;
  HostOptions given = options();
  given.trace = &trace;
  Host host(given);
  host.load(entry, &loaded);
  trace.str("");
  host.verifyScene("a.ma");
  EXPECT_EQ(trace.str(),
            "{\"call\":\"enter\",\"callback\":\"VerifyFileCallback\",\"path\":\"a.ma\"}\n"
            "{\"call\":\"leave\",\"callback\":\"VerifyFileCallback\",\"canImport\":true,\"error\":0}\n");
}

TEST_F(HostCalls, WithoutAnImporterNothingIsCalled) {
  std::ostringstream trace;
  HostOptions given = options();
  given.trace = &trace;
  Host host(given);
  EXPECT_EQ(host.importScene("a.ma").code, HOST_ERR_REGISTRATION);
  EXPECT_EQ(host.verifyScene("a.ma").code, HOST_ERR_REGISTRATION);
  EXPECT_EQ(host.unload().code, 0);
  EXPECT_EQ(trace.str(), "");
  EXPECT_THAT(host.project().folders(), IsEmpty());
}

TEST_F(HostCalls, CodeOfTheEntryIsHandedOn) {
  plugin.entryCode = 2043;
  Host host(options());
  ASSERT_TRUE(host.load(entry, &loaded));
  EXPECT_EQ(loaded.code, 2043);
  EXPECT_EQ(host.importScene("a.ma").code, HOST_ERR_REGISTRATION);
}

TEST_F(HostCalls, DeathHookIsCalledOnceWithItsReferenceValue) {
  {
    Host host(options());
    host.load(entry, &loaded);
    EXPECT_EQ(host.unload().code, 31);
    EXPECT_EQ(host.unload().code, 0);
    EXPECT_EQ(host.importScene("a.ma").code, HOST_ERR_REGISTRATION);
  }
  EXPECT_EQ(plugin.deaths, 1);
  EXPECT_EQ(plugin.deathRefcon, 77);
}

TEST_F(HostCalls, HostThatGoesCallsTheDeathHookFirst) {
  {
    Host host(options());
    host.load(entry, &loaded);
  }
  EXPECT_EQ(plugin.deaths, 1);
}

TEST_F(HostCalls, ExceptionOutOfThePluginIsSurvivedAndReported) {
  plugin.throwsInImport = true;
  Host host(options());
  host.load(entry, &loaded);
  const CallbackResult result = host.importScene("a.ma");
  EXPECT_EQ(result.code, HOST_ERR_EXCEPTION_OTHER);
  EXPECT_THAT(result.refusals, ElementsAre("an exception left the plug-in"));
  plugin.throwsInImport = false;
  EXPECT_EQ(host.importScene("a.ma").code, 0);
}

TEST_F(HostCalls, RehearsalOfTheEntryReachesTheEntry) {
  HostOptions given = withFailure(codeFailure("RegisterImporterCallbacks", 1, 451));
  given.during = Callback::Entry;
  Host host(given);
  host.load(entry, &loaded);
  EXPECT_EQ(loaded.code, 451);
}

TEST_F(HostCalls, SecondHostBesideALivingOneIsRefused) {
  Host host(options());
  EXPECT_THROW(Host{options()}, std::logic_error);
  host.load(entry, &loaded);
  EXPECT_EQ(loaded.code, 0);
}

TEST_F(HostCalls, TranslationsLastAsLongAsTheHost) {
  const char* const entries[] = {"$$$/greeting=hello"};
  HostStringTable* table = nullptr;
  HostOptions given = options();
  given.translations.emplace_back("$$$/greeting", "bonjour");
  {
    Host host(given);
    ASSERT_EQ(HostRegisterStringTable("Test", entries, 1, &table), 0);
    EXPECT_STREQ(HostLocalizedString(table, 0), "bonjour");
  }
  EXPECT_STREQ(HostLocalizedString(table, 0), "hello");
  EXPECT_EQ(HostUnregisterStringTable(table), 0);
}

TEST_F(HostCalls, MissingPreferenceFileIsWrittenAfterTheEntry) {
  const TemporaryFolder folder;
  HostOptions given = options();
  given.preferences = folder.path() / "store";
  Host host(given);
  host.load(entry, &loaded);
  EXPECT_EQ(plugin.linearUnits, 0);
  EXPECT_EQ(folder.read("store"), "[Maya Camera]\nUse Linear Units=0\n");
}

TEST_F(HostCalls, ExistingPreferenceFileIsReadAndNotWritten) {
  const TemporaryFolder folder;
  const std::string text = "# mine\n[Maya Camera]\nUse Linear Units=1\n";
  HostOptions given = options();
  given.preferences = folder.write("store", text);
  Host host(given);
  host.load(entry, &loaded);
  EXPECT_EQ(plugin.linearUnits, 1);
  EXPECT_EQ(folder.read("store"), text);
}

TEST_F(HostCalls, LinearUnitsOfThisRunAreNotStored) {
  const TemporaryFolder folder;
  HostOptions given = options();
  given.preferences = folder.path() / "store";
  given.linearUnits = 1;
  Host host(given);
  host.load(entry, &loaded);
  EXPECT_EQ(plugin.linearUnits, 1);
  EXPECT_EQ(folder.read("store"), "[Maya Camera]\nUse Linear Units=0\n");
}

TEST_F(HostCalls, LinearUnitsAreThoseThatThePluginWasHandedLast) {
  HostOptions given = options();
  given.linearUnits = 6;
  Failure failure;
  failure.operation = "GetPrefLong";
  failure.nth = 2;
  failure.code = 5;
  given.failures = {failure};
  given.during = Callback::Entry;
  Host host(given);
  EXPECT_EQ(host.linearUnits(), 0);
  host.load(entry, &loaded);
  EXPECT_EQ(host.linearUnits(), 6);
  host.beginCallback(Callback::Entry, {});
  HostPrefsStore* store = nullptr;
  std::int32_t value = 0;
  ASSERT_EQ(kPersistentDataSuite3.GetAppPrefsBlob(&store), 0);
  ASSERT_EQ(kPersistentDataSuite3.GetPrefLong(store, HOST_PREF_SECTION, "Another", 9, &value), 0);
  EXPECT_EQ(kPersistentDataSuite3.GetPrefLong(store, HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS, 8, &value),
            5);
  host.endCallback(0);
  EXPECT_EQ(host.linearUnits(), 6);
}

TEST_F(HostCalls, LinearUnitsAreZeroWhereTheCallFailed) {
  HostOptions given = options();
  given.linearUnits = 6;
  Failure failure;
  failure.operation = "GetPrefLong";
  failure.code = 5;
  given.failures = {failure};
  given.during = Callback::Entry;
  Host host(given);
  host.load(entry, &loaded);
  EXPECT_EQ(host.linearUnits(), 0);
}

TEST_F(HostCalls, WithoutAStoreTheDefaultIsTheAnswerAndNoEntryIsMade) {
  const TemporaryFolder folder;
  HostOptions given = options();
  given.preferences = folder.path() / "store";
  given.linearUnits = 6;
  Host host(given);
  host.load(entry, &loaded);
  host.beginCallback(Callback::Entry, {});
  std::int32_t value = 0;
  EXPECT_EQ(kPersistentDataSuite3.GetPrefLong(nullptr, HOST_PREF_SECTION, "Another", 9, &value), 0);
  EXPECT_EQ(value, 9);
  EXPECT_EQ(kPersistentDataSuite3.GetPrefLong(nullptr, HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS, 8, &value),
            0);
  EXPECT_EQ(value, 8);
  EXPECT_THAT(host.endCallback(0).refusals, IsEmpty());
  EXPECT_EQ(host.linearUnits(), 8);
  EXPECT_EQ(folder.read("store"), "[Maya Camera]\nUse Linear Units=0\n");
}

TEST_F(HostCalls, PreferenceFileThatCannotBeWrittenChangesNothing) {
  const TemporaryFolder folder;
  folder.write("file", "");
  HostOptions given = options();
  given.preferences = folder.path() / "file" / "store";
  Host host(given);
  ASSERT_TRUE(host.load(entry, &loaded));
  EXPECT_EQ(loaded.code, 0);
  EXPECT_THAT(loaded.messages, IsEmpty());
  EXPECT_THAT(loaded.refusals, IsEmpty());
  EXPECT_EQ(host.importScene("a.ma").code, 0);
}

}  // namespace
}  // namespace refhost
