/* The host's localised strings, and the texts built from them.
 *
 * A table has a name and entries "key=default text". What is looked up is the host's translation of the
 * key, or the default text. All texts are NUL-terminated UTF-8.
 */
#ifndef HOSTUTIL_HOSTSTRINGS_H
#define HOSTUTIL_HOSTSTRINGS_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

/* A registered table. Lives until it is unregistered. */
typedef struct HostStringTable HostStringTable;

/* Registers a table of `count` entries, which the library copies; the key of an entry ends at its first "=".
 * HOST_ERR_STRING_TABLE when an entry has no "=", a table of that name is registered already, the count is
 * negative, or there is no memory; HOST_ERR_UTILITY_NULL for a null pointer. *table is then null. */
HOSTUTIL_API HostError HostRegisterStringTable(const char* name, const char* const* entries, int32_t count,
                                               HostStringTable** table);

/* Ends the table. Null is accepted and does nothing; another table that is not registered is
 * HOST_ERR_UTILITY_NULL. */
HOSTUTIL_API HostError HostUnregisterStringTable(HostStringTable* table);

/* The text of entry `id` (from 0). Never null: "" when there is no such entry or no table. It lives as long
 * as the table, and until the host changes its translations. */
HOSTUTIL_API const char* HostLocalizedString(const HostStringTable* table, int32_t id);

/* Copies a text into a buffer of `capacity` bytes, the NUL included. HOST_ERR_TEXT_TOO_LONG when it does
 * not fit; the buffer then holds "". HOST_ERR_UTILITY_NULL for a null pointer. The two do not overlap. */
HOSTUTIL_API HostError HostStringCopy(char* buffer, int64_t capacity, const char* text);

/* Copies a pattern into the buffer with every "^^1" and "^^2" replaced by the argument of that number. What
 * an argument holds is not searched for markers; a null argument counts as "". Codes as above. */
HOSTUTIL_API HostError HostStringFormat(char* buffer, int64_t capacity, const char* pattern,
                                        const char* argument1, const char* argument2);

#ifdef __cplusplus
}
#endif

#endif
