/* "QZGP File Import Manager Suite": which files a plug-in imports, and its callbacks for them. */
#ifndef HOSTAPI_FILEIMPORTMANAGERSUITE_H
#define HOSTAPI_FILEIMPORTMANAGERSUITE_H

#include <assert.h>
#include <stddef.h>

#include "hostapi/HostTypes.h"

#ifdef __cplusplus
extern "C" {
#endif

#define QZGP_FILE_IMPORT_MANAGER_SUITE "QZGP File Import Manager Suite"
#define QZGP_FILE_IMPORT_MANAGER_SUITE_3 3

/* A file type and its creator, each four characters in one integer, the first in the highest byte. */
typedef struct HostImporterType {
  uint32_t type;
  uint32_t creator;
} HostImporterType;

/* A file name extension after its dot, NUL-terminated where it is shorter than four bytes. */
typedef struct HostImporterExtension {
  char text[4];
} HostImporterExtension;

/* Imports the file of that UTF-16 path into the folder. The two pointers between are not read. With a code
 * other than 0 it stopped; what it had made stays. */
typedef HostError (*HostImportCallback)(const HostUTF16Unit* path, void* ignored1, void* ignored2,
                                        VOR_Item* folder);

/* Sets *canImport to 1 when the importer takes the file, else to 0. A failure also sets 0, except a failure
 * to end the silence or to dispose of the file. The middle pointer is not read. */
typedef HostError (*HostVerifyCallback)(const HostUTF16Unit* path, void* ignored, uint8_t* canImport);

/* The callbacks of an importer. The host copies the set. */
typedef struct HostImporterCallbacks {
  void (*none)(void); /* null */
  HostImportCallback import;
  HostVerifyCallback verify;
} HostImporterCallbacks;

typedef struct QZGP_FileImportManagerSuite3 {
  /* Slot 0. Makes an importer under a display name (UTF-8, not empty), which the host copies.
   * Codes: HOST_ERR_BAD_POINTER, HOST_ERR_REGISTRATION. */
  HostError (*RegisterImporterName)(const char* name, HostImporterId* importer);

  /* Slot 1. Says which files the importer is for. The host copies both arrays.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_REGISTRATION. */
  HostError (*RegisterImporterTypes)(HostImporterId importer, int32_t typeCount,
                                     const HostImporterType* types, int32_t extensionCount,
                                     const HostImporterExtension* extensions);

  /* Slot 2. Gives the importer its callbacks. count is 2, the number of callbacks that are not null.
   * Codes: HOST_ERR_BAD_HANDLE, HOST_ERR_BAD_POINTER, HOST_ERR_REGISTRATION. */
  HostError (*RegisterImporterCallbacks)(HostImporterId importer, int32_t count,
                                         const HostImporterCallbacks* callbacks);
} QZGP_FileImportManagerSuite3;

static_assert(sizeof(HostImporterType) == 8, "a type record has 8 bytes");
static_assert(sizeof(HostImporterExtension) == 4, "an extension record has 4 bytes");
static_assert(offsetof(QZGP_FileImportManagerSuite3, RegisterImporterName) == 0 * sizeof(void (*)(void)),
              "slot 0");
static_assert(offsetof(QZGP_FileImportManagerSuite3, RegisterImporterTypes) == 1 * sizeof(void (*)(void)),
              "slot 1");
static_assert(offsetof(QZGP_FileImportManagerSuite3, RegisterImporterCallbacks) == 2 * sizeof(void (*)(void)),
              "slot 2");

#ifdef __cplusplus
}
#endif

#endif
