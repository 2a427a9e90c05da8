// "QZGP Memory Suite" 1: blocks of memory, named by handles.
#include <cstddef>
#include <cstdint>
#include <new>
#include <string>
#include <utility>

#include "hostutil/HostSetup.h"
#include "refhost/Call.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

constexpr std::int32_t kNoFlags = 0;

void* allocate(std::int64_t size) {
  const std::uint64_t bytes = static_cast<std::uint64_t>(size);
  if (bytes > SIZE_MAX) return nullptr;
  void* memory = ::operator new(static_cast<std::size_t>(bytes), std::nothrow);
  HostAdviseLargePages(memory, size);
  return memory;
}

void newMemHandle(Call& call, const char* name, std::int64_t size, std::int32_t flags,
                  HostMemHandle** handle) {
  if (!call.given(name, "the name") || !call.given(handle, "the place for the handle")) return;
  if (size < 0 || flags != kNoFlags) {
    call.refuse(HOST_ERR_BAD_MEMORY_SIZE,
                "a size of " + std::to_string(size) + " with flags " + std::to_string(flags));
    return;
  }
  if (!takesMemory(call, size)) return;
  MemoryBlock block;
  block.name = name;
  block.size = size;
  block.memory.reset(allocate(size));
  void* made = nullptr;
  MemoryBlock* held = block.memory == nullptr ? nullptr : call.host().memory.add(&made);
  if (held == nullptr) {
    call.refuse(HOST_ERR_MEMORY, "there is no memory for " + std::to_string(size) + " bytes");
    return;
  }
  *held = std::move(block);
  call.host().allowance.memory -= size;
  *handle = static_cast<HostMemHandle*>(made);
}

HostError NewMemHandle(std::int32_t pluginId, const char* name, std::int64_t size, std::int32_t flags,
                       HostMemHandle** handle) {
  Call call(Operation::NewMemHandle);
  if (call.goesOn(handle) && call.isPluginId(pluginId)) newMemHandle(call, name, size, flags, handle);
  if (TraceLine* line = call.traced()) {
    line->integer("pluginId", pluginId).text("name", name).integer("size", size).integer("flags", flags);
    line->handed("handle", handle);
  }
  return call.finish();
}

HostError FreeMemHandle(HostMemHandle* handle) {
  Call call(Operation::FreeMemHandle);
  if (call.goesOn()) {
    if (const MemoryBlock* block = call.memory(handle)) {
      call.host().allowance.memory += block->size;
      call.host().memory.remove(handle);
    }
  } else if (MemoryBlock* block = call.host().memory.find(handle)) {
    block->freeFailed = true;
  }
  if (TraceLine* line = call.traced()) line->handle("handle", handle);
  return call.finish();
}

HostError LockMemHandle(HostMemHandle* handle, void** address) {
  Call call(Operation::LockMemHandle);
  if (call.goesOn(address)) {
    MemoryBlock* block = call.memory(handle);
    if (block != nullptr && call.given(address, "the place for the address")) {
      ++block->locks;
      *address = block->memory.get();
    }
  } else if (MemoryBlock* block = call.host().memory.find(handle)) {
    ++block->failedLocks;
  }
  if (TraceLine* line = call.traced()) line->handle("handle", handle);
  return call.finish();
}

void unlockMemHandle(Call& call, HostMemHandle* handle) {
  MemoryBlock* block = call.memory(handle);
  if (block == nullptr) return;
  if (block->locks > 0) {
    --block->locks;
  } else if (block->failedLocks > 0) {
    --block->failedLocks;
  } else {
    call.refuse(HOST_ERR_MEMORY_STATE, call.host().codec.describe(handle) + " is not locked");
  }
}

HostError UnlockMemHandle(HostMemHandle* handle) {
  Call call(Operation::UnlockMemHandle);
  if (call.goesOn()) unlockMemHandle(call, handle);
  if (TraceLine* line = call.traced()) line->handle("handle", handle);
  return call.finish();
}

constexpr QZGP_MemorySuite1 table() {
  QZGP_MemorySuite1 suite{};
  suite.NewMemHandle = NewMemHandle;
  suite.FreeMemHandle = FreeMemHandle;
  suite.LockMemHandle = LockMemHandle;
  suite.UnlockMemHandle = UnlockMemHandle;
  return suite;
}

}  // namespace

constinit const QZGP_MemorySuite1 kMemorySuite1 = table();

}  // namespace refhost
