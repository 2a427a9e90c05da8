// Writes the scenes of the measurements. The same workload, scale and seed give the same bytes.
#pragma once

#include <cstdint>
#include <iosfwd>
#include <span>
#include <string_view>

namespace bench {

// The layers of any kind, and the keys of all their streams, that an import of a scene makes.
struct Built {
  std::int64_t layers = 0;
  std::int64_t keys = 0;

  bool operator==(const Built&) const = default;
};

struct Workload {
  std::string_view name;
  std::string_view what;
  // Writes the scene, `scale` times its ordinary size. Returns what an import of it makes.
  Built (*write)(std::ostream& out, double scale, std::uint64_t seed);
  // What the import returns: 0, or the code of the error that stops it.
  std::int32_t code = 0;
};

std::span<const Workload> workloads();

// Null when there is none of that name.
const Workload* findWorkload(std::string_view name);

}  // namespace bench
