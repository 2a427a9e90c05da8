// The writers of the workloads, a source each.
#pragma once

#include "bench/SceneGenerator.h"

namespace bench {

Built writeMesh(std::ostream& out, double scale, std::uint64_t seed);
Built writeKeys(std::ostream& out, double scale, std::uint64_t seed);
Built writeNodes(std::ostream& out, double scale, std::uint64_t seed);
Built writeComposition(std::ostream& out, double scale, std::uint64_t seed);
Built writeCameras(std::ostream& out, double scale, std::uint64_t seed);
Built writeShot(std::ostream& out, double scale, std::uint64_t seed);
Built writeShotUnquoted(std::ostream& out, double scale, std::uint64_t seed);

}  // namespace bench
