// The limits of the host: layers, keys and bytes of memory.
//
// The importer makes a null layer for each parent of each camera and marked locator, so that a small text can
// ask for far more than it holds. Beyond a limit the host refuses; what exists stays.
#pragma once

#include <cstdint>

#include "refhost/Host.h"
#include "refhost/Operations.h"

namespace refhost {

class Call;

// How much more the host takes. None goes below 0.
struct Allowance {
  // Limits below 0 count as 0.
  explicit Allowance(const HostOptions& options);

  std::int64_t layers;  // of the project
  std::int64_t keys;    // of the project and of open batches; never more than an index can count
  std::int64_t memory;  // bytes of memory handles
};

// Whether the host takes one more layer, `keys` more keys or `bytes` more bytes. False after a refusal. The
// caller subtracts what it then makes from the allowance.
bool takesLayer(Call& call);
bool takesKeys(Call& call, std::int32_t keys);
bool takesMemory(Call& call, std::int64_t bytes);

// Refuses one more key.
[[gnu::cold]] HostError refuseKey(Operation operation);

}  // namespace refhost
