// A callback in a process of its own, which may end it.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "refhost/Host.h"

namespace testsupport {

struct EndedCallback {
  int signal = 0;                  // that ended the process; 0: the callback returned
  HostError code = 0;              // that it returned
  std::vector<std::string> trace;  // its suite calls; each is written down before the next thing happens
};

EndedCallback CallInAProcess(refhost::Callback callback, const std::filesystem::path& scene,
                             refhost::HostOptions options);

}  // namespace testsupport
