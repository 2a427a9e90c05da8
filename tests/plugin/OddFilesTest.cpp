// What can stand where a scene is expected: no file, too little or too much of one, one that changes.
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <ostream>
#include <sstream>
#include <streambuf>
#include <string>

#include "plugin/Entry.h"
#include "tests/plugin/PluginRun.h"
#include "tests/support/LeftOut.h"
#include "tests/support/WideTests.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::IsEmpty;

class OddFilesTest : public PluginTest {
 protected:
  void ExpectRefused(const std::filesystem::path& path, HostError code) {
    for (const bool verify : {false, true}) {
      const refhost::CallbackResult result = verify ? Verify(path) : Import(path);
      EXPECT_EQ(result.code, code) << path;
      EXPECT_FALSE(result.canImport);
      EXPECT_THAT(result.messages, IsEmpty());
      EXPECT_THAT(CompositionNames(result), IsEmpty());
      ExpectSound(result);
    }
  }

  void ExpectTaken(const std::filesystem::path& path) {
    EXPECT_TRUE(Verify(path).canImport) << path;
    const refhost::CallbackResult result = Import(path);
    EXPECT_EQ(result.code, 0) << path;
    EXPECT_EQ(CompositionNames(result).size(), 2u) << path;
    ExpectSound(result);
  }

  // An import whose trace goes elsewhere.
  refhost::CallbackResult ImportTraced(const std::filesystem::path& path, std::ostream* trace) {
    EndHost();
    refhost::HostOptions options;
    options.trace = trace;
    host_ = std::make_unique<refhost::Host>(std::move(options));
    refhost::CallbackResult entry;
    EXPECT_TRUE(host_->load(&MayaImportEntry, &entry));
    return host_->importScene(path);
  }

  // A path of so many bytes to the file of that name.
  std::string LongPath(const std::string& name, std::size_t size) const {
    std::string path = folder().string();
    while (path.size() + 2 < size - name.size() - 1) path += "/.";
    path += std::string(size - name.size() - path.size(), '/') + name;
    return path;
  }
};

TEST_F(OddFilesTest, ADirectoryIsNotOpened) { ExpectRefused(folder(), HOST_ERR_FILE_OPEN); }

TEST_F(OddFilesTest, AFifoIsNotWaitedFor) {
  ASSERT_EQ(mkfifo((folder() / "fifo.ma").c_str(), S_IRUSR | S_IWUSR), 0);
  ExpectRefused(folder() / "fifo.ma", HOST_ERR_FILE_OPEN);
}

TEST_F(OddFilesTest, ADeviceIsNotOpened) {
  ExpectRefused("/dev/null", HOST_ERR_FILE_OPEN);
  ExpectRefused("/dev/zero", HOST_ERR_FILE_OPEN);
}

TEST_F(OddFilesTest, AFileOfLessThanTenBytesIsAShortRead) {
  const std::string header = "//Maya ASC";
  for (std::size_t size = 0; size < header.size(); ++size) {
    ExpectRefused(Write("short.ma", header.substr(0, size)), HOST_ERR_FILE_SHORT_READ);
  }
  EXPECT_EQ(Import(Write("ten.ma", header)).code, HOST_ERR_MAYA_UNEXPECTED_END) << "a comment without an end";
  EXPECT_EQ(Import(Write("eleven.ma", header + "\n")).code, 0);
}

TEST_F(OddFilesTest, ANameThatIsNotUTF8IsAName) { ExpectTaken(Write("sc\xE9ne\xFF\xC3.ma", kScene)); }

TEST_F(OddFilesTest, APathOf4095BytesIsTakenAndOneOf4096IsNotOpened) {
  constexpr std::size_t kLongest = 4095;  // the system's limit counts the NUL
  Write("scene.ma", kScene);
  const std::string longest = LongPath("scene.ma", kLongest);
  ASSERT_EQ(longest.size(), kLongest);
  ExpectTaken(longest);
  const std::string longer = LongPath("scene.ma", kLongest + 1);
  ASSERT_EQ(longer.size(), kLongest + 1);
  ExpectRefused(longer, HOST_ERR_FILE_OPEN);
}

TEST_F(OddFilesTest, ANameOf4096CharactersIsNotOpened) {
  ExpectRefused(folder() / std::string(4096, 'n'), HOST_ERR_FILE_OPEN);
}

// Cuts a file short when the importer has locked the memory for its text.
class CuttingTrace : public std::streambuf {
 public:
  CuttingTrace(std::filesystem::path file, std::int64_t size) : file_(std::move(file)), size_(size) {}
  bool hasCut() const { return hasCut_; }

 private:
  std::streamsize xsputn(const char* text, std::streamsize count) override {
    seen_.append(text, static_cast<std::size_t>(count));
    if (!hasCut_ && seen_.find("LockMemHandle") != std::string::npos) {
      hasCut_ = true;
      EXPECT_EQ(truncate(file_.c_str(), size_), 0);
    }
    return count;
  }
  int_type overflow(int_type byte) override {
    const char text = static_cast<char>(byte);
    xsputn(&text, 1);
    return byte;
  }

  std::filesystem::path file_;
  std::int64_t size_;
  std::string seen_;
  bool hasCut_ = false;
};

TEST_F(OddFilesTest, AFileThatShrinksWhileItIsReadIsAShortReadAndNothingIsBuilt) {
  for (const std::int64_t left : {0, 1, 9, 10, 100}) {
    const auto path = Write("shrinking.ma", kScene);
    CuttingTrace cutting(path, left);
    std::ostream trace(&cutting);
    const refhost::CallbackResult result = ImportTraced(path, &trace);
    EXPECT_TRUE(cutting.hasCut());
    EXPECT_EQ(result.code, HOST_ERR_FILE_SHORT_READ) << left;
    EXPECT_THAT(CompositionNames(result), IsEmpty());
    EXPECT_THAT(result.messages, IsEmpty());
    ExpectSound(result);
    EndHost();  // it writes to the trace
  }
}

// Under the address sanitizer such files take twice the memory and many times the time.
#if !MAYASCENE_SANITIZED

constexpr std::int64_t kTwoGigabytes = std::int64_t{1} << 31;

// Whether the machine has so much memory to spare.
bool HasMemory(std::int64_t bytes) {
  std::ifstream facts("/proc/meminfo");
  constexpr std::int64_t kUnit = 1024;
  std::string name;
  std::int64_t count = 0;
  for (std::string line; std::getline(facts, line);) {
    if (std::istringstream(line) >> name >> count && name == "MemAvailable:") return count * kUnit >= bytes;
  }
  return false;
}

TEST_F(OddFilesTest, FilesJustBelowTwoGigabytesAreTakenAndThoseFromThereOnAreNot) {
  if (!HasMemory(2 * kTwoGigabytes)) GTEST_SKIP() << kLeftOut << "files of 2 GB, because the memory is short";
  const std::int64_t smallest = kTwoGigabytes - (WideTestsWanted() ? 3 : 1);
  for (std::int64_t size = smallest; size < kTwoGigabytes; ++size) {
    const auto path = Write("large.ma", kScene);
    ASSERT_EQ(truncate(path.c_str(), size), 0);
    ExpectTaken(path);  // the text ends at the first NUL
  }
  for (const std::int64_t size : {kTwoGigabytes, kTwoGigabytes + 1}) {
    const auto path = Write("large.ma", kScene);
    ASSERT_EQ(truncate(path.c_str(), size), 0);
    EXPECT_TRUE(Verify(path).canImport) << "only the header is looked at";
    const refhost::CallbackResult result = Import(path);
    EXPECT_EQ(result.code, HOST_ERR_FILE_SIZE);
    EXPECT_THAT(CompositionNames(result), IsEmpty());
    ExpectSound(result);
  }
}

#endif

}  // namespace
}  // namespace testsupport
