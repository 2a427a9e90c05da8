// A host that only records what it is asked for.
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "hostapi/UtilitySuite.h"
#include "hostapi/WNBasicSuite.h"

namespace testsupport {

using SuiteKey = std::pair<std::string, std::int32_t>;  // name, version

struct ShownMessage {
  std::int32_t pluginId;
  std::string text;
};

// Offers every suite that it is asked for. The Utility Suite 7 shows messages, that is, keeps them; every
// other table is empty and must not be called. One FakeHost at a time: suites are tables without a context.
class FakeHost {
 public:
  FakeHost();
  ~FakeHost();
  FakeHost(const FakeHost&) = delete;
  FakeHost& operator=(const FakeHost&) = delete;

  const WNBasicSuite* basicSuite() const;

  // The table that an acquisition of the suite hands out.
  const void* table(const std::string& name, std::int32_t version);

  // How the host behaves from here on.
  std::map<SuiteKey, HostError> acquireErrors;  // the acquisition returns this code
  std::set<SuiteKey> nullTables;                // the acquisition succeeds with a null table
  bool releaseThrows = false;
  HostError showMessageError = 0;

  // What it was asked for, in order.
  std::vector<SuiteKey> acquisitions;  // the failed ones too
  std::vector<SuiteKey> releases;
  std::vector<ShownMessage> messages;  // those whose showing failed too

  // Acquired with success and not yet released.
  std::multiset<SuiteKey> held;

 private:
  static HostError AcquireSuite(const char* name, std::int32_t version, const void** suite);
  static HostError ReleaseSuiteByName(const char* name, std::int32_t version);
  static HostError ShowMessage(std::int32_t pluginId, const char* text);

  WNBasicSuite basicSuite_{};
  QZGP_UtilitySuite7 utilitySuite_{};
  std::map<SuiteKey, std::unique_ptr<char>> tables_;  // their addresses are all that matters
};

}  // namespace testsupport
