#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <charconv>
#include <cmath>
#include <ctime>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "diag/Collector.h"
#include "export/Format.h"
#include "tests/export/HostileCompositions.h"

namespace interchange {
namespace {

using interchange_test::FilesInMemory;
using interchange_test::HostileComposition;
using testing::ElementsAre;
using testing::HasSubstr;

using Row = std::vector<std::string>;

// Reads comma-separated values strictly, by the grammar of RFC 4180. None where the text breaks it.
std::optional<std::vector<Row>> RowsOf(const std::string& text) {
  std::vector<Row> rows;
  for (std::size_t at = 0; at < text.size();) {
    Row row;
    for (bool more = true; more;) {
      std::string cell;
      if (at < text.size() && text[at] == '"') {
        for (++at;; ++at) {
          if (at >= text.size()) return std::nullopt;
          if (text[at] != '"') {
            cell += text[at];
          } else if (at + 1 < text.size() && text[at + 1] == '"') {
            cell += text[++at];
          } else {
            break;
          }
        }
        ++at;
      } else {
        for (; at < text.size() && text[at] != ',' && text[at] != '\r'; ++at) {
          if (text[at] == '"' || text[at] == '\n') return std::nullopt;
          cell += text[at];
        }
      }
      row.push_back(cell);
      if (at >= text.size()) return std::nullopt;
      more = text[at] == ',';
      if (more) ++at;
    }
    if (text.compare(at, 2, "\r\n") != 0) return std::nullopt;
    at += 2;
    if (!rows.empty() && row.size() != rows.front().size()) return std::nullopt;
    rows.push_back(row);
  }
  return rows;
}

bool IsNumber(const std::string& text) {
  double number = 0.0;
  const auto read = std::from_chars(text.data(), text.data() + text.size(), number);
  return read.ec == std::errc() && read.ptr == text.data() + text.size() && std::isfinite(number);
}

std::vector<Row> Written(const Composition& composition, bool keys = false) {
  FilesInMemory files;
  diag::Collector diagnostics("");
  EXPECT_TRUE(Write(*FindFormat("csv"), composition, {.keys = keys}, files, &diagnostics));
  EXPECT_EQ(diagnostics.count(), 0u);
  EXPECT_TRUE(files.beside().empty());
  const auto rows = RowsOf(files.main());
  EXPECT_TRUE(rows) << files.main();
  return rows.value_or(std::vector<Row>());
}

Composition OneCamera() {
  Composition composition;
  composition.width = 1920;
  composition.height = 1080;
  composition.framesPerSecond = 25;
  composition.firstFrame = 101;
  composition.frames = 2;
  Layer arm;
  arm.name = "arm";
  arm.position[1] = 7.0;
  arm.rotation[2] = 90.0;
  Layer camera;
  camera.name = "cam";
  camera.kind = LayerKind::Camera;
  camera.parent = 0;
  camera.position[0] = Channel(std::vector<double>{1.5, 2.5});
  camera.rotation[0] = 370.0;
  camera.scale[2] = 3.0;
  camera.lens.emplace();
  camera.lens->zoom = 540.0;
  camera.lens->filmWidth = 32.0;
  camera.lens->filmHeight = 18.0;
  composition.layers = {arm, camera};
  return composition;
}

TEST(CsvWriter, ARowForEachFrameOfEachLayer) {
  const std::vector<Row> rows = Written(OneCamera());
  ASSERT_EQ(rows.size(), 5u);
  EXPECT_THAT(rows[0], ElementsAre("layer", "frame", "seconds", "tx", "ty", "tz", "rx", "ry", "rz", "sx",
                                   "sy", "sz", "wx", "wy", "wz", "zoom", "focal", "fov", "number", "parent"));
  EXPECT_THAT(rows[1], ElementsAre("arm", "101", "4.04", "0", "7", "0", "0", "0", "90", "1", "1", "1", "0",
                                   "7", "0", "", "", "", "1", ""));
  EXPECT_EQ(rows[2][0], "cam");
  EXPECT_EQ(rows[3][0], "arm");
  EXPECT_THAT(rows[4], ElementsAre("cam", "102", "4.08", "2.5", "0", "0", "370", "0", "0", "1", "1", "3", "0",
                                   "9.5", "0", "540", "9", "90", "2", "1"));
}

TEST(CsvWriter, AnAimedCameraHasItsResultingAngles) {
  Composition composition = OneCamera();
  Layer& camera = composition.layers[1];
  camera.position[0] = camera.rotation[0] = 0.0;
  camera.aimed = true;
  camera.interest[0] = -1.0;
  const std::vector<Row> rows = Written(composition);
  EXPECT_THAT((Row(rows[2].begin() + 6, rows[2].begin() + 9)), ElementsAre("0", "90", "0"));
}

TEST(CsvWriter, ACameraThatIsAimedAtAPointAlmostAtItsOwnPlaceHasItsAngles) {
  for (const double way : {5e-324, 1e-320, 1e-310}) {
    Composition composition = OneCamera();
    Layer& camera = composition.layers[1];
    camera.position[0] = camera.rotation[0] = 0.0;
    camera.aimed = true;
    camera.interest[0] = -4.0 * way;
    const std::vector<Row> rows = Written(composition);
    EXPECT_THAT((Row(rows[2].begin() + 6, rows[2].begin() + 9)), ElementsAre("0", "90", "0")) << way;
  }
}

TEST(CsvWriter, ARowForEachKeyOfEachStream) {
  Composition composition = OneCamera();
  const auto at = [](std::vector<double> frames) {
    return std::make_shared<const std::vector<double>>(std::move(frames));
  };
  const auto moving = [](double first, double second) { return Channel(std::vector{first, second}); };
  composition.layers[1].keys = {{"position", 3, at({101, 103.5}), {moving(1, 4), 5, moving(3, 6)}},
                                {"zoom", 1, at({102}), {540}}};
  const std::vector<Row> rows = Written(composition, true);
  ASSERT_EQ(rows.size(), 4u);
  EXPECT_THAT(rows[0], ElementsAre("layer", "stream", "frame", "seconds", "x", "y", "z", "number"));
  EXPECT_THAT(rows[2], ElementsAre("cam", "position", "103.5", "4.14", "4", "5", "6", "2"));
  EXPECT_THAT(rows[3], ElementsAre("cam", "zoom", "102", "4.08", "540", "", "", "2"));
}

TEST(CsvWriter, NamesAreNoFormulas) {
  for (const std::string name : {"=1", "+1", "-1", "@x", "  =1",
                                 "\xef\xbc\x9d"
                                 "1",
                                 "\xef\xbc\x8b"
                                 "1",
                                 "\xef\xbc\x8d"
                                 "1",
                                 " \xef\xbc\xa0x"}) {
    Composition composition = OneCamera();
    composition.layers[0].name = name;
    EXPECT_EQ(Written(composition)[1][0], '\'' + name);
  }
}

TEST(CsvWriter, NamesAreNoFormulasAfterSpacesOfAnyKind) {
  for (const std::string space : {"\xc2\xa0", "\xe1\x9a\x80", "\xe2\x80\x80", "\xe2\x80\x8a", "\xe2\x80\xaf",
                                  "\xe2\x81\x9f", "\xe3\x80\x80", " \xc2\xa0 \xe3\x80\x80"}) {
    Composition composition = OneCamera();
    composition.layers[0].name = space + "=1";
    composition.layers[1].name = space + "x";
    const std::vector<Row> rows = Written(composition);
    EXPECT_EQ(rows[1][0], '\'' + space + "=1");
    EXPECT_EQ(rows[2][0], space + "x");
  }
  // Spaces that end a line or show no width never reach the file as they are.
  for (const auto& [space, shown] : {std::pair("\t", "\\t"),
                                     {"\r", "\\r"},
                                     {"\xc2\x85", "\\u0085"},
                                     {"\xe2\x80\x8b", "\\u200b"},
                                     {"\xe2\x80\xa8", "\\u2028"},
                                     {"\xef\xbb\xbf", "\\ufeff"}}) {
    Composition composition = OneCamera();
    composition.layers[0].name = space + std::string("=1");
    EXPECT_EQ(Written(composition)[1][0], shown + std::string("=1"));
  }
}

TEST(CsvWriter, NamesAreQuotedAndWithoutControls) {
  Composition composition = OneCamera();
  composition.layers[0].name = "a \"b\", c";
  composition.layers[1].name = "two\nlines\xff\t";
  const std::vector<Row> rows = Written(composition);
  EXPECT_EQ(rows[1][0], "a \"b\", c");
  EXPECT_EQ(rows[2][0], "two\\nlines\\xff\\t");
}

TEST(CsvWriter, ASemicolonStandsInQuotes) {
  Composition composition = OneCamera();
  composition.layers[0].name = "a;=1";
  FilesInMemory files;
  diag::Collector diagnostics("");
  EXPECT_TRUE(Write(*FindFormat("csv"), composition, {}, files, &diagnostics));
  EXPECT_THAT(files.main(), HasSubstr("\n\"a;=1\",101,"));
}

TEST(CsvWriter, WholeNumbersHaveNoExponent) {
  Composition composition = OneCamera();
  composition.firstFrame = 100000;
  composition.layers[0].position[1] = -9007199254740991.0;
  composition.layers[0].position[2] = 1e300;
  const std::vector<Row> rows = Written(composition);
  EXPECT_THAT((Row(rows[1].begin() + 1, rows[1].begin() + 6)),
              ElementsAre("100000", "4000", "0", "-9007199254740991", "1e+300"));
}

TEST(CsvWriter, WhatItHasNoPlaceForIsNamed) {
  Composition composition = OneCamera();
  composition.pixelAspect = 2.0;
  composition.layers[1].lens->filmOffsetY = 0.1;
  composition.layers[1].lens->squeeze = 1.5;
  for (const bool keys : {false, true}) {
    FilesInMemory files;
    diag::Collector diagnostics("");
    EXPECT_TRUE(Write(*FindFormat("csv"), composition, {.keys = keys}, files, &diagnostics));
    EXPECT_EQ(diagnostics.CountOf(diag::Code::ExportPartLost), 3u);
  }
}

TEST(CsvWriter, DeepParentsTakeNoLongerThanFlatOnes) {
  Composition composition;
  constexpr std::size_t kDepth = 20'000;
  for (std::size_t i = 0; i < kDepth; ++i) {
    Layer layer;
    layer.name = "link";
    layer.position[0] = 1.0;
    if (i + 1 < kDepth) layer.parent = i + 1;
    composition.layers.push_back(layer);
  }
  FilesInMemory files;
  diag::Collector diagnostics("");
  const std::clock_t begin = std::clock();
  EXPECT_TRUE(Write(*FindFormat("csv"), composition, {}, files, &diagnostics));
  // Worked out link by link for each of them it takes half a minute.
  EXPECT_LT(std::clock() - begin, 3 * CLOCKS_PER_SEC);
  EXPECT_THAT(files.main(), HasSubstr("\nlink,1,0.041666666666666664,1,0,0,0,0,0,1,1,1," +
                                      std::to_string(kDepth) + ",0,0,"));
}

TEST(CsvWriter, HostileCompositionsGiveATableOrAnError) {
  std::size_t written = 0, refused = 0;
  for (std::uint64_t seed = 0; seed < interchange_test::kHostileCompositions; ++seed) {
    SCOPED_TRACE(seed);
    const Composition composition = HostileComposition(seed);
    FilesInMemory files;
    diag::Collector diagnostics("");
    if (!Write(*FindFormat("csv"), composition, {}, files, &diagnostics)) {
      ASSERT_GT(diagnostics.CountOf(diag::Severity::Error), 0u);
      ++refused;
      continue;
    }
    ++written;
    const auto rows = RowsOf(files.main());
    ASSERT_TRUE(rows);
    ASSERT_EQ(rows->size(), 1 + composition.layers.size() * composition.frames);
    for (std::size_t i = 1; i < rows->size(); ++i) {
      const Row& row = (*rows)[i];
      const std::size_t first = row[0].find_first_not_of(' ');
      ASSERT_TRUE(first == std::string::npos ||
                  std::string("=+-@\t\r").find(row[0][first]) == std::string::npos);
      for (std::size_t cell = 1; cell < row.size(); ++cell) {
        const bool mayBeEmpty = cell >= 15 && cell != 18;
        ASSERT_TRUE(IsNumber(row[cell]) || (mayBeEmpty && row[cell].empty())) << row[cell];
      }
    }
  }
  EXPECT_GT(written, interchange_test::kHostileCompositions / 2);
  EXPECT_GT(refused, interchange_test::kHostileCompositions / 50);
}

}  // namespace
}  // namespace interchange
