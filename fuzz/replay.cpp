// The main program of a target without the fuzzer's library: runs the target on files, and on all files of
// folders.
//
//   fuzz-TARGET [--changes N] FILE-OR-FOLDER ...
//
// With --changes each file is also run N times as the scene mutator changes it. Ends with 0 when all of it
// ran, with 2 when there was nothing to run; a broken promise ends the process.
#include <algorithm>
#include <charconv>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>
#include <vector>

#include "fuzz/SceneMutator.h"
#include "fuzz/Target.h"

namespace {

namespace fs = std::filesystem;

constexpr int kNothingToRun = 2;
constexpr std::size_t kLongestChange = 16384;

// The file, or the files of a folder and of those below, in the order of their names.
std::vector<fs::path> FilesAt(const fs::path& place) {
  if (!fs::is_directory(place)) return {place};
  std::vector<fs::path> files;
  for (const fs::directory_entry& entry : fs::recursive_directory_iterator(place)) {
    if (entry.is_regular_file()) files.push_back(entry.path());
  }
  std::sort(files.begin(), files.end());
  return files;
}

// Runs a copy in memory of exactly its size, so that a sanitizer sees every byte too far.
void Run(const std::string& bytes) {
  const std::vector<std::uint8_t> input(bytes.begin(), bytes.end());
  LLVMFuzzerTestOneInput(input.data(), input.size());
}

// The most changes on top of one another. Then it begins with the original again, before nothing of the scene
// is left.
constexpr int kChangesInARow = 10;

void RunChanged(const std::string& original, int changes) {
  fuzz::Dice dice(original.size() + 1);
  std::string scene;
  for (int i = 0; i < changes; ++i) {
    scene = fuzz::MutateScene(i % kChangesInARow == 0 ? original : scene, dice);
    if (scene.size() > kLongestChange) scene.resize(kLongestChange);
    Run(scene);
  }
}

}  // namespace

int main(int count, char** arguments) {
  int changes = 0;
  int files = 0;
  for (int i = 1; i < count; ++i) {
    if (std::string_view(arguments[i]) == "--changes" && i + 1 < count) {
      const std::string_view number = arguments[++i];
      std::from_chars(number.data(), number.data() + number.size(), changes);
      continue;
    }
    for (const fs::path& path : FilesAt(arguments[i])) {
      std::printf("%s\n", path.c_str());
      std::fflush(stdout);
      std::ifstream in(path, std::ios::binary);
      const std::string bytes{std::istreambuf_iterator<char>(in), {}};
      if (!in) {
        std::fprintf(stderr, "%s cannot be read\n", path.c_str());
        return 1;
      }
      Run(bytes);
      RunChanged(bytes, changes);
      ++files;
    }
  }
  std::printf("%d files ran\n", files);
  return files > 0 ? 0 : kNothingToRun;
}
