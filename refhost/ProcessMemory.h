// How this process takes memory from the system.
#pragma once

namespace refhost {

// Gives the process a heap that is made of large pages, where the system has them: most of the time that
// fresh memory takes goes into its page faults, and a scene of many curves is hundreds of thousands of small
// ones. Address space is taken, memory is not. Does nothing with another allocator than the C library's own.
void useLargePages();

}  // namespace refhost
