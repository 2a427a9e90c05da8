// When in a callback the host's utility services are called, derived from a run in which nothing fails.
#pragma once

#include <cstddef>
#include <filesystem>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "refhost/Host.h"

namespace testsupport {

// The utility services that can be made to fail.
const std::vector<std::string>& ServiceNames();

// By service, for each call of it: how many suite calls the callback had made by then.
using ServicePlaces = std::map<std::string, std::vector<std::size_t>, std::less<>>;
ServicePlaces PlacesOfServices(refhost::Callback callback, const std::filesystem::path& scene,
                               refhost::HostOptions options = {});

}  // namespace testsupport
