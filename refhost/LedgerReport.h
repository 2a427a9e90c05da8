// The ledger: what a callback left behind.
#pragma once

#include <vector>

#include "refhost/Host.h"

namespace refhost {

class HostState;

// Lists what is still held: suites, streams, batches and memory handles, then the files and lists of the
// utility library.
std::vector<Leftover> drawLedger(HostState& host);

// Gives back everything that drawLedger lists.
void releaseLeftovers(HostState& host);

}  // namespace refhost
