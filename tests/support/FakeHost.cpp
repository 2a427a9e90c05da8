#include "tests/support/FakeHost.h"

#include <cstdlib>
#include <stdexcept>

namespace testsupport {
namespace {

FakeHost* theHost = nullptr;

}  // namespace

FakeHost::FakeHost() {
  if (theHost != nullptr) std::abort();
  theHost = this;
  basicSuite_.AcquireSuite = &FakeHost::AcquireSuite;
  basicSuite_.ReleaseSuiteByName = &FakeHost::ReleaseSuiteByName;
  utilitySuite_.ShowMessage = &FakeHost::ShowMessage;
}

FakeHost::~FakeHost() { theHost = nullptr; }

const WNBasicSuite* FakeHost::basicSuite() const { return &basicSuite_; }

const void* FakeHost::table(const std::string& name, std::int32_t version) {
  if (name == QZGP_UTILITY_SUITE && version == QZGP_UTILITY_SUITE_7) return &utilitySuite_;
  std::unique_ptr<char>& table = tables_[{name, version}];
  if (table == nullptr) table = std::make_unique<char>();
  return table.get();
}

HostError FakeHost::AcquireSuite(const char* name, std::int32_t version, const void** suite) {
  const SuiteKey key{name, version};
  theHost->acquisitions.push_back(key);
  const auto error = theHost->acquireErrors.find(key);
  if (error != theHost->acquireErrors.end()) return error->second;
  theHost->held.insert(key);
  *suite = theHost->nullTables.count(key) != 0 ? nullptr : theHost->table(name, version);
  return 0;
}

HostError FakeHost::ReleaseSuiteByName(const char* name, std::int32_t version) {
  theHost->releases.emplace_back(name, version);
  if (theHost->releaseThrows) throw std::runtime_error("release");
  const auto held = theHost->held.find({name, version});
  if (held != theHost->held.end()) theHost->held.erase(held);
  return 0;
}

HostError FakeHost::ShowMessage(std::int32_t pluginId, const char* text) {
  theHost->messages.push_back({pluginId, text});
  return theHost->showMessageError;
}

}  // namespace testsupport
