// Runs the reader over a text, with a host that keeps its messages, and gives the resulting scene.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "maya/MAYA_Parse.h"
#include "tests/support/FakeHost.h"
#include "tests/support/GuardedMemory.h"
#include "tests/support/Ledger.h"

using namespace mayaimport;

namespace testsupport {

inline constexpr std::int32_t kTestPluginId = 4711;
inline constexpr const char* kReadingText = "Error reading Maya file.";
inline constexpr const char* kUnexpectedEndText = "Unexpected end of maya file.";

using Keys = std::vector<std::pair<double, double>>;  // time, value

// The numbers of a scene are read, not computed: tests compare them bit for bit.
class ReaderTest : public ::testing::Test {
 protected:
  ReaderTest();

  // Nothing may be left behind: no list, no suite.
  ~ReaderTest() override;

  // Reads the text with a new parser, which stays until the next one. The text lies before a page that may
  // not be touched. Returns the code that came out.
  HostError Read(std::string_view text);

  // Ends the parser; what it held is gone.
  void EndScene();

  MAYA_Parse& scene() { return *scene_; }
  std::vector<std::string> Messages() const;

  std::int64_t TransformCount() { return Count(scene().transforms); }
  std::int64_t CameraCount() { return Count(scene().cameras); }
  std::int64_t CurveCount() { return Count(scene().curves); }
  std::int64_t LocatorCount() { return Count(scene().locators); }

  // Records by index; a record that is not there fails the test and gives one of zeros.
  MAYA_Transform TransformAt(std::int64_t index) { return At<MAYA_Transform>(scene().transforms, index); }
  MAYA_Camera CameraAt(std::int64_t index) { return At<MAYA_Camera>(scene().cameras, index); }
  MAYA_AnimCurve CurveAt(std::int64_t index) { return At<MAYA_AnimCurve>(scene().curves, index); }
  MAYA_Locator LocatorAt(std::int64_t index) { return At<MAYA_Locator>(scene().locators, index); }

  static Keys KeysIn(const RecordList* list);
  Keys KeysOf(std::int64_t curve) { return KeysIn(CurveAt(curve).keys); }

  bool CurrentIsZero();

  // A null list counts 0.
  static std::int64_t Count(const RecordList* list);

  FakeHost host_;

 private:
  template <typename Record>
  static Record At(const RecordList* list, std::int64_t index) {
    const void* const record = list != nullptr ? RecordListPeek(list, index) : nullptr;
    EXPECT_NE(record, nullptr) << "no record " << index;
    return record != nullptr ? *static_cast<const Record*>(record) : Record{};
  }

  std::optional<GuardedText> text_;
  std::unique_ptr<MAYA_Parse> scene_;
};

template <typename T, std::size_t Count>
std::vector<T> Values(const T (&values)[Count]) {
  return std::vector<T>(values, values + Count);
}

// The word as it is, in lower case, in upper case, and with every second letter turned.
std::vector<std::string> CaseChanges(std::string_view word);

}  // namespace testsupport
