#include "tools/mayascene/Interruption.h"

#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <atomic>
#include <cstdlib>
#include <exception>
#include <streambuf>
#include <string_view>

#include "tools/mayascene/ExitStatus.h"

namespace mayascene {
namespace {

constexpr std::array kSignals = {SIGINT, SIGTERM, SIGHUP, SIGPIPE};

// As many files as a process may usually have open: an export can have a file for each camera.
std::array<std::atomic<const char*>, 1024> unfinished{};
static_assert(std::atomic<const char*>::is_always_lock_free, "a signal handler reads them");

std::array<std::atomic<pid_t>, kMostChildren> children{};
static_assert(std::atomic<pid_t>::is_always_lock_free, "a signal handler reads them");

std::streambuf* terminationLog = nullptr;

// Kills all before it waits for one, so that they end at the same time.
void endChildren() noexcept {
  for (const std::atomic<pid_t>& slot : children) {
    if (slot.load() > 0) ::kill(slot.load(), SIGKILL);
  }
  for (std::atomic<pid_t>& slot : children) {
    const pid_t child = slot.exchange(0);
    if (child > 0) ::waitpid(child, nullptr, 0);
  }
}

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
  endChildren();
  removeUnfinished();
  ::_exit(kSignalStatus + signal);
}

// The importer ends the process where an exception leaves the release of a suite.
[[noreturn]] void endTerminated() {
  constexpr std::string_view kFarewell =
      "mayascene: an exception escaped where none may, in the importer or the tool; the run ends here\n";
  endChildren();
  removeUnfinished();
  // The log's last line is the call that ends the run.
  if (terminationLog != nullptr) terminationLog->pubsync();
  if (::write(STDERR_FILENO, kFarewell.data(), kFarewell.size()) < 0) std::abort();
  std::abort();
}

}  // namespace

void handleInterruptions() {
  struct sigaction action {};
  action.sa_handler = endInterrupted;
  sigemptyset(&action.sa_mask);
  // One handler at a time: the second would find half of the work done.
  for (const int signal : kSignals) sigaddset(&action.sa_mask, signal);
  for (const int signal : kSignals) {
    struct sigaction before {};
    // A signal that is ignored (nohup) stays ignored.
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

HeldSignals::HeldSignals() : before_() {
  sigset_t held;
  sigemptyset(&held);
  for (const int signal : kSignals) sigaddset(&held, signal);
  ::sigprocmask(SIG_BLOCK, &held, &before_);
}

HeldSignals::~HeldSignals() { ::sigprocmask(SIG_SETMASK, &before_, nullptr); }

void HeldSignals::defaultInChild() const {
  struct sigaction byDefault {};
  byDefault.sa_handler = SIG_DFL;
  sigemptyset(&byDefault.sa_mask);
  for (const int signal : kSignals) {
    struct sigaction before {};
    if (::sigaction(signal, nullptr, &before) == 0 && before.sa_handler == SIG_IGN) continue;
    ::sigaction(signal, &byDefault, nullptr);
  }
  ::sigprocmask(SIG_SETMASK, &before_, nullptr);
}

void rememberChild(pid_t child) {
  for (std::atomic<pid_t>& slot : children) {
    pid_t empty = 0;
    if (slot.compare_exchange_strong(empty, child)) return;
  }
}

void forgetChild(pid_t child) {
  for (std::atomic<pid_t>& slot : children) {
    pid_t held = child;
    if (slot.compare_exchange_strong(held, 0)) return;
  }
}

void flushWhenTerminated(std::streambuf* log) { terminationLog = log; }

}  // namespace mayascene
