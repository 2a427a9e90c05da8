// The smallest host that the reader needs: a utility suite that counts messages.
#pragma once

#include "hostapi/WNBasicSuite.h"

namespace fuzz {

class ReaderHost {
 public:
  // Registers the reader's messages, once in a process, and begins to count.
  ReaderHost();

  // Nothing may be left behind: no suite, list or file.
  ~ReaderHost();
  ReaderHost(const ReaderHost&) = delete;
  ReaderHost& operator=(const ReaderHost&) = delete;

  const WNBasicSuite* basicSuite() const;
  int messages() const;
};

}  // namespace fuzz
