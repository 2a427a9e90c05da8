/* Numbers and ratios: scanning, comparing, and conversion to integers. Nothing here looks at the locale. */
#ifndef HOSTUTIL_HOSTNUMBERS_H
#define HOSTUTIL_HOSTNUMBERS_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

/* Reads one number out of `length` bytes (a NUL among them ends the text): an optional sign, decimal digits
 * with an optional fraction and exponent (".5" and "5." too), then nothing or letters only, which are
 * ignored ("23.976fps" is 23.976; "1e" is 1). The double is the nearest one. Underflow gives 0 with the
 * text's sign, a denormal stays one. Time is linear in the length, and nothing is allocated.
 * HOST_ERR_NUMBER_SYNTAX for anything else ("", "-", "--x", "0x10", "1.#QNAN"), HOST_ERR_NUMBER_RANGE when
 * the number is too large; *value is then unchanged. Neither an infinity nor a NaN comes out. */
HOSTUTIL_API HostError HostNumberScan(const char* text, int64_t length, double* value);

/* Reads numbers that stand one after another, apart by white space (space, tab, carriage return, line feed).
 * Each is in plain decimal form: digits with an optional "-", fraction and exponent, followed by white space
 * or by the byte `terminator`. Stops before everything else: a word of another form or longer than 64 bytes,
 * a number that another byte follows, the end of the text. What it leaves is for HostNumberScan, which gives
 * each number the same value; "1#2" and "23.976fps" are left whole.
 *
 * Writes up to `capacity` numbers, how many to *count, and to *after the place right after the last one,
 * which is `text` when there is none. Each number counts and fails as one call of HostNumberScan: a planned
 * failure hands out the numbers before it and returns its code, or throws; with code 0 its number is 0 and
 * the reading goes on. HOST_ERR_NONE otherwise, however few numbers there are. `end` is the text's
 * terminating NUL, after which nothing is read. No pointer is null. */
HOSTUTIL_API HostError HostNumberScanRun(const char* text, const char* end, char terminator, double* numbers,
                                         int64_t capacity, int64_t* count, const char** after);

/* Compares two ratios: *order becomes -1, 0 or 1 as a is less than, equal to or greater than b. Exact for
 * all values; HOST_ERR_NUMBER_RANGE when a denominator is 0, and *order is then unchanged. */
HOSTUTIL_API HostError HostRatioCompare(const HostRatio* a, const HostRatio* b, int32_t* order);

#ifdef __cplusplus
}

/* A double as an integer: truncated toward zero, held at the ends of the type's range, NaN as 0. */
inline int32_t TruncateToInt32(double value) {
  if (value >= 2147483647.0) return 2147483647;
  if (value <= -2147483648.0) return -2147483647 - 1;
  return value == value ? static_cast<int32_t>(value) : 0;
}

inline uint32_t TruncateToUInt32(double value) {
  if (value >= 4294967295.0) return 4294967295u;
  return value > 0.0 ? static_cast<uint32_t>(value) : 0u;
}
#endif

#endif
