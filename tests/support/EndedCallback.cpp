#include "tests/support/EndedCallback.h"

#include <sys/mman.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstddef>
#include <cstdio>
#include <cstdlib>
#include <ostream>
#include <stdexcept>
#include <streambuf>
#include <utility>

#include "tests/support/BuilderRun.h"

namespace testsupport {
namespace {

// A stream's memory that a process and its parent share: what was written is there however the process ended.
// It begins as NULs, of which a trace has none.
class SharedBuffer : public std::streambuf {
 public:
  SharedBuffer()
      : memory_(
            mmap(nullptr, kSize, PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS | MAP_NORESERVE, -1, 0)) {
    if (memory_ == MAP_FAILED) throw std::runtime_error("no shared memory");
    setp(begin(), begin() + kSize - 1);
  }
  ~SharedBuffer() override { munmap(memory_, kSize); }
  SharedBuffer(const SharedBuffer&) = delete;
  SharedBuffer& operator=(const SharedBuffer&) = delete;

  std::string text() const { return begin(); }

 private:
  static constexpr std::size_t kSize = std::size_t{1} << 26;  // longer than any trace of a test's scene

  char* begin() const { return static_cast<char*>(memory_); }

  void* const memory_;
};

[[noreturn]] void CallHere(refhost::Callback callback, const std::filesystem::path& scene,
                           refhost::HostOptions options, SharedBuffer* buffer) {
  const rlimit none{0, 0};
  setrlimit(RLIMIT_CORE, &none);
  if (std::freopen("/dev/null", "w", stderr) == nullptr) _exit(EXIT_FAILURE);
  std::ostream trace(buffer);
  options.during = callback;
  options.trace = &trace;
  refhost::Host host(std::move(options));
  MakeCallback(host, callback, scene);
  _exit(trace ? EXIT_SUCCESS : EXIT_FAILURE);
}

}  // namespace

EndedCallback CallInAProcess(refhost::Callback callback, const std::filesystem::path& scene,
                             refhost::HostOptions options) {
  SharedBuffer buffer;
  std::fflush(nullptr);
  const pid_t process = fork();
  if (process == 0) CallHere(callback, scene, std::move(options), &buffer);
  int status = 0;
  if (process < 0 || waitpid(process, &status, 0) != process) throw std::runtime_error("no process");

  EndedCallback ended;
  const std::string trace = buffer.text();
  ended.trace = LastCallback(trace);
  if (WIFSIGNALED(status)) {
    ended.signal = WTERMSIG(status);
    return ended;
  }
  if (WEXITSTATUS(status) != EXIT_SUCCESS) throw std::runtime_error("a process could not make its callback");
  ended.code = std::stoi(std::string(Field(LinesOf(trace).back(), "error")));
  return ended;
}

}  // namespace testsupport
