// The built module: what it exports and what it needs.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <stdio.h>

#include <sstream>
#include <string>
#include <vector>

namespace testsupport {
namespace {

std::vector<std::string> OutputOf(const std::string& command) {
  FILE* const pipe = popen(command.c_str(), "r");
  EXPECT_NE(pipe, nullptr);
  std::string text;
  char buffer[4096];
  for (std::size_t count; (count = fread(buffer, 1, sizeof(buffer), pipe)) > 0;) text.append(buffer, count);
  EXPECT_EQ(pclose(pipe), 0) << command;
  std::vector<std::string> lines;
  std::istringstream stream(text);
  for (std::string line; std::getline(stream, line);) lines.push_back(line);
  return lines;
}

std::vector<std::string> WordsOf(const std::string& line) {
  std::istringstream stream(line);
  std::vector<std::string> words;
  for (std::string word; stream >> word;) words.push_back(word);
  return words;
}

TEST(ModuleTest, ExportsTheEntryAndNothingElse) {
  std::vector<std::string> names;
  for (const std::string& line : OutputOf("nm -D --defined-only '" MAYASCENE_MODULE "'"))
    names.push_back(WordsOf(line).back());
  EXPECT_THAT(names, ::testing::ElementsAre("GPMain_MayaImport"));
}

// A sanitizer's own libraries come with the build that asks for them.
bool IsStandardOrSanitizer(const std::string& library) {
  for (const char* const name : {"libstdc++.so", "libc++.so", "libc++abi.so", "libgcc_s.so", "libc.so",
                                 "libm.so", "ld-linux", "libasan.so", "libubsan.so", "libgcov"})
    if (library.find(name) != std::string::npos) return true;
  return false;
}

TEST(ModuleTest, NeedsTheUtilityLibraryAndTheStandardOnesAlone) {
  int utilityLibraries = 0;
  for (const std::string& line : OutputOf("readelf -d '" MAYASCENE_MODULE "'")) {
    if (line.find("(NEEDED)") == std::string::npos) continue;
    const std::size_t from = line.find('[') + 1;
    const std::string library = line.substr(from, line.find(']') - from);
    if (library == "libhostutil.so")
      ++utilityLibraries;
    else
      EXPECT_TRUE(IsStandardOrSanitizer(library)) << library;
  }
  EXPECT_EQ(utilityLibraries, 1);
}

TEST(ModuleTest, FindsTheUtilityLibraryFromWhereItLies) {
  bool relative = false;
  for (const std::string& line : OutputOf("readelf -d '" MAYASCENE_MODULE "'"))
    relative = relative || line.find("$ORIGIN") != std::string::npos;
  EXPECT_TRUE(relative);
}

}  // namespace
}  // namespace testsupport
