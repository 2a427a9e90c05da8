// The ledger: what a callback left behind.
#pragma once

#include <vector>

#include "refhost/Host.h"

namespace refhost {

class HostState;

// Suites, streams, batches and memory handles, then the files and lists of the utility library.
std::vector<Leftover> drawLedger(HostState& host);

// Gives everything of it back.
void releaseLeftovers(HostState& host);

}  // namespace refhost
