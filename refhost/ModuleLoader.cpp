#include "refhost/ModuleLoader.h"

#include <dlfcn.h>

#include <system_error>

#include "refhost/ShownText.h"

namespace refhost {
namespace {

std::string loaderComplaint() {
  const char* complaint = dlerror();
  return complaint == nullptr ? std::string("the loader gives no reason") : shownText(complaint);
}

}  // namespace

ModuleLoader::~ModuleLoader() { unload(); }

HostPluginEntry ModuleLoader::load(const std::filesystem::path& file, std::string* failure) {
  // With a bare name the loader would search the system's folders, not the current one.
  std::error_code error;
  const std::filesystem::path absolute = std::filesystem::absolute(file, error);
  const std::filesystem::path& place = error ? file : absolute;
  // The loader would wait for data from a FIFO. Of a missing file it says so itself.
  std::error_code unknown;
  const std::filesystem::file_status status = std::filesystem::status(place, unknown);
  if (std::filesystem::exists(status) && !std::filesystem::is_regular_file(status)) {
    *failure = "the module cannot be loaded: " + shownText(place.native()) + ": it is not a regular file";
    return nullptr;
  }
  library_ = dlopen(place.c_str(), RTLD_NOW | RTLD_LOCAL);
  if (library_ == nullptr) {
    *failure = "the module cannot be loaded: " + loaderComplaint();
    return nullptr;
  }
  const auto entry = reinterpret_cast<HostPluginEntry>(dlsym(library_, HOST_PLUGIN_ENTRY_SYMBOL));
  if (entry == nullptr) {
    *failure = "the module has no entry: " + loaderComplaint();
    unload();
  }
  return entry;
}

void ModuleLoader::unload() {
  if (library_ != nullptr) dlclose(library_);
  library_ = nullptr;
}

}  // namespace refhost
