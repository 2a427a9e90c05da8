#include "tools/mayascene/OutputFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <optional>
#include <system_error>
#include <utility>
#include <vector>

#include "tools/mayascene/DescriptorBuffer.h"
#include "tools/mayascene/Interruption.h"

namespace mayascene {
namespace {

constexpr mode_t kNewFileMode = 0666;  // reduced by the user's mask
constexpr mode_t kPermissionBits = 07777;
constexpr int kMostLinks = 40;  // the most symbolic links in a row, as in the system

std::string cannotWrite(const std::string& target, int number) {
  const std::string name = target == kStandardOutput ? "standard output" : target;
  return name + " cannot be written: " + std::strerror(number);
}

// A name in the same folder that is not in use.
std::string nameBeside(const std::filesystem::path& place) {
  static int serial = 0;
  const std::string name = ".mayascene-" + std::to_string(::getpid()) + '-' + std::to_string(++serial);
  return (place.parent_path() / name).string();
}

// Where a file belongs. Symbolic links are followed, so that they stay links; the target of the last one need
// not exist. Empty where they form a circle.
std::filesystem::path placeOf(const std::string& target) {
  std::filesystem::path place = target;
  for (int links = 0; links < kMostLinks; ++links) {
    std::error_code isNoLink;
    const std::filesystem::path next = std::filesystem::read_symlink(place, isNoLink);
    if (isNoLink) return place;
    place = place.parent_path() / next;
  }
  return {};
}

}  // namespace

struct OutputFile::State {
  explicit State(std::string shownName) : target(std::move(shownName)) {}
  ~State() {
    if (!beside.empty()) {
      ::unlink(beside.c_str());
      forgetUnfinished(beside.c_str());
    }
    if (log) flushWhenTerminated(nullptr);
    closeDescriptor();
  }
  State(const State&) = delete;
  State& operator=(const State&) = delete;

  void attach(int fileDescriptor) {
    descriptor = fileDescriptor;
    buffer.emplace(fileDescriptor);
    stream.rdbuf(&*buffer);
  }

  int closeDescriptor() {
    const int held = std::exchange(descriptor, -1);
    return held > STDERR_FILENO ? ::close(held) : 0;
  }

  // Opens a new file beside the place of a regular file.
  bool openBeside(const struct stat* existing) {
    place = placeOf(target).string();
    if (place.empty()) {
      errno = ELOOP;
      return false;
    }
    beside = nameBeside(place);
    rememberUnfinished(beside.c_str());
    const int opened = ::open(beside.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kNewFileMode);
    if (opened < 0) return false;
    attach(opened);
    return existing == nullptr || ::fchmod(opened, existing->st_mode & kPermissionBits) == 0;
  }

  // Gives a file at the place a second name. It keeps the first one where the file system has hard links, so
  // that there is a whole file at any moment. Anything but a regular file stays, and place() reports it.
  bool keep() {
    struct stat existing {};
    if (beside.empty() || ::lstat(place.c_str(), &existing) != 0 || !S_ISREG(existing.st_mode)) return true;
    kept = nameBeside(place);
    if (::link(place.c_str(), kept.c_str()) == 0 || std::rename(place.c_str(), kept.c_str()) == 0)
      return true;
    kept.clear();
    return false;
  }

  void dropKept() {
    if (!kept.empty()) ::unlink(kept.c_str());
  }

  // Restores the state before keep(). A kept file that cannot take its place again stays under its second
  // name, which is reported.
  void putBack(std::string* failure) {
    if (kept.empty()) {
      if (beside.empty() && !place.empty()) ::unlink(place.c_str());
    } else if (std::rename(kept.c_str(), place.c_str()) == 0) {
      // rename keeps both names where they belong to the same file.
      ::unlink(kept.c_str());
    } else {
      *failure += "; what was in " + target + " is in " + kept;
    }
  }

  std::string target;  // as the user named it
  std::string place;   // where the file belongs
  std::string beside;  // where it is written until it is whole; empty: written in place, or already placed
  std::string kept;    // the file that was at the place, until all outputs have theirs; empty: there was none
  int descriptor = -1;
  bool log = false;
  std::optional<DescriptorBuffer> buffer;
  std::ostream stream{nullptr};
};

OutputFile::OutputFile(std::unique_ptr<State> state) : state_(std::move(state)) {}
OutputFile::~OutputFile() = default;
std::ostream& OutputFile::stream() { return state_->stream; }

std::unique_ptr<OutputFile> OutputFile::open(const std::string& target, std::string* failure) {
  auto state = std::make_unique<State>(target);
  struct stat existing {};
  const bool standardOutput = target == kStandardOutput;
  const bool exists = !standardOutput && ::stat(target.c_str(), &existing) == 0;
  bool opened = true;
  if (standardOutput) {
    state->attach(STDOUT_FILENO);
  } else if (exists && !S_ISREG(existing.st_mode)) {
    const int descriptor = ::open(target.c_str(), O_WRONLY | O_CLOEXEC);
    opened = descriptor >= 0;
    if (opened) state->attach(descriptor);
  } else {
    // A file that its owner has made read-only is not replaced, although the folder would allow it.
    opened =
        (!exists || ::access(target.c_str(), W_OK) == 0) && state->openBeside(exists ? &existing : nullptr);
  }
  if (!opened) {
    *failure = cannotWrite(target, errno);
    return nullptr;
  }
  return std::unique_ptr<OutputFile>(new OutputFile(std::move(state)));
}

std::unique_ptr<OutputFile> OutputFile::openLog(const std::string& target, std::string* failure) {
  auto state = std::make_unique<State>(target);
  const int descriptor = target == kStandardOutput
                             ? STDOUT_FILENO
                             : ::open(target.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, kNewFileMode);
  if (descriptor < 0) {
    *failure = cannotWrite(target, errno);
    return nullptr;
  }
  state->attach(descriptor);
  state->log = true;
  flushWhenTerminated(&*state->buffer);
  return std::unique_ptr<OutputFile>(new OutputFile(std::move(state)));
}

bool OutputFile::finish(std::string* failure) {
  State& state = *state_;
  state.stream.flush();
  int number = state.buffer->failure();
  if (state.closeDescriptor() != 0 && number == 0) number = errno;
  if (number != 0) *failure = cannotWrite(state.target, number);
  return number == 0;
}

bool OutputFile::place(std::string* failure) {
  State& state = *state_;
  if (state.beside.empty()) return true;
  if (std::rename(state.beside.c_str(), state.place.c_str()) != 0) {
    *failure = cannotWrite(state.target, errno);
    return false;
  }
  forgetUnfinished(state.beside.c_str());
  state.beside.clear();
  return true;
}

bool OutputFile::commitAll(const std::vector<OutputFile*>& outputs, std::string* failure) {
  // A full disk is noticed before the first of them takes its place.
  for (OutputFile* output : outputs) {
    if (!output->finish(failure)) return false;
  }
  const HeldSignals held;
  std::vector<State*> touched;
  bool all = true;
  for (OutputFile* output : outputs) {
    State& state = *output->state_;
    touched.push_back(&state);
    all = state.keep();
    if (!all) *failure = cannotWrite(state.target, errno);
    all = all && output->place(failure);
    if (!all) break;
  }
  for (State* state : touched) all ? state->dropKept() : state->putBack(failure);
  return all;
}

}  // namespace mayascene
