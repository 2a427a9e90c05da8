// Files whose system calls are interrupted, give less than was asked for, or fail.
#include <fcntl.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>
#include <cstdarg>
#include <cstdint>
#include <string>

#include "TemporaryFolder.h"
#include "UtilityTest.h"

namespace {

// What the next calls come to; the rest are the system's own.
struct Disturbance {
  int calls = 0;  // that fail
  int error = 0;  // with this errno
  bool Strikes() {
    if (calls == 0) return false;
    --calls;
    errno = error;
    return true;
  }
};

Disturbance opening, reading, closing;
size_t mostBytes = SIZE_MAX;  // that one read gives

}  // namespace

// In the place of the system library's, for the whole program, the utility library included.
#define SYSTEM_CALL extern "C" __attribute__((visibility("default")))

#define OPEN_AS(name)                                                                                   \
  SYSTEM_CALL int name(const char* path, int flags, ...) {                                              \
    va_list rest;                                                                                       \
    va_start(rest, flags);                                                                              \
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(rest, mode_t) : 0;                              \
    va_end(rest);                                                                                       \
    return opening.Strikes() ? -1 : static_cast<int>(syscall(SYS_openat, AT_FDCWD, path, flags, mode)); \
  }
OPEN_AS(open64)
OPEN_AS(open)

SYSTEM_CALL ssize_t read(int descriptor, void* buffer, size_t count) {
  if (reading.Strikes()) return -1;
  return syscall(SYS_read, descriptor, buffer, count < mostBytes ? count : mostBytes);
}

SYSTEM_CALL int close(int descriptor) {
  const auto result = static_cast<int>(syscall(SYS_close, descriptor));
  return closing.Strikes() ? -1 : result;
}

namespace hostutil_tests {
namespace {

class InterruptedFileTest : public UtilityTest {
 protected:
  void SetUp() override { file_ = MakeFile(folder_.Write("scene.ma", "//Maya ASCII")); }
  void TearDown() override {
    opening = reading = closing = {};
    mostBytes = SIZE_MAX;
    EXPECT_EQ(HostFileDispose(file_), file_ != nullptr ? HOST_ERR_NONE : HOST_ERR_UTILITY_NULL);
    UtilityTest::TearDown();
  }

  std::string Read(std::int64_t count, HostError expected = HOST_ERR_NONE) {
    std::string bytes(static_cast<std::size_t>(count), '?');
    EXPECT_EQ(HostFileRead(file_, count, bytes.data()), expected);
    return bytes;
  }

  TemporaryFolder folder_;
  HostFile* file_ = nullptr;
};

TEST_F(InterruptedFileTest, AnInterruptedOpenIsTriedAgain) {
  opening = {3, EINTR};
  EXPECT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  EXPECT_EQ(opening.calls, 0);
  EXPECT_EQ(Read(6), "//Maya");
}

TEST_F(InterruptedFileTest, AFailedOpenIsNotTriedAgain) {
  opening = {2, EMFILE};
  EXPECT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_FILE_OPEN);
  EXPECT_EQ(opening.calls, 1);
}

TEST_F(InterruptedFileTest, AnInterruptedReadGoesOn) {
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  reading = {3, EINTR};
  EXPECT_EQ(Read(12), "//Maya ASCII");
  EXPECT_EQ(reading.calls, 0);
}

TEST_F(InterruptedFileTest, BytesThatComeInPiecesAreAllRead) {
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  mostBytes = 5;
  EXPECT_EQ(Read(12), "//Maya ASCII");
}

TEST_F(InterruptedFileTest, AFailedReadIsAShortRead) {
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  reading = {1, EIO};
  EXPECT_EQ(Read(3, HOST_ERR_FILE_SHORT_READ), "???");
}

TEST_F(InterruptedFileTest, AnInterruptedCloseHasClosed) {
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  closing = {1, EINTR};
  EXPECT_EQ(HostFileClose(file_), HOST_ERR_NONE);
  EXPECT_EQ(closing.calls, 0);
  EXPECT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
}

TEST_F(InterruptedFileTest, AFailedCloseIsReportedAndTheFileIsNotOpenAnyMore) {
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  closing = {1, EIO};
  EXPECT_EQ(HostFileClose(file_), HOST_ERR_FILE_CLOSE);
  EXPECT_EQ(HostFileClose(file_), HOST_ERR_NONE);
}

TEST_F(InterruptedFileTest, AFileWhoseCloseFailsIsDisposedOfAllTheSame) {
  ASSERT_EQ(HostFileOpen(file_, HOST_FILE_READ), HOST_ERR_NONE);
  closing = {1, EIO};
  EXPECT_EQ(HostFileDispose(file_), HOST_ERR_FILE_CLOSE);
  EXPECT_TRUE(Ledger().empty());
  file_ = nullptr;
}

}  // namespace
}  // namespace hostutil_tests
