// The loaded import module.
#pragma once

#include <filesystem>
#include <string>

#include "hostapi/PluginEntry.h"

namespace refhost {

class ModuleLoader {
 public:
  ModuleLoader() = default;
  ~ModuleLoader();  // unloads
  ModuleLoader(const ModuleLoader&) = delete;
  ModuleLoader& operator=(const ModuleLoader&) = delete;

  // The module's entry; null with a sentence in *failure when the module cannot be loaded or has none.
  HostPluginEntry load(const std::filesystem::path& file, std::string* failure);
  void unload();

 private:
  void* library_ = nullptr;
};

}  // namespace refhost
