/* The host's reference-counted texts of 16-bit units: file names and composition names.
 *
 * Ownership: every operation that hands out a text gives the caller one reference, given back with
 * UTF16StringRelease. A text never changes. Bytes that are not valid UTF-8 become the lone surrogates
 * U+DC80 to U+DCFF, one for each byte, and become the same bytes again where a text is used as a path. An
 * operation that fails hands out null: HOST_ERR_TEXT_MEMORY when there is no memory, HOST_ERR_UTILITY_NULL
 * for a null pointer where none is allowed.
 */
#ifndef HOSTUTIL_UTF16STRING_H
#define HOSTUTIL_UTF16STRING_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef struct UTF16String UTF16String;

/* Makes a text from NUL-terminated units. */
HOSTUTIL_API HostError UTF16StringMakeFromUnits(const HostUTF16Unit* units, UTF16String** text);

/* Makes a text from NUL-terminated UTF-8. */
HOSTUTIL_API HostError UTF16StringMakeFromBytes(const char* bytes, UTF16String** text);

/* Makes a text from a pattern (UTF-8) in which every "^^1" and "^^2" is replaced by the argument of that
 * number. What an argument holds is not searched for markers; a null argument counts as the empty text. */
HOSTUTIL_API HostError UTF16StringFormat(const char* pattern, const UTF16String* argument1,
                                         const UTF16String* argument2, UTF16String** text);

/* Removes the extension: with flag 1 (any but 0), the last "." of the text and what follows it (".ma" becomes
 * the empty text, a text without "." stays as it is); with flag 0, nothing. Hands out a new text. A null text
 * counts as the empty one. */
HOSTUTIL_API HostError HostStripExtension(const UTF16String* text, int32_t flag, UTF16String** stripped);

/* The units, NUL-terminated. Never null; they live as long as the text. A null text counts as the empty one.
 */
HOSTUTIL_API const HostUTF16Unit* UTF16StringUnits(const UTF16String* text);

/* The number of units before the NUL; 0 for a null text. */
HOSTUTIL_API int64_t UTF16StringLength(const UTF16String* text);

/* Adds a reference; gives one back, the last of which frees the text. Null is accepted and does nothing. */
HOSTUTIL_API void UTF16StringRetain(UTF16String* text);
HOSTUTIL_API void UTF16StringRelease(UTF16String* text);

#ifdef __cplusplus
}

#include <memory>

struct UTF16StringReleaser {
  void operator()(UTF16String* text) const { UTF16StringRelease(text); }
};

/* Owns one reference. */
using UTF16Handle = std::unique_ptr<UTF16String, UTF16StringReleaser>;
#endif

#endif
