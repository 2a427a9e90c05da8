#include "tools/mayascene/ChildProcess.h"

#include <fcntl.h>
#include <signal.h>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <utility>

#include "tools/mayascene/Interruption.h"

namespace mayascene {
namespace {

constexpr int kNotRun = 127;
constexpr std::size_t kPart = std::size_t{1} << 16;
constexpr int kPartsAtATime = 8;

// Both ends of a pipe, closed where they are not taken.
struct Pipe {
  std::array<int, 2> ends = {-1, -1};

  Pipe() = default;
  ~Pipe() {
    for (const int end : ends) {
      if (end >= 0) ::close(end);
    }
  }
  Pipe(const Pipe&) = delete;
  Pipe& operator=(const Pipe&) = delete;

  bool open() { return ::pipe2(ends.data(), O_CLOEXEC) == 0; }
  int takeReading() { return std::exchange(ends[0], -1); }
};

// What the child needs, made before the fork: between fork and exec nothing may allocate memory.
struct Preparation {
  std::vector<char*> words;
  int out = -1, err = -1, failure = -1;  // ends of pipes to write to
  std::uint64_t memory = 0;
  pid_t parent = 0;
};

bool limitMemory(std::uint64_t bytes) {
  rlimit limit{};
  if (bytes == 0) return true;
  if (::getrlimit(RLIMIT_AS, &limit) != 0) return false;
  limit.rlim_cur = std::min<rlim_t>(bytes, limit.rlim_max);
  limit.rlim_max = limit.rlim_cur;
  return ::setrlimit(RLIMIT_AS, &limit) == 0;
}

bool redirect(const Preparation& prepared) {
  const int nothing = ::open("/dev/null", O_RDONLY | O_CLOEXEC);
  return nothing >= 0 && ::dup2(nothing, STDIN_FILENO) >= 0 && ::dup2(prepared.out, STDOUT_FILENO) >= 0 &&
         ::dup2(prepared.err, STDERR_FILENO) >= 0;
}

[[noreturn]] void runChild(const Preparation& prepared, const HeldSignals& held) {
  // The parent's signal handler must not run here: it would remove the parent's files.
  held.defaultInChild();
  const bool ready =
      ::prctl(PR_SET_PDEATHSIG, SIGKILL) == 0 && redirect(prepared) && limitMemory(prepared.memory);
  // The parent may have ended before the child asked for the signal.
  if (::getppid() != prepared.parent) ::_exit(kNotRun);
  if (ready) ::execv(prepared.words.front(), prepared.words.data());
  const int failure = errno;
  const ssize_t written = ::write(prepared.failure, &failure, sizeof failure);
  ::_exit(written == sizeof failure ? kNotRun : kNotRun + 1);
}

void readStream(ChildProcess::Stream* stream) {
  std::array<char, kPart> part;
  for (int parts = 0; stream->descriptor >= 0 && parts < kPartsAtATime; ++parts) {
    const ssize_t count = ::read(stream->descriptor, part.data(), part.size());
    if (count > 0) stream->text.append(part.data(), static_cast<std::size_t>(count));
    if (count < 0 && errno == EINTR) continue;
    if (count < 0 && (errno == EAGAIN || errno == EWOULDBLOCK)) return;
    if (count <= 0) ::close(std::exchange(stream->descriptor, -1));
  }
}

}  // namespace

std::unique_ptr<ChildProcess> ChildProcess::start(const std::vector<std::string>& command,
                                                  std::uint64_t memory, int* failure) {
  Pipe out, err, starting;
  if (!out.open() || !err.open() || !starting.open()) {
    *failure = errno;
    return nullptr;
  }
  std::vector<std::string> words = command;
  Preparation prepared;
  for (std::string& word : words) prepared.words.push_back(word.data());
  prepared.words.push_back(nullptr);
  prepared.out = out.ends[1];
  prepared.err = err.ends[1];
  prepared.failure = starting.ends[1];
  prepared.memory = memory;
  prepared.parent = ::getpid();
  std::unique_ptr<ChildProcess> child(new ChildProcess);
  {
    const HeldSignals held;
    const pid_t process = ::fork();
    if (process == 0) runChild(prepared, held);
    if (process < 0) {
      *failure = errno;
      return nullptr;
    }
    rememberChild(process);
    child->process_ = process;
  }
  for (const Pipe* pipe : {&out, &err, &starting}) ::fcntl(pipe->ends[0], F_SETFL, O_NONBLOCK);
  child->starting_ = starting.takeReading();
  child->out_.descriptor = out.takeReading();
  child->err_.descriptor = err.takeReading();
  return child;
}

ChildProcess::~ChildProcess() {
  for (const int descriptor : {out_.descriptor, err_.descriptor, starting_}) {
    if (descriptor >= 0) ::close(descriptor);
  }
  if (process_ < 0 || status_) return;
  kill();
  const HeldSignals held;
  while (::waitpid(process_, nullptr, 0) < 0 && errno == EINTR) {
  }
  forgetChild(process_);
}

void ChildProcess::read() {
  readStream(&out_);
  readStream(&err_);
}

void ChildProcess::kill() {
  if (!status_) ::kill(process_, SIGKILL);
}

std::optional<int> ChildProcess::ended() {
  if (status_) return status_;
  // After the wait its number may belong to another process, which no handler may kill.
  const HeldSignals held;
  int status = 0;
  if (::waitpid(process_, &status, WNOHANG) == process_) {
    forgetChild(process_);
    status_ = status;
  }
  return status_;
}

int ChildProcess::notRun() {
  int number = 0;
  return ::read(starting_, &number, sizeof number) == sizeof number ? number : 0;
}

}  // namespace mayascene
