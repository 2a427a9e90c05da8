// The basic suite: acquiring and releasing the others.
#include <string>

#include "refhost/Call.h"
#include "refhost/ShownText.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

std::string shown(const char* name, std::int32_t version) {
  return '"' + shownText(name) + "\" in version " + std::to_string(version);
}

void acquireSuite(Call& call, const char* name, std::int32_t version, const void** suite) {
  if (!call.given(name, "the name") || !call.given(suite, "the place for the suite")) return;
  OfferedSuite* offered = call.host().suites.find(name, version);
  if (offered == nullptr) {
    call.refuse(HOST_ERR_SUITE_REFUSED, "there is no suite " + shown(name, version));
  } else if (call.host().rehearsal.refuses(name, version)) {
    call.fail(HOST_ERR_SUITE_REFUSED);
  } else {
    ++offered->held;
    *suite = offered->table;
  }
}

HostError AcquireSuite(const char* name, std::int32_t version, const void** suite) {
  Call call(Operation::AcquireSuite);
  if (call.goesOn(suite)) acquireSuite(call, name, version, suite);
  HostState& host = call.host();
  const OfferedSuite* offered = name == nullptr ? nullptr : host.suites.find(name, version);
  if (offered != nullptr && offered->table == &kStreamSuite8 && !call.didItsWork()) {
    host.streamsWithoutValueSuite = host.streams.handedOut();
  }
  call.traced(name, version);
  return call.finish();
}

void releaseSuite(Call& call, const char* name, std::int32_t version) {
  if (!call.given(name, "the name")) return;
  OfferedSuite* offered = call.host().suites.find(name, version);
  if (offered == nullptr || offered->held == 0) {
    call.refuse(HOST_ERR_SUITE_NOT_HELD, "the suite " + shown(name, version) + " is not held");
  } else {
    --offered->held;
  }
}

HostError ReleaseSuiteByName(const char* name, std::int32_t version) {
  Call call(Operation::ReleaseSuiteByName);
  if (call.goesOn()) {
    releaseSuite(call, name, version);
  } else if (OfferedSuite* offered = name == nullptr ? nullptr : call.host().suites.find(name, version)) {
    ++offered->failedReleases;
  }
  call.traced(name, version);
  return call.finish();
}

}  // namespace

constinit const WNBasicSuite kBasicSuite = {AcquireSuite, ReleaseSuiteByName};

}  // namespace refhost
