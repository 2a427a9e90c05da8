#include "bench/SceneGenerator.h"

#include <array>

#include "bench/Scenes.h"

namespace bench {
namespace {

// The code for a word that begins with a byte that no word may begin with.
constexpr std::int32_t kSyntaxError = 1289985;

constexpr std::array<Workload, 7> kWorkloads = {{
    {"mesh", "90 meshes and four baked cameras", writeMesh},
    {"keys", "3000 transforms with nine curves of 240 keys each, half of them above marked locators",
     writeKeys},
    {"nodes",
     "120,000 transforms, 80,000 locators, 10,000 curves, 200,000 connections; a third of the transforms "
     "are above marked locators",
     writeNodes},
    {"composition", "1000 transforms with one curve of 1200 keys and a null locator each", writeComposition},
    {"cameras",
     "1000 cameras with ten keys a channel from frame 1 to frame 1000, half of them under a group, to be "
     "baked",
     writeCameras},
    {"shot", "references, rigs, meshes and a tracked camera; the paths of reference edits are quoted",
     writeShot},
    {"shot_unquoted", "the same shot, with the paths of added attributes as Maya writes them, not quoted",
     writeShotUnquoted, kSyntaxError},
}};

}  // namespace

std::span<const Workload> workloads() { return kWorkloads; }

const Workload* findWorkload(std::string_view name) {
  for (const Workload& workload : kWorkloads) {
    if (workload.name == name) return &workload;
  }
  return nullptr;
}

}  // namespace bench
