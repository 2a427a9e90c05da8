#include "tests/support/EndedCallback.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cstddef>
#include <cstdlib>
#include <ostream>
#include <stdexcept>
#include <streambuf>
#include <utility>

#include "tests/support/BuilderRun.h"
#include "tests/support/OwnProcess.h"

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

}  // namespace

EndedCallback CallInAProcess(refhost::Callback callback, const std::filesystem::path& scene,
                             refhost::HostOptions options) {
  SharedBuffer buffer;
  EndedCallback ended;
  ended.signal = SignalOfOwnProcess([&] {
    std::ostream trace(&buffer);
    options.during = callback;
    options.trace = &trace;
    refhost::Host host(std::move(options));
    MakeCallback(host, callback, scene);
    _exit(EXIT_SUCCESS);  // before the host ends the plug-in, which is a callback too
  });
  const std::string trace = buffer.text();
  ended.trace = LastCallback(trace);
  if (ended.signal != 0) return ended;
  const std::string leave = LinesOf(trace).back();
  if (!leave.starts_with("{\"call\":\"leave\"")) throw std::runtime_error("the callback did not return");
  ended.code = std::stoi(std::string(Field(leave, "error")));
  return ended;
}

}  // namespace testsupport
