// How this process gets memory from the system.
#pragma once

namespace refhost {

// Gives the process a heap of large pages, where the system has them: page faults take most of the time that
// fresh memory needs, and a scene of many curves causes hundreds of thousands of them. Reserves address
// space, not memory. Does nothing with another allocator than the C library's own.
void useLargePages();

}  // namespace refhost
