// What becomes of half-written files and of child processes when the run is interrupted.
#pragma once

#include <signal.h>
#include <sys/types.h>

#include <cstddef>
#include <streambuf>

namespace mayascene {

// From here on a run that a signal ends (SIGINT, SIGTERM, SIGHUP, SIGPIPE) ends its children, takes its
// unfinished files away and ends with 128 and the signal's number; one that std::terminate ends says so
// first.
void handleInterruptions();

// Remembers a file that is not finished yet, or the folder of one. The name stays the caller's, unchanged,
// until it is forgotten.
void rememberUnfinished(const char* name);
void forgetUnfinished(const char* name);

// While one lives, these signals wait.
class HeldSignals {
 public:
  HeldSignals();
  ~HeldSignals();
  HeldSignals(const HeldSignals&) = delete;
  HeldSignals& operator=(const HeldSignals&) = delete;

  // In a child that was forked meanwhile: the signals do what they do by default, and no longer wait. Those
  // that were to be ignored stay ignored.
  void defaultInChild() const;

 private:
  sigset_t before_;
};

// As many children as can be remembered at a time.
inline constexpr std::size_t kMostChildren = 256;

// Remembers a child that is killed, and waited for, when the run is interrupted. Signals are held from before
// it is there until it is remembered, and from before it is waited for until it is forgotten.
void rememberChild(pid_t child);
void forgetChild(pid_t child);

// The log that goes out to its end when std::terminate ends the run; it lives until another one, or null,
// takes its place. A signal does not wait for it.
void flushWhenTerminated(std::streambuf* log);

}  // namespace mayascene
