#include "tools/mayascene/OutputFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <optional>
#include <utility>
#include <vector>

#include "text/FileBeside.h"
#include "tools/mayascene/DescriptorBuffer.h"
#include "tools/mayascene/Interruption.h"

namespace mayascene {
namespace {

constexpr mode_t kNewFileMode = 0666;  // reduced by the user's mask

std::string cannotWrite(const std::string& target, int number) {
  const std::string name = target == kStandardOutput ? "standard output" : target;
  return name + " cannot be written: " + std::strerror(number);
}

}  // namespace

struct OutputFile::State {
  explicit State(std::string shownName) : target(std::move(shownName)) {}
  ~State() {
    // A signal may come between the two.
    const std::string beside = file.beside();
    file.Remove();
    if (!beside.empty()) forgetUnfinished(beside.c_str());
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

  // Opens a new file beside the place of a regular file. Its name is known to the signals before it exists.
  bool openBeside() {
    if (!file.FindPlace(target)) return false;
    rememberUnfinished(file.beside().c_str());
    const int opened = file.Create();
    if (opened < 0) return false;
    attach(opened);
    return true;
  }

  // Gives a file at the place a second name. It keeps the first one where the file system has hard links, so
  // that there is a whole file at any moment. Anything but a regular file stays, and place() reports it.
  bool keep() {
    struct stat existing {};
    const std::string& place = file.place();
    if (file.beside().empty() || ::lstat(place.c_str(), &existing) != 0 || !S_ISREG(existing.st_mode))
      return true;
    kept = text::NameBeside(place);
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
    const std::string& place = file.place();
    if (kept.empty()) {
      if (file.beside().empty() && !place.empty()) ::unlink(place.c_str());
    } else if (std::rename(kept.c_str(), place.c_str()) == 0) {
      // rename keeps both names where they belong to the same file.
      ::unlink(kept.c_str());
    } else {
      *failure += "; what was in " + target + " is in " + kept;
    }
  }

  std::string target;     // as the user named it
  text::FileBeside file;  // without a name beside its place: written in place, or already placed
  std::string kept;  // the file that was at the place, until all outputs have theirs; empty: there was none
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
    opened = state->openBeside();
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
  const std::string beside = state.file.beside();
  if (beside.empty()) return true;
  if (!state.file.TakePlace()) {
    *failure = cannotWrite(state.target, errno);
    return false;
  }
  forgetUnfinished(beside.c_str());
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
