/* The host's own side of the utility services: what it sets up before it calls a plug-in, and the ledger that
 * it reads afterwards. Plug-ins do not use it. The services have one state, for the host and all its modules;
 * they are for one thread at a time.
 */
#ifndef HOSTUTIL_HOSTSETUP_H
#define HOSTUTIL_HOSTSETUP_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

/* --- Translations ------------------------------------------------------------------------------- */

/* From here on a look-up of the key gives this text, in tables that are registered already too. Both are
 * copied. HOST_ERR_UTILITY_NULL for a null pointer, HOST_ERR_TEXT_MEMORY when there is no memory. */
HOSTUTIL_API HostError HostSetTranslation(const char* key, const char* text);
HOSTUTIL_API void HostClearTranslations(void);

/* --- Reporter ----------------------------------------------------------------------------------- */

/* Called by HostTranslateAndReport with the text to show (UTF-8, never null, valid during the call) and the
 * code. It must not throw. */
typedef void (*HostReporter)(void* context, HostError code, const char* text);

/* Null as the reporter: nothing is shown. */
HOSTUTIL_API void HostSetReporter(HostReporter reporter, void* context);

/* The line that HostNoteLine noted last, when it was for that code; else 0. The note is gone afterwards. */
HOSTUTIL_API int64_t HostTakeNotedLine(HostError code);

/* --- Ledger ------------------------------------------------------------------------------------- */

enum { HOST_LEDGER_FILE = 1, HOST_LEDGER_LIST = 2 };

/* Called once for each object that is still held, in the order in which they were made. `description` is
 * one line of UTF-8, valid during the call: control characters in a path are written as \uXXXX.
 * releaseFailed is 1 when a rehearsal made the object's own release fail, also with code 0. The visitor must
 * not make or end an object. */
typedef void (*HostLedgerVisitor)(void* context, int32_t kind, const char* description,
                                  int32_t releaseFailed);

HOSTUTIL_API void HostVisitLedger(HostLedgerVisitor visitor, void* context);

/* Frees every object that is still held, even if something still refers to it: files (open ones are closed),
 * lists and texts. String tables stay. */
HOSTUTIL_API void HostReleaseLeftovers(void);

/* --- Failure rehearsal -------------------------------------------------------------------------- */

/* The services that can be made to fail, with the names by which a user asks for them. */
/* clang-format off */
#define HOST_UTILITY_TABLE(ENTRY)                                                          \
  ENTRY(FileCreate) ENTRY(FileOpen) ENTRY(FileRead) ENTRY(FileClose) ENTRY(FileSize)       \
  ENTRY(FileName) ENTRY(FileDispose) ENTRY(StripExtension) ENTRY(RegisterStringTable)      \
  ENTRY(ListCreate) ENTRY(ListAppend) ENTRY(ListGet) ENTRY(ListLock) ENTRY(ListUnlock)     \
  ENTRY(ListCount) ENTRY(StringMake) ENTRY(StringCopy) ENTRY(StringFormat)                 \
  ENTRY(NumberScan) ENTRY(MatrixSetIdentity) ENTRY(MatrixTranslate) ENTRY(MatrixScale)     \
  ENTRY(MatrixRotateAxis) ENTRY(MatrixDecompose) ENTRY(RatioCompare)
/* clang-format on */

enum {
#define HOST_UTILITY_ENUMERATOR(name) HOST_UTILITY_##name,
  HOST_UTILITY_TABLE(HOST_UTILITY_ENUMERATOR)
#undef HOST_UTILITY_ENUMERATOR
      HOST_UTILITY_COUNT
};

enum {
  HOST_THROW_NOTHING = 0,
  HOST_THROW_BAD_ALLOC = 1,
  HOST_THROW_RUNTIME_ERROR = 2,
  HOST_THROW_OTHER = 3 /* an exception that only catch (...) catches */
};

/* One failure to rehearse. The nth call (from 1; 0 is every call) of the service does nothing, hands out
 * null or zero and returns the code (which may be 0), or throws: std::bad_alloc,
 * std::runtime_error("rehearsed failure"), or an exception that only catch (...) catches. Handed out as zero
 * are also a text in a buffer (it becomes ""), the bytes of a read, a number scanned, and the matrix of
 * MatrixSetIdentity. What a call changes in place stays as it is: the record of RecordListGet, and the
 * matrices of the composing calls. */
typedef struct HostUtilityFailure {
  int32_t service; /* HOST_UTILITY_... */
  int64_t nth;
  HostError code;
  int32_t thrown; /* HOST_THROW_... */
} HostUtilityFailure;

/* Adds a failure. It works only while the rehearsal runs. Where several fit a call, the first that was added
 * counts. HOST_ERR_UTILITY_NULL for a null pointer, or a field out of its range; HOST_ERR_EXCEPTION_MEMORY
 * when there is no memory for it. */
HOSTUTIL_API HostError HostAddUtilityFailure(const HostUtilityFailure* failure);
HOSTUTIL_API void HostClearUtilityFailures(void);

/* Starts the rehearsal: every count begins at 0. */
HOSTUTIL_API void HostBeginRehearsal(void);

/* Ends it: from here on nothing is made to fail; the counts stay as they are until the next start. */
HOSTUTIL_API void HostEndRehearsal(void);

/* How often a service was called in the rehearsal that runs or ran last, the calls that were made to fail
 * among them. 0 for an unknown service. */
HOSTUTIL_API int64_t HostUtilityCallCount(int32_t service);

/* --- Memory -------------------------------------------------------------------------------------- */

/* Asks the system for large pages for a block that is about to be filled, which then fills several times as
 * fast. A hint: it does nothing for a small block, for null, and on a system without large pages. */
HOSTUTIL_API void HostAdviseLargePages(void* memory, int64_t size);

/* --- Paths -------------------------------------------------------------------------------------- */

/* Converts the bytes of a path to NUL-terminated units, as UTF16String does. Returns the number of units
 * without the NUL; writes at most `capacity` units, the NUL included, and no character in part. Call with
 * capacity 0 to measure. A null path is the empty one. */
HOSTUTIL_API int64_t HostPathToUnits(const char* path, HostUTF16Unit* units, int64_t capacity);

/* Converts NUL-terminated units to UTF-8 for show: every lone surrogate becomes U+FFFD. Returns the number
 * of bytes without the NUL; writes at most `capacity` bytes, the NUL included, and no character in part. Null
 * units are the empty text. */
HOSTUTIL_API int64_t HostUnitsToShownText(const HostUTF16Unit* units, char* text, int64_t capacity);

#ifdef __cplusplus
}
#endif

#endif
