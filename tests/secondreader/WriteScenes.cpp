// write-scenes FIRST_SEED COUNT FOLDER: generated scenes as files. Each seed gets a folder of its number with
// the scene, the translations that its host has, and "arguments": what stands after "mayascene import" in a
// run from within that folder, one argument a line.
#include <cstdint>
#include <cstdio>
#include <exception>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <string>

#include "tests/secondreader/SceneGenerator.h"

namespace {

constexpr int kUsageStatus = 2;
constexpr const char* kTranslations = "translations";

void writeFile(const std::filesystem::path& path, const std::string& bytes) {
  std::ofstream file(path, std::ios::binary);
  file << bytes;
  file.close();
  if (!file) throw std::runtime_error(path.string() + " cannot be written");
}

std::string argumentsOf(const secondreader::GeneratedScene& scene) {
  const refhost::HostOptions& options = scene.options;
  std::string lines = "--plugin-id=" + std::to_string(options.pluginId) + "\n";
  if (options.linearUnits) lines += "--linear-units=" + std::to_string(*options.linearUnits) + "\n";
  if (options.permissive) lines += "--permissive\n";
  if (options.zoomKeys != 0) lines += "--zoom-keys=" + std::to_string(options.zoomKeys) + "\n";
  if (!options.translations.empty()) lines += std::string("--translations=") + kTranslations + "\n";
  for (int import = 0; import < scene.imports; ++import) lines += scene.fileName + "\n";
  return lines;
}

void writeScene(std::uint64_t seed, const std::filesystem::path& folder) {
  const secondreader::GeneratedScene scene = secondreader::SceneGenerator(seed).make();
  std::filesystem::create_directories(folder);
  writeFile(folder / scene.fileName, scene.bytes);
  writeFile(folder / "arguments", argumentsOf(scene));
  std::string translations;
  for (const auto& [key, text] : scene.options.translations) {
    translations += key;
    translations += '=' + text + '\n';
  }
  if (!translations.empty()) writeFile(folder / kTranslations, translations);
}

}  // namespace

int main(int count, char** arguments) {
  try {
    if (count == 4) {
      const std::uint64_t first = std::stoull(arguments[1]);
      const std::uint64_t scenes = std::stoull(arguments[2]);
      for (std::uint64_t seed = first; seed < first + scenes; ++seed) {
        writeScene(seed, std::filesystem::path(arguments[3]) / std::to_string(seed));
      }
      return 0;
    }
  } catch (const std::exception& exception) {
    std::fprintf(stderr, "write-scenes: %s\n", exception.what());
    return 1;
  }
  std::fprintf(stderr, "usage: write-scenes FIRST_SEED COUNT FOLDER\n");
  return kUsageStatus;
}
