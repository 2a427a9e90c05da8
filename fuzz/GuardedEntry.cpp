#include "fuzz/GuardedEntry.h"

#include <cstddef>
#include <cstring>
#include <string_view>

#include "hostapi/ErrorCodes.h"
#include "hostapi/MemorySuite.h"
#include "tests/support/GuardedMemory.h"

namespace fuzz {
namespace {

// Fills memory that was not written: a quote always has an effect on the reader.
constexpr int kFilling = '"';

// Suites are tables without a context.
HostPluginEntry moduleEntry = nullptr;
const WNBasicSuite* host = nullptr;
const QZGP_MemorySuite1* hostMemory = nullptr;
std::size_t blockSize = 0;

HostError NewMemHandle(std::int32_t pluginId, const char* name, std::int64_t size, std::int32_t flags,
                       HostMemHandle** handle) {
  blockSize = static_cast<std::size_t>(size);
  return hostMemory->NewMemHandle(pluginId, name, size, flags, handle);
}

HostError FreeMemHandle(HostMemHandle* handle) { return hostMemory->FreeMemHandle(handle); }

HostError LockMemHandle(HostMemHandle* handle, void** address) {
  static testsupport::GuardedMemory memory;
  const HostError code = hostMemory->LockMemHandle(handle, address);
  if (code != HOST_ERR_NONE || *address == nullptr) return code;
  *address = memory.Take(blockSize);
  std::memset(*address, kFilling, blockSize);
  return code;
}

HostError UnlockMemHandle(HostMemHandle* handle) { return hostMemory->UnlockMemHandle(handle); }

constexpr QZGP_MemorySuite1 kMemorySuite = {NewMemHandle, FreeMemHandle, LockMemHandle, UnlockMemHandle};

HostError AcquireSuite(const char* name, std::int32_t version, const void** suite) {
  const HostError code = host->AcquireSuite(name, version, suite);
  const bool memory = std::string_view(name) == QZGP_MEMORY_SUITE && version == QZGP_MEMORY_SUITE_1;
  if (code != HOST_ERR_NONE || !memory || *suite == nullptr) return code;
  hostMemory = static_cast<const QZGP_MemorySuite1*>(*suite);
  *suite = &kMemorySuite;
  return code;
}

HostError ReleaseSuiteByName(const char* name, std::int32_t version) {
  return host->ReleaseSuiteByName(name, version);
}

constexpr WNBasicSuite kBasicSuite = {AcquireSuite, ReleaseSuiteByName};

}  // namespace

void SetModuleEntry(HostPluginEntry entry) { moduleEntry = entry; }

HostError GuardedEntry(const WNBasicSuite* basicSuite, std::int32_t hostMajor, std::int32_t hostMinor,
                       std::int32_t pluginId, void* reserved) {
  host = basicSuite;
  return moduleEntry(&kBasicSuite, hostMajor, hostMinor, pluginId, reserved);
}

}  // namespace fuzz
