#include "fuzz/ReaderHost.h"

#include <cstdint>
#include <cstring>

#include "fuzz/Require.h"
#include "hostapi/ErrorCodes.h"
#include "hostapi/UtilitySuite.h"
#include "hostutil/HostSetup.h"
#include "plugin/Globals.h"
#include "plugin/Messages.h"

using namespace mayaimport;

namespace fuzz {
namespace {

constexpr std::int32_t kPluginId = 4711;

// Suites are tables without a context.
int messageCount = 0;
int heldSuites = 0;

HostError ShowMessage(std::int32_t pluginId, const char* text) {
  Require(pluginId == kPluginId, "a message is shown under the plug-in's own id");
  Require(std::strlen(text) > 0, "a message has words");
  ++messageCount;
  return HOST_ERR_NONE;
}

constexpr QZGP_UtilitySuite7 kUtilitySuite = [] {
  QZGP_UtilitySuite7 suite{};
  suite.ShowMessage = ShowMessage;
  return suite;
}();

HostError AcquireSuite(const char* name, std::int32_t version, const void** suite) {
  const bool known = std::strcmp(name, QZGP_UTILITY_SUITE) == 0 && version == QZGP_UTILITY_SUITE_7;
  Require(known, "the reader uses no suite but the one that shows messages");
  *suite = &kUtilitySuite;
  ++heldSuites;
  return HOST_ERR_NONE;
}

HostError ReleaseSuiteByName(const char*, std::int32_t) {
  --heldSuites;
  return HOST_ERR_NONE;
}

constexpr WNBasicSuite kBasicSuite = {AcquireSuite, ReleaseSuiteByName};

}  // namespace

ReaderHost::ReaderHost() {
  static const HostError registered = RegisterMessages();
  Require(registered == HOST_ERR_NONE, "the reader's messages can be registered");
  G_plugin_idL = kPluginId;
  messageCount = 0;
}

ReaderHost::~ReaderHost() {
  Require(heldSuites == 0, "every suite is released");
  HostVisitLedger([](void*, std::int32_t, const char*,
                     std::int32_t) { Require(false, "every list and file is given back"); },
                  nullptr);
}

const WNBasicSuite* ReaderHost::basicSuite() const { return &kBasicSuite; }

int ReaderHost::messages() const { return messageCount; }

}  // namespace fuzz
