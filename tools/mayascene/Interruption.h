// Removes unfinished files and ends child processes when the run is interrupted.
#pragma once

#include <signal.h>
#include <sys/types.h>

#include <cstddef>
#include <streambuf>

namespace mayascene {

// From here on, a run that a signal ends (SIGINT, SIGTERM, SIGHUP, SIGPIPE) ends its children, removes its
// unfinished files and ends with 128 and the signal's number. A run that std::terminate ends does the same,
// says so on standard error, and aborts.
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

  // For a child that was forked meanwhile: the signals have their default effect, and no longer wait. Signals
  // that are ignored stay ignored.
  void defaultInChild() const;

 private:
  sigset_t before_;
};

// As many children as can be remembered at a time.
inline constexpr std::size_t kMostChildren = 256;

// Remembers a child, which is killed and waited for when the run is interrupted. The caller holds the signals
// from before the fork until the child is remembered, and from before the wait until it is forgotten.
void rememberChild(pid_t child);
void forgetChild(pid_t child);

// Flushes the log when std::terminate ends the run; a signal does not. The log lives until another one, or
// null, replaces it.
void flushWhenTerminated(std::streambuf* log);

}  // namespace mayascene
