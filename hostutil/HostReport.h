/* How a plug-in reports its failures to the host: a standard exception that reaches a callback, which the
 * host shows and turns into a code, and the line of a scene where a failure was found. */
#ifndef HOSTUTIL_HOSTREPORT_H
#define HOSTUTIL_HOSTREPORT_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

/* The kinds of exception that the host distinguishes. */
enum { HOST_EXCEPTION_MEMORY = 1, HOST_EXCEPTION_OTHER = 2 };

/* Shows a message to the user through the reporter that the host has set, and returns the code for the
 * kind: HOST_ERR_EXCEPTION_MEMORY, or for any other HOST_ERR_EXCEPTION_OTHER. The message is the sentence of
 * the code, then ": " and `what`, unless that is null or empty; it is cut at 1023 bytes, and bytes that are
 * no UTF-8 are U+FFFD. Nothing is allocated. */
HOSTUTIL_API HostError HostTranslateAndReport(int32_t kind, const char* what);

/* Notes the line of the scene, from 1, of the failure that the callback is about to return with that code.
 * The host may show it beside the code; it has no other effect. The last note counts. Cannot fail, not even
 * in a rehearsal. */
HOSTUTIL_API void HostNoteLine(HostError code, int64_t line);

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
