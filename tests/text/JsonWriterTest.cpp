#include "text/JsonWriter.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <cstring>
#include <limits>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string>
#include <vector>

namespace text {
namespace {

std::string numberAsJson(double value) {
  std::ostringstream out;
  JsonWriter(out).number(value);
  return out.str();
}

std::string textAsJson(std::string_view text) {
  std::ostringstream out;
  JsonWriter(out).text(text);
  return out.str();
}

std::uint64_t bitsOf(double value) {
  std::uint64_t bits = 0;
  std::memcpy(&bits, &value, sizeof bits);
  return bits;
}

TEST(JsonWriter, ObjectsAreSpreadOverLinesAndRowsAreNot) {
  std::ostringstream out;
  JsonWriter json(out);
  json.beginObject();
  json.key("a");
  json.integer(1);
  json.key("rows");
  json.beginArray();
  for (int i = 0; i < 2; ++i) {
    json.beginRow();
    json.integer(i);
    json.beginArray();
    json.boolean(true);
    json.null();
    json.endArray();
    json.endArray();
  }
  json.endArray();
  json.key("none");
  json.beginArray();
  json.endArray();
  json.endObject();
  EXPECT_EQ(
      out.str(),
      "{\n \"a\": 1,\n \"rows\": [\n  [0, [true, null]],\n  [1, [true, null]]\n ],\n \"none\": []\n}\n");
}

// A document that is put into another one looks as if it had been written there.
TEST(JsonWriter, AWrittenValueIsMovedInToItsLevel) {
  const auto value = [](JsonWriter& json) {
    json.beginObject();
    json.key("a\nb");
    json.beginArray();
    json.text("c\nd");
    json.beginRow();
    json.integer(1);
    json.endArray();
    json.endArray();
    json.endObject();
  };
  std::ostringstream alone, direct, moved;
  JsonWriter first(alone);
  value(first);
  JsonWriter second(direct), third(moved);
  for (JsonWriter* json : {&second, &third}) {
    json->beginObject();
    json->key("values");
    json->beginArray();
  }
  for (int i = 0; i < 2; ++i) {
    value(second);
    third.written(alone.str());
  }
  for (JsonWriter* json : {&second, &third}) {
    json->endArray();
    json->endObject();
  }
  EXPECT_EQ(moved.str(), direct.str());
  EXPECT_EQ(nlohmann::json::parse(moved.str())["values"].size(), 2u);
}

TEST(JsonWriter, DoublesAreShortAndGiveTheSameBitsBack) {
  const std::vector<double> values = {0.1,      1.0 / 3.0, 1e22,  5e-324, 1.7976931348623157e308,
                                      636.3812, -2.5e7,    100.0, -0.0,   0.0};
  for (const double value : values) {
    EXPECT_EQ(bitsOf(nlohmann::json::parse(numberAsJson(value)).get<double>()), bitsOf(value)) << value;
  }
  EXPECT_EQ(numberAsJson(0.1), "0.1");
  EXPECT_EQ(numberAsJson(100.0), "100");
  EXPECT_EQ(numberAsJson(-0.0), "-0.0");
}

TEST(JsonWriter, WhatJsonHasNoNumberForIsAText) {
  EXPECT_EQ(numberAsJson(std::numeric_limits<double>::infinity()), "\"inf\"");
  EXPECT_EQ(numberAsJson(-std::numeric_limits<double>::infinity()), "\"-inf\"");
  EXPECT_EQ(numberAsJson(std::nan("")), "\"nan\"");
}

TEST(JsonWriter, TextIsAsciiAndReadsBackAsUtf8) {
  EXPECT_EQ(textAsJson("a\"b\\c\n\x1b\x7f\xc2\x9b<b>"), "\"a\\\"b\\\\c\\n\\u001b\\u007f\\u009b<b>\"");
  EXPECT_EQ(nlohmann::json::parse(textAsJson("caf\xc3\xa9 \xf0\x9f\x8e\xa5")).get<std::string>(),
            "caf\xc3\xa9 \xf0\x9f\x8e\xa5");
}

TEST(JsonWriter, EachByteThatIsNoUtf8IsReplaced) {
  EXPECT_EQ(textAsJson("a\xff\xfe"), "\"a\\ufffd\\ufffd\"");
  EXPECT_EQ(textAsJson("\xc0\xafz"), "\"\\ufffd\\ufffdz\"");            // a longer form than needed
  EXPECT_EQ(textAsJson("\xed\xa0\xbd"), "\"\\ufffd\\ufffd\\ufffd\"");   // a surrogate
  EXPECT_EQ(textAsJson("\xe6\x98\"\\"), "\"\\ufffd\\ufffd\\\"\\\\\"");  // cut short before a quote
}

TEST(JsonWriter, NoPairOfBytesLeavesItsQuotes) {
  for (int pair = 0; pair < 0x10000; ++pair) {
    const std::string bytes = {static_cast<char>(pair >> 8), static_cast<char>(pair & 0xff)};
    const std::string written = textAsJson(bytes);
    // Another text of one or two characters, and nothing after it.
    ASSERT_TRUE(nlohmann::json::accept(written)) << pair;
    ASSERT_TRUE(nlohmann::json::parse(written).is_string()) << pair;
    for (const char letter : written) ASSERT_TRUE(letter >= ' ' && letter < '\x7f') << pair;
  }
}

}  // namespace
}  // namespace text
