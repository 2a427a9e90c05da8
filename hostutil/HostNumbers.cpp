// The services for numbers, on top of the conversion in scan/Decimal.h, and the comparison of ratios.
#include "hostutil/HostNumbers.h"

#include <cstdint>

#include "hostapi/ErrorCodes.h"
#include "hostutil/RehearsalInternal.h"
#include "scan/Decimal.h"

namespace {

// Reads up to `capacity` plain numbers and moves *at to right after the last one. Returns how many.
std::int64_t ReadRun(const char** at, const char* end, char terminator, double* numbers,
                     std::int64_t capacity) {
  std::int64_t count = 0;
  for (; count < capacity; ++count) {
    const char* const next = scan::ReadPlainNumber(*at, end, terminator, &numbers[count]);
    if (next == nullptr) break;
    *at = next;
  }
  return count;
}

}  // namespace

HostError HostNumberScan(const char* text, std::int64_t length, double* value) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_NumberScan, &code)) {
    hostutil::HandOutNothing(value);
    return code;
  }
  if (text == nullptr || value == nullptr) return HOST_ERR_UTILITY_NULL;
  switch (scan::ReadNumber(text, length, value)) {
    case scan::NumberStatus::Ok:
      return HOST_ERR_NONE;
    case scan::NumberStatus::Range:
      return HOST_ERR_NUMBER_RANGE;
    case scan::NumberStatus::Syntax:
      break;
  }
  return HOST_ERR_NUMBER_SYNTAX;
}

HostError HostNumberScanRun(const char* text, const char* end, char terminator, double* numbers,
                            std::int64_t capacity, std::int64_t* count, const char** after) {
  *count = 0;
  *after = text;
  for (;;) {
    const std::int64_t sound = hostutil::CallsBeforeFailure(HOST_UTILITY_NumberScan, capacity - *count);
    const std::int64_t read = ReadRun(after, end, terminator, numbers + *count, sound);
    hostutil::CountCalls(HOST_UTILITY_NumberScan, read);
    *count += read;
    if (read < sound || *count == capacity) return HOST_ERR_NONE;
    // The next number, if there is one, is planned to fail.
    double number = 0.0;
    const char* next = *after;
    if (ReadRun(&next, end, terminator, &number, 1) == 0) return HOST_ERR_NONE;
    HostError code = HOST_ERR_NONE;
    if (hostutil::Rehearsed(HOST_UTILITY_NumberScan, &code)) number = 0.0;
    if (code != HOST_ERR_NONE) return code;
    numbers[(*count)++] = number;
    *after = next;
  }
}

HostError HostRatioCompare(const HostRatio* a, const HostRatio* b, std::int32_t* order) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_RatioCompare, &code)) {
    hostutil::HandOutNothing(order);
    return code;
  }
  if (a == nullptr || b == nullptr || order == nullptr) return HOST_ERR_UTILITY_NULL;
  if (a->denominator == 0 || b->denominator == 0) return HOST_ERR_NUMBER_RANGE;
  // A signed and an unsigned 32-bit factor: the product always fits 64 bits.
  const std::int64_t left = std::int64_t{a->numerator} * std::int64_t{b->denominator};
  const std::int64_t right = std::int64_t{b->numerator} * std::int64_t{a->denominator};
  *order = left < right ? -1 : left > right ? 1 : 0;
  return HOST_ERR_NONE;
}
