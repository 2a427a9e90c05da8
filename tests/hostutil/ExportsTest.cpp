// The library shows the functions of its headers, and no other symbol.
#include <gtest/gtest.h>
#include <stdio.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <set>
#include <sstream>
#include <string>

namespace {

// What follows HOSTUTIL_API up to its "(" ends with the function's name.
std::set<std::string> DeclaredFunctions() {
  std::set<std::string> names;
  const std::filesystem::path folder = std::filesystem::path(MAYASCENE_SOURCE_DIR) / "hostutil";
  const std::string marker = "HOSTUTIL_API ";
  for (const auto& entry : std::filesystem::directory_iterator(folder)) {
    if (entry.path().extension() != ".h" || entry.path().filename() == "Export.h") continue;
    std::ifstream stream(entry.path());
    const std::string text((std::istreambuf_iterator<char>(stream)), std::istreambuf_iterator<char>());
    for (std::size_t at = text.find(marker); at != std::string::npos; at = text.find(marker, at + 1)) {
      const std::size_t open = text.find('(', at);
      const std::size_t before = text.find_last_of(" *\n", open);
      names.insert(text.substr(before + 1, open - before - 1));
    }
  }
  return names;
}

std::set<std::string> ExportedSymbols() {
  const std::string command = std::string(NM_PROGRAM) + " -D --defined-only '" + HOSTUTIL_LIBRARY + "'";
  const std::unique_ptr<FILE, int (*)(FILE*)> pipe(popen(command.c_str(), "r"), pclose);
  EXPECT_NE(pipe, nullptr);
  std::set<std::string> names;
  char line[4096];
  while (pipe && fgets(line, sizeof line, pipe.get()) != nullptr) {
    std::istringstream words(line);
    std::string address, type, name;
    words >> address >> type >> name;
    names.insert(name);
  }
  return names;
}

TEST(ExportsTest, TheLibraryShowsTheFunctionsOfItsHeadersAndNothingElse) {
  const std::set<std::string> declared = DeclaredFunctions();
  ASSERT_TRUE(declared.count("RecordListAppend") == 1 && declared.count("HostVisitLedger") == 1);
  EXPECT_EQ(ExportedSymbols(), declared);
}

}  // namespace
