// The contents of a text.
#pragma once

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include "hostutil/RegistryInternal.h"
#include "hostutil/UTF16String.h"

struct UTF16String final : hostutil::LiveObject {
  // The units come with their NUL.
  explicit UTF16String(std::vector<HostUTF16Unit> terminated)
      : LiveObject(Kind::Text), units(std::move(terminated)) {}

  // Never called: texts are not part of the ledger.
  std::string Describe() const override { return "text"; }  // GCOVR_EXCL_LINE

  const std::vector<HostUTF16Unit> units;
  std::int64_t references = 1;
};
