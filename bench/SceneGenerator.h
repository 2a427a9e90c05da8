// Writes the scenes that the import is measured with. The same workload, scale and seed give the same bytes.
#pragma once

#include <cstdint>
#include <iosfwd>
#include <string_view>

namespace bench {

struct Workload {
  std::string_view name;
  std::string_view what;
  // Writes the scene, `scale` times its ordinary size.
  void (*write)(std::ostream& out, double scale, std::uint64_t seed);
};

// Mesh, keys, nodes and composition, in this order.
extern const Workload kWorkloads[4];

// Null when there is none of that name.
const Workload* findWorkload(std::string_view name);

}  // namespace bench
