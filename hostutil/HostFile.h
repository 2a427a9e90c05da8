/* Files of the host: one object per path, read whole or in parts.
 *
 * Ownership: the caller of HostFileCreate owns the object until HostFileDispose; the library frees what is
 * left when the host releases its leftovers. No operation takes a null object, a null pointer or an object
 * that it did not make or that was disposed of: HOST_ERR_UTILITY_NULL. What an operation hands out is null or
 * 0 when it fails.
 */
#ifndef HOSTUTIL_HOSTFILE_H
#define HOSTUTIL_HOSTFILE_H

#include "hostapi/HostTypes.h"
#include "hostutil/Export.h"
#include "hostutil/UTF16String.h"

#ifdef __cplusplus
extern "C" {
#endif

typedef struct HostFile HostFile;

/* The one mode of HostFileOpen. */
#define HOST_FILE_READ 1

/* Makes a file object for a path, whose units it copies. The file itself is not touched.
 * HOST_ERR_TEXT_MEMORY when there is no memory. A null object with code 0 is a failure too: it happens when a
 * rehearsal makes the call do nothing. */
HOSTUTIL_API HostError HostFileCreate(const UTF16String* path, HostFile** file);

/* Opens the file. Only a regular file opens: what would have to be waited for (a FIFO) or cannot be read
 * (a directory) is HOST_ERR_FILE_OPEN at once, and so is another mode. A file that is open already is
 * HOST_ERR_FILE_STATE. */
HOSTUTIL_API HostError HostFileOpen(HostFile* file, int32_t mode);

/* Hands out the size in bytes, 0 to 2^31 - 1. A file that is larger, or no regular file, is
 * HOST_ERR_FILE_SIZE. The file need not be open. */
HOSTUTIL_API HostError HostFileSize(HostFile* file, int64_t* size);

/* Reads exactly count bytes (0 or more) on from where the last read ended. HOST_ERR_FILE_SHORT_READ when
 * the file ends before, on any failure of the system, and for a negative count; the buffer then holds what
 * came. HOST_ERR_FILE_STATE when the file is not open. */
HOSTUTIL_API HostError HostFileRead(HostFile* file, int64_t count, void* buffer);

/* Closes the file. A file that is not open is closed already: success. HOST_ERR_FILE_CLOSE when the system
 * reports a failure; the file is closed all the same, and can be opened again. */
HOSTUTIL_API HostError HostFileClose(HostFile* file);

/* Hands out the last component of the path: what follows its last "/". The caller owns one reference to the
 * text. HOST_ERR_TEXT_MEMORY when there is no memory. */
HOSTUTIL_API HostError HostFileName(HostFile* file, UTF16String** name);

/* Closes the file if it is open and ends the object. HOST_ERR_FILE_CLOSE as above; the object is ended all
 * the same. */
HOSTUTIL_API HostError HostFileDispose(HostFile* file);

#ifdef __cplusplus
}
#endif

#endif
