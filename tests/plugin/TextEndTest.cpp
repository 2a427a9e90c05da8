// The block that the text is read into, seen by a host that fills it before it hands it out.
#include <cstring>

#include "hostapi/MemorySuite.h"
#include "plugin/Entry.h"
#include "tests/plugin/PluginRun.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using namespace std::string_literals;

constexpr char kFilling = '#';

// Suites are tables without a context: the host that was given, and what it and the plug-in said.
const WNBasicSuite* givenHost = nullptr;
const QZGP_MemorySuite1* givenMemory = nullptr;
std::int64_t blockSize = 0;
char* block = nullptr;
std::string atUnlock;

HostError NewMemHandle(std::int32_t pluginId, const char* name, std::int64_t size, std::int32_t flags,
                       HostMemHandle** handle) {
  blockSize = size;
  return givenMemory->NewMemHandle(pluginId, name, size, flags, handle);
}

HostError FreeMemHandle(HostMemHandle* handle) { return givenMemory->FreeMemHandle(handle); }

HostError LockMemHandle(HostMemHandle* handle, void** address) {
  const HostError code = givenMemory->LockMemHandle(handle, address);
  block = static_cast<char*>(*address);
  std::memset(block, kFilling, static_cast<std::size_t>(blockSize));
  return code;
}

HostError UnlockMemHandle(HostMemHandle* handle) {
  atUnlock.assign(block, static_cast<std::size_t>(blockSize));
  return givenMemory->UnlockMemHandle(handle);
}

constinit const QZGP_MemorySuite1 kMemory = {NewMemHandle, FreeMemHandle, LockMemHandle, UnlockMemHandle};

HostError AcquireSuite(const char* name, std::int32_t version, const void** suite) {
  const HostError code = givenHost->AcquireSuite(name, version, suite);
  if (code == HOST_ERR_NONE && std::strcmp(name, QZGP_MEMORY_SUITE) == 0) {
    givenMemory = static_cast<const QZGP_MemorySuite1*>(*suite);
    *suite = &kMemory;
  }
  return code;
}

HostError ReleaseSuiteByName(const char* name, std::int32_t version) {
  return givenHost->ReleaseSuiteByName(name, version);
}

constinit const WNBasicSuite kHost = {AcquireSuite, ReleaseSuiteByName};

HostError Enter(const WNBasicSuite* basicSuite, std::int32_t hostMajor, std::int32_t hostMinor,
                std::int32_t pluginId, void* reserved) {
  givenHost = basicSuite;
  return MayaImportEntry(&kHost, hostMajor, hostMinor, pluginId, reserved);
}

class TextEndTest : public PluginTest {
 protected:
  // What the block holds after the import of a file of these bytes.
  std::string BlockAfter(std::string_view bytes, std::vector<refhost::Failure> failures = {}) {
    EndHost();
    atUnlock.clear();
    refhost::HostOptions options;
    options.failures = std::move(failures);
    host_ = std::make_unique<refhost::Host>(std::move(options));
    refhost::CallbackResult result;
    EXPECT_TRUE(host_->load(&Enter, &result));
    host_->importScene(Write("scene.ma", bytes));
    return atUnlock;
  }
};

TEST_F(TextEndTest, TwoNulsStandAfterTheText) {
  EXPECT_EQ(BlockAfter(kScene), kScene + "\0\0"s);
  EXPECT_EQ(BlockAfter("//Maya 123"), "//Maya 123\0\0"s);
}

TEST_F(TextEndTest, AFileThatIsNoSceneIsTwoNuls) { EXPECT_EQ(BlockAfter("FOR4 no scene at all"), "\0\0"s); }

TEST_F(TextEndTest, WhatCannotBeReadIsAnEmptyTextWithBothNuls) {
  // The first opening is that of the header test.
  EXPECT_EQ(BlockAfter("//Maya 123", {FailCall("FileOpen", 2)}), "\0\0"s + std::string(10, kFilling));
}

}  // namespace
}  // namespace testsupport
