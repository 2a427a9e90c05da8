// A file of the played host.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include "tests/secondreader/PlayedHost.h"

namespace secondreader {

class PlayedFile {
 public:
  // The bytes outlive the file.
  PlayedFile(PlayedHost& host, std::string_view bytes) : host_(&host), bytes_(bytes) {}

  // Each counts as a call of its service, and gives that call's code or throws what it threw. The buffer can
  // be null.
  HostError open();
  HostError read(std::size_t count, std::string* buffer);
  HostError close();
  HostError size(std::size_t* size);
  HostError dispose();

  // Opens the file, reads on from its start and closes it in every case.
  HostError readFromStart(std::size_t count, std::string* buffer);

 private:
  PlayedHost* host_;
  std::string_view bytes_;
  bool open_ = false;
  std::size_t place_ = 0;
};

}  // namespace secondreader
