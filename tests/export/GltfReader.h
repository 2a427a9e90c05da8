// A reader of glTF 2.0 of the tests' own. It holds a file to the format's rules as far as writers of
// animations can break them, and throws Broken where one is.
#pragma once

#include <functional>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

#include "tests/export/SeenScene.h"

namespace exporttest {

// The bytes of a file beside it, by its name.
using Beside = std::function<std::string(const std::string& name)>;

// Of a .gltf, or of a .glb by its first bytes. Layers are the nodes, times are seconds.
SeenScene ReadGltf(std::string_view file, const Beside& beside);

// Its JSON alone.
nlohmann::json GltfJsonOf(std::string_view file);

}  // namespace exporttest
