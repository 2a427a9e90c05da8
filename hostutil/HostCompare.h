/* Comparison without regard to case. Only the letters A to Z are folded, whatever the locale. */
#ifndef HOSTUTIL_HOSTCOMPARE_H
#define HOSTUTIL_HOSTCOMPARE_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

/* Compares two NUL-terminated texts by their bytes: -1, 0 or 1. Null counts as "". */
HOSTUTIL_API int32_t HostCompareNoCase(const char* a, const char* b);

#ifdef __cplusplus
}

/* The lower-case form of one byte. */
inline unsigned char FoldCase(unsigned char byte) {
  return byte >= 'A' && byte <= 'Z' ? static_cast<unsigned char>(byte | 0x20) : byte;
}
#endif

#endif
