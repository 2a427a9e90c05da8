#include "tools/mayascene/Interruption.h"

#include <signal.h>
#include <unistd.h>

#include <array>
#include <atomic>
#include <cstdlib>
#include <exception>
#include <streambuf>
#include <string_view>

namespace mayascene {
namespace {

constexpr int kSignalBase = 128;

// As many as there can be outputs at a time, and to spare.
std::array<std::atomic<const char*>, 8> unfinished{};
static_assert(std::atomic<const char*>::is_always_lock_free, "a signal handler reads them");

std::streambuf* terminationLog = nullptr;

// Files first: a folder goes only when it is empty.
void removeUnfinished() noexcept {
  for (std::atomic<const char*>& slot : unfinished) {
    const char* name = slot.load();
    if (name != nullptr && ::unlink(name) == 0) slot = nullptr;
  }
  for (std::atomic<const char*>& slot : unfinished) {
    const char* name = slot.exchange(nullptr);
    if (name != nullptr) ::rmdir(name);
  }
}

extern "C" void endInterrupted(int signal) {
  removeUnfinished();
  ::_exit(kSignalBase + signal);
}

// The importer ends the process where an exception leaves the release of a suite.
[[noreturn]] void endTerminated() {
  constexpr std::string_view farewell =
      "mayascene: an exception escaped where none may, in the importer or the tool; the run ends here\n";
  removeUnfinished();
  // The log's last line is the call that ends the run.
  if (terminationLog != nullptr) terminationLog->pubsync();
  if (::write(STDERR_FILENO, farewell.data(), farewell.size()) < 0) std::abort();
  std::abort();
}

}  // namespace

void handleInterruptions() {
  struct sigaction action {};
  action.sa_handler = endInterrupted;
  sigemptyset(&action.sa_mask);
  for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGPIPE}) {
    struct sigaction before {};
    // A signal that was to be ignored (nohup) stays ignored.
    if (::sigaction(signal, nullptr, &before) == 0 && before.sa_handler == SIG_IGN) continue;
    ::sigaction(signal, &action, nullptr);
  }
  std::set_terminate(endTerminated);
}

void rememberUnfinished(const char* name) {
  for (std::atomic<const char*>& slot : unfinished) {
    const char* empty = nullptr;
    if (slot.compare_exchange_strong(empty, name)) return;
  }
}

void forgetUnfinished(const char* name) {
  for (std::atomic<const char*>& slot : unfinished) {
    const char* held = name;
    if (slot.compare_exchange_strong(held, nullptr)) return;
  }
}

void flushWhenTerminated(std::streambuf* log) { terminationLog = log; }

}  // namespace mayascene
