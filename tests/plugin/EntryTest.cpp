#include "plugin/Entry.h"

#include "hostutil/HostStrings.h"
#include "plugin/Globals.h"
#include "tests/plugin/PluginRun.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::AnyOf;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::IsSupersetOf;

class EntryTest : public PluginTest {
 protected:
  refhost::CallbackResult LoadWith(std::vector<refhost::Failure> failures) {
    refhost::HostOptions options;
    options.failures = std::move(failures);
    options.during = refhost::Callback::Entry;
    return Load(std::move(options));
  }

  refhost::CallbackResult LoadWithout(const char* suite, std::int32_t version) {
    refhost::HostOptions options;
    options.refusedSuites = {{suite, version}};
    options.during = refhost::Callback::Entry;
    return Load(std::move(options));
  }
};

TEST_F(EntryTest, TheCallsComeInTheirOrder) {
  EXPECT_EQ(Load().code, 0);
  EXPECT_THAT(Calls(), ElementsAre("AcquireSuite QZGP Persistent Data Suite 3", "GetAppPrefsBlob",
                                   "GetPrefLong", "AcquireSuite QZGP Register Suite 6", "RegisterDeathHook",
                                   "AcquireSuite QZGP File Import Manager Suite 3", "RegisterImporterName",
                                   "RegisterImporterTypes", "RegisterImporterCallbacks",
                                   "ReleaseSuiteByName QZGP Persistent Data Suite 3",
                                   "ReleaseSuiteByName QZGP Register Suite 6",
                                   "ReleaseSuiteByName QZGP File Import Manager Suite 3"));
}

TEST_F(EntryTest, WhatIsRegisteredIsTheMayaScene) {
  const refhost::CallbackResult result = Load();
  EXPECT_THAT(result.refusals, IsEmpty());
  EXPECT_THAT(result.leftovers, IsEmpty());
  EXPECT_EQ(host_->importerName(), "Maya Scene");
  EXPECT_THAT(host_->importerExtensions(), ElementsAre(".ma"));
  EXPECT_THAT(LineOf("RegisterImporterName"), HasSubstr("\"name\":\"Maya Scene\""));
  EXPECT_THAT(LineOf("RegisterImporterTypes"),
              HasSubstr("\"types\":[{\"type\":\"MAYA\",\"creator\":\"MaYa\"}],\"extensions\":[\".ma\"]"));
  EXPECT_THAT(LineOf("RegisterImporterCallbacks"), HasSubstr("\"count\":2"));
  EXPECT_THAT(LineOf("RegisterDeathHook"), HasSubstr("\"pluginId\":7,\"refcon\":0"));
  EXPECT_THAT(
      LineOf("GetPrefLong"),
      HasSubstr("\"section\":\"Maya Camera\",\"key\":\"Use Linear Units\",\"default\":0,\"value\":0"));
}

TEST_F(EntryTest, TheGlobalsAreSet) {
  Load();
  EXPECT_EQ(G_basic_suiteP, host_->basicSuite());
  EXPECT_EQ(G_plugin_idL, kRunPluginId);
  EXPECT_NE(Maya_Import_G_zref, nullptr);
  EXPECT_EQ(G_use_linear_unitsL, 0);
}

TEST_F(EntryTest, TheDisplayNameIsLocalised) {
  refhost::HostOptions options;
  options.translations = {{"$$$/QZ/Maya_Import/LStr/0000", "Maya-Szene"}};
  EXPECT_EQ(Load(options).code, 0);
  EXPECT_EQ(host_->importerName(), "Maya-Szene");
}

TEST_F(EntryTest, ThePreferenceIsReadFromTheStore) {
  refhost::HostOptions options;
  options.linearUnits = -3;
  EXPECT_EQ(Load(options).code, 0);
  EXPECT_EQ(G_use_linear_unitsL, -3);
}

TEST_F(EntryTest, TheDefaultOfThePreferenceIsTheCurrentValue) {
  G_use_linear_unitsL = 5;
  EXPECT_EQ(Load().code, 0);
  EXPECT_THAT(LineOf("GetPrefLong"), HasSubstr("\"default\":5,\"value\":5"));
  EXPECT_EQ(G_use_linear_unitsL, 5);
}

TEST_F(EntryTest, FailedPreferenceCallsAreIgnored) {
  EXPECT_EQ(LoadWith({FailCall("GetAppPrefsBlob", 1)}).code, 0);
  EXPECT_EQ(CallsNamed("GetPrefLong"), 1u);
  EXPECT_EQ(host_->importerName(), "Maya Scene");
  EXPECT_EQ(LoadWith({FailCall("GetPrefLong", 1)}).code, 0);
  EXPECT_EQ(G_use_linear_unitsL, 0);
  EXPECT_EQ(host_->importerName(), "Maya Scene");
}

TEST_F(EntryTest, AFailedDeathHookRegistrationIsIgnored) {
  EXPECT_EQ(LoadWith({FailCall("RegisterDeathHook", 1)}).code, 0);
  EXPECT_EQ(host_->importerName(), "Maya Scene");
}

TEST_F(EntryTest, WithoutTheStringTableNoImporterIsRegistered) {
  const refhost::CallbackResult result = LoadWith({FailCall("RegisterStringTable", 1, 88)});
  EXPECT_EQ(result.code, 88);
  EXPECT_THAT(Calls(), IsSupersetOf({"GetAppPrefsBlob", "GetPrefLong", "RegisterDeathHook"}));
  EXPECT_EQ(CallsNamed("RegisterImporterName"), 0u);
  EXPECT_EQ(host_->importScene("any.ma").code, HOST_ERR_REGISTRATION);
  ExpectSound(result);
}

TEST_F(EntryTest, TheFirstFailureEndsTheChainOfRegistrations) {
  EXPECT_EQ(LoadWith({FailCall("RegisterImporterName", 1, 61)}).code, 61);
  EXPECT_EQ(CallsNamed("RegisterImporterTypes"), 0u);
  EXPECT_EQ(CallsNamed("RegisterImporterCallbacks"), 0u);
  EXPECT_EQ(LoadWith({FailCall("RegisterImporterTypes", 1, 62)}).code, 62);
  EXPECT_EQ(CallsNamed("RegisterImporterName"), 1u);
  EXPECT_EQ(CallsNamed("RegisterImporterCallbacks"), 0u);
  EXPECT_EQ(LoadWith({FailCall("RegisterImporterCallbacks", 1, 63)}).code, 63);
  EXPECT_EQ(CallsNamed("RegisterImporterTypes"), 1u);
}

TEST_F(EntryTest, AMissingSuiteIsThirteen) {
  EXPECT_EQ(LoadWithout("QZGP Persistent Data Suite", 3).code, 13);
  EXPECT_EQ(LoadWithout("QZGP Register Suite", 6).code, 13);
  EXPECT_EQ(LoadWithout("QZGP File Import Manager Suite", 3).code, 13);
  EXPECT_EQ(LoadWithout("QZGP Comp Suite", 21).code, 0);
}

TEST_F(EntryTest, ANullBasicSuiteIsThirteen) {
  EXPECT_EQ(MayaImportEntry(nullptr, 1, 0, kRunPluginId, nullptr), 13);
}

TEST_F(EntryTest, AnExceptionBecomesItsCodeAndAStandardOneIsReported) {
  for (const char* const call :
       {"GetAppPrefsBlob", "GetPrefLong", "RegisterDeathHook", "RegisterImporterName",
        "RegisterImporterTypes", "RegisterImporterCallbacks", "RegisterStringTable"}) {
    SCOPED_TRACE(call);
    const refhost::CallbackResult memory = LoadWith({ThrowCall(call, 1)});
    EXPECT_EQ(memory.code, HOST_ERR_EXCEPTION_MEMORY);
    EXPECT_EQ(memory.messages.size(), 1u);
    ExpectSound(memory);
    const refhost::CallbackResult other =
        LoadWith({ThrowCall(call, 1, refhost::Failure::Kind::RuntimeError)});
    EXPECT_EQ(other.code, HOST_ERR_EXCEPTION_OTHER);
    ExpectSound(other);
    const refhost::CallbackResult unknown = LoadWith({ThrowCall(call, 1, refhost::Failure::Kind::Other)});
    EXPECT_EQ(unknown.code, HOST_ERR_EXCEPTION_OTHER);
    EXPECT_THAT(unknown.messages, ::testing::IsEmpty());
    ExpectSound(unknown);
  }
}

TEST_F(EntryTest, EverySuiteCallFailingInTurnIsItsCodeOrIgnored) {
  const std::int64_t calls = Load().suiteCalls;
  ASSERT_EQ(calls, 12);
  const std::vector<std::string> names = Calls();
  for (std::int64_t nth = 1; nth <= calls; ++nth) {
    const std::string& name = names[static_cast<std::size_t>(nth - 1)];
    SCOPED_TRACE(name);
    const refhost::CallbackResult result = LoadWith({FailAt(nth)});
    const bool chain = name.starts_with("RegisterImporter");
    EXPECT_EQ(result.code, name.starts_with("AcquireSuite") ? 13 : chain ? kRehearsed : 0);
    ExpectSound(result);
    ExpectSound(LoadWith({FailAt(nth, 0)}));
  }
}

TEST_F(EntryTest, TheDeathHookGivesTheStringsBack) {
  Load();
  const refhost::CallbackResult result = host_->unload();
  EXPECT_EQ(result.code, 0);
  EXPECT_THAT(result.leftovers, IsEmpty());
  EXPECT_EQ(Maya_Import_G_zref, nullptr);
  EXPECT_THAT(Calls(), IsEmpty());
}

TEST_F(EntryTest, ThePluginCanBeLoadedAgain) {
  EXPECT_EQ(Load().code, 0);
  EXPECT_EQ(Load().code, 0);
  EXPECT_EQ(host_->importerName(), "Maya Scene");
}

}  // namespace
}  // namespace testsupport
