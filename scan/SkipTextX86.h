// The skippers of x86-64 processors.
#pragma once

#if defined(__x86_64__)
#include <cstdint>

namespace scan {

const char* SkipBetweenCommandsSse2(const char* position, const char* end, std::int32_t* lines);
const char* SkipInCommandSse2(const char* position, const char* end, std::int32_t* lines);

// Only where HasAvx2.
bool HasAvx2();
const char* SkipBetweenCommandsAvx2(const char* position, const char* end, std::int32_t* lines);
const char* SkipInCommandAvx2(const char* position, const char* end, std::int32_t* lines);

}  // namespace scan
#endif
