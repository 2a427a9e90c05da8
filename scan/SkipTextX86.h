// The skippers of x86-64 processors.
#pragma once

#if defined(__x86_64__)
#include <cstdint>

namespace scan {

const char* SkipBetweenCommandsSse2(const char* position, const char* end, std::int32_t* lines);
const char* SkipInCommandSse2(const char* position, const char* end, std::int32_t* lines);

// Whether the processor has AVX2, BMI and POPCNT, which the two functions below need.
bool HasAvx2();
const char* SkipBetweenCommandsAvx2(const char* position, const char* end, std::int32_t* lines);
const char* SkipInCommandAvx2(const char* position, const char* end, std::int32_t* lines);

}  // namespace scan
#endif
