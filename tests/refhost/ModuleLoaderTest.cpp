#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <filesystem>
#include <string>

#include "refhost/Host.h"
#include "tests/support/TemporaryFolder.h"

namespace refhost {
namespace {

using testsupport::TemporaryFolder;

using ::testing::HasSubstr;
using ::testing::StartsWith;

HostOptions optionsFor(const char* module) {
  HostOptions options;
  options.module = module;
  options.pluginId = 23;
  return options;
}

TEST(ModuleLoader, EntryOfTheModuleIsCalledWithThePluginId) {
  Host host(optionsFor(TINY_MODULE));
  CallbackResult result;
  std::string failure;
  ASSERT_TRUE(host.load(&result, &failure)) << failure;
  EXPECT_EQ(result.code, 23);
}

TEST(ModuleLoader, ModuleThatIsMissingIsReportedInWords) {
  Host host(optionsFor("/nowhere/at/all.so"));
  CallbackResult result;
  std::string failure;
  EXPECT_FALSE(host.load(&result, &failure));
  EXPECT_THAT(failure, StartsWith("the module cannot be loaded: "));
  EXPECT_THAT(failure, HasSubstr("/nowhere/at/all.so"));
}

TEST(ModuleLoader, FifoAndFolderAreNoModulesAndAreNotWaitedFor) {
  const TemporaryFolder folder;
  const std::filesystem::path fifo = folder.path() / "fifo";
  ASSERT_EQ(mkfifo(fifo.c_str(), 0600), 0);
  for (const std::filesystem::path& place : {fifo, folder.path()}) {
    Host host(optionsFor(place.c_str()));
    CallbackResult result;
    std::string failure;
    EXPECT_FALSE(host.load(&result, &failure));
    EXPECT_EQ(failure, "the module cannot be loaded: " + place.string() + ": it is not a regular file");
  }
}

TEST(ModuleLoader, ModuleWithoutEntryIsReportedInWords) {
  Host host(optionsFor(MODULE_WITHOUT_ENTRY));
  CallbackResult result;
  std::string failure;
  EXPECT_FALSE(host.load(&result, &failure));
  EXPECT_THAT(failure, StartsWith("the module has no entry: "));
}

TEST(ModuleLoader, SecondLoadIsRefused) {
  Host host(optionsFor(TINY_MODULE));
  CallbackResult result;
  std::string failure;
  ASSERT_TRUE(host.load(&result, &failure)) << failure;
  EXPECT_FALSE(host.load(&result, &failure));
  EXPECT_EQ(failure, "the module is loaded already");
}

TEST(ModuleLoader, UnloadedModuleCanBeLoadedAgain) {
  Host host(optionsFor(TINY_MODULE));
  CallbackResult result;
  std::string failure;
  ASSERT_TRUE(host.load(&result, &failure));
  host.unload();
  EXPECT_TRUE(host.load(&result, &failure)) << failure;
}

}  // namespace
}  // namespace refhost
