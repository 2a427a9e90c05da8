/* What becomes of a standard exception that reaches a callback: the host shows it and names a code. */
#ifndef HOSTUTIL_HOSTREPORT_H
#define HOSTUTIL_HOSTREPORT_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

/* The kinds of exception that the host tells apart. */
enum { HOST_EXCEPTION_MEMORY = 1, HOST_EXCEPTION_OTHER = 2 };

/* Shows a message to the user through the reporter that the host has set, and returns the code for the
 * kind: HOST_ERR_EXCEPTION_MEMORY, or for any other HOST_ERR_EXCEPTION_OTHER. The message is the sentence of
 * the code, then ": " and `what`, unless that is null or empty; it is cut at 1023 bytes, and bytes that are
 * no UTF-8 are U+FFFD. Nothing is allocated. */
HOSTUTIL_API HostError HostTranslateAndReport(int32_t kind, const char* what);

#ifdef __cplusplus
}

#include <exception>
#include <new>

inline HostError TranslateAndReport(const std::exception& exception) {
  const bool memory = dynamic_cast<const std::bad_alloc*>(&exception) != nullptr;
  return HostTranslateAndReport(memory ? HOST_EXCEPTION_MEMORY : HOST_EXCEPTION_OTHER, exception.what());
}
#endif

#endif
