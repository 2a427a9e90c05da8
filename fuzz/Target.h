// The function of every fuzz target, under the name that the fuzzer's library calls.
#pragma once

#include <cstddef>
#include <cstdint>

// Runs one input. Returns 0; ends the process where a promise was broken.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);
