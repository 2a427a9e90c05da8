#include "tests/support/ServicePlaces.h"

#include <cstdint>
#include <ostream>
#include <streambuf>
#include <utility>

#include "hostutil/HostSetup.h"
#include "tests/support/BuilderRun.h"

namespace testsupport {
namespace {

// Takes a trace, which comes line by line, and looks after each line how often every service was called.
class WatchingBuffer : public std::streambuf {
 public:
  ServicePlaces Take() { return std::move(places_); }

 protected:
  std::streamsize xsputn(const char* text, std::streamsize size) override {
    const std::string_view line(text, static_cast<std::size_t>(size));
    if (line.starts_with("{\"call\":\"enter\"")) {
      places_.clear();
      suiteCalls_ = 0;
    } else {
      Look();
      ++suiteCalls_;
    }
    return size;
  }

 private:
  void Look() {
    std::int32_t service = 0;
    for (const std::string& name : ServiceNames()) {
      const auto count = static_cast<std::size_t>(HostUtilityCallCount(service++));
      if (count != 0) places_[name].resize(count, suiteCalls_);
    }
  }

  ServicePlaces places_;
  std::size_t suiteCalls_ = 0;
};

}  // namespace

const std::vector<std::string>& ServiceNames() {
  static const std::vector<std::string> names = {
#define SERVICE_NAME(name) #name,
      HOST_UTILITY_TABLE(SERVICE_NAME)
#undef SERVICE_NAME
  };
  return names;
}

ServicePlaces PlacesOfServices(refhost::Callback callback, const std::filesystem::path& scene,
                               refhost::HostOptions options) {
  WatchingBuffer buffer;
  std::ostream trace(&buffer);
  options.trace = &trace;
  options.during = callback;
  refhost::Host host(std::move(options));
  MakeCallback(host, callback, scene);
  return buffer.Take();
}

}  // namespace testsupport
