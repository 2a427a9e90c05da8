// What the tests of the utility services share.
#pragma once

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "hostutil/HostUtilities.h"

namespace hostutil_tests {

// One line of the ledger.
struct LedgerLine {
  std::int32_t kind;
  std::string description;
  std::int32_t releaseFailed;
};

inline std::vector<LedgerLine> Ledger() {
  std::vector<LedgerLine> lines;
  HostVisitLedger(
      [](void* context, std::int32_t kind, const char* description, std::int32_t releaseFailed) {
        static_cast<std::vector<LedgerLine>*>(context)->push_back({kind, description, releaseFailed});
      },
      &lines);
  return lines;
}

// A test that leaves a file or a list behind fails without asking; rehearsals and translations end with it.
class UtilityTest : public testing::Test {
 protected:
  void TearDown() override {
    HostEndRehearsal();
    HostClearUtilityFailures();
    HostClearTranslations();
    HostSetReporter(nullptr, nullptr);
    for (const LedgerLine& line : Ledger()) ADD_FAILURE() << "left behind: " << line.description;
    HostReleaseLeftovers();
  }
};

inline UTF16String* MakeText(const std::string& bytes) {
  UTF16String* text = nullptr;
  EXPECT_EQ(UTF16StringMakeFromBytes(bytes.c_str(), &text), HOST_ERR_NONE);
  return text;
}

inline std::vector<HostUTF16Unit> UnitsOf(const UTF16String* text) {
  const HostUTF16Unit* units = UTF16StringUnits(text);
  return {units, units + UTF16StringLength(text)};
}

// The text as a user is shown it.
inline std::string Shown(const UTF16String* text) {
  const std::int64_t length = HostUnitsToShownText(UTF16StringUnits(text), nullptr, 0);
  std::string shown(static_cast<std::size_t>(length) + 1, '?');
  HostUnitsToShownText(UTF16StringUnits(text), shown.data(), length + 1);
  shown.pop_back();
  return shown;
}

inline std::string ShownAndReleased(UTF16String* text) {
  const std::string shown = Shown(text);
  UTF16StringRelease(text);
  return shown;
}

inline HostFile* MakeFile(const std::string& path) {
  UTF16String* text = MakeText(path);
  HostFile* file = nullptr;
  EXPECT_EQ(HostFileCreate(text, &file), HOST_ERR_NONE);
  UTF16StringRelease(text);
  return file;
}

// Runs the call with the failure rehearsed and everything else as it was.
template <typename Call>
void WithFailure(const HostUtilityFailure& failure, Call call) {
  HostClearUtilityFailures();
  ASSERT_EQ(HostAddUtilityFailure(&failure), HOST_ERR_NONE);
  HostBeginRehearsal();
  call();
  HostEndRehearsal();
  HostClearUtilityFailures();
}

}  // namespace hostutil_tests
