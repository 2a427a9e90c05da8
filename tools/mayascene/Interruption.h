// What becomes of half-written files when the run is interrupted.
#pragma once

#include <streambuf>

namespace mayascene {

// From here on a run that a signal ends (SIGINT, SIGTERM, SIGHUP, SIGPIPE) takes its unfinished files away
// and ends with 128 and the signal's number; one that std::terminate ends says so first.
void handleInterruptions();

// Remembers a file that is not finished yet, or the folder of one. The name stays the caller's, unchanged,
// until it is forgotten.
void rememberUnfinished(const char* name);
void forgetUnfinished(const char* name);

// The log that goes out to its end when std::terminate ends the run; it lives until another one, or null,
// takes its place. A signal does not wait for it.
void flushWhenTerminated(std::streambuf* log);

}  // namespace mayascene
