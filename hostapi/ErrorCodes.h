/* Every code that can cross the border, in one table: name, number, and what it means to a person.
 *
 * A name becomes the enumerator HOST_ERR_<name>. The numbers are fixed: they are stored in bug reports
 * and compared by scripts.
 */
#ifndef HOSTAPI_ERRORCODES_H
#define HOSTAPI_ERRORCODES_H

/* clang-format off */
#define HOST_ERROR_TABLE(ENTRY)                                                                             \
  /* What the importer itself returns. */                                                                   \
  ENTRY(NULL_ARGUMENT,             3, "a callback was given a null pointer where it needs an object")       \
  ENTRY(MISSING_SUITE,            13, "the host does not offer a suite that the importer needs")            \
  ENTRY(MAYA_SYNTAX,         1289985, "the scene holds a character that cannot start a word there")         \
  ENTRY(MAYA_UNEXPECTED_END, 1289986, "the scene ends inside a string, a comment, a word or a command")     \
  ENTRY(MAYA_KEY_COUNTS,     1289987, "the animated channels of a node have different numbers of keys; bake the scene first") \
  /* The host's utility services. */                                                                        \
  ENTRY(NUMBER_SYNTAX,          2001, "a text that should be a number is not one")                          \
  ENTRY(NUMBER_RANGE,           2002, "a number is too large to be held")                                   \
  ENTRY(LIST_MEMORY,            2011, "a list could not grow: the memory is exhausted")                     \
  ENTRY(LIST_INDEX,             2012, "a list was asked for a record that it does not hold")                \
  ENTRY(LIST_LOCKED,            2013, "a list was asked to grow while one of its records is locked")        \
  ENTRY(FILE_OPEN,              2021, "the file cannot be opened, or is not a regular file")                \
  ENTRY(FILE_SHORT_READ,        2022, "the file ended, or could not be read, before all bytes were there")  \
  ENTRY(FILE_SIZE,              2023, "the file's size is not known, or is 2 GiB or more")                  \
  ENTRY(FILE_CLOSE,             2024, "the file could not be closed")                                       \
  ENTRY(FILE_STATE,             2025, "a file service was used on a file in the wrong state")               \
  ENTRY(MATRIX_NOT_FINITE,      2031, "a matrix holds a value that is not finite")                          \
  ENTRY(TEXT_TOO_LONG,          2041, "a text does not fit its buffer")                                     \
  ENTRY(TEXT_MEMORY,            2042, "a text could not be made: the memory is exhausted")                  \
  ENTRY(STRING_TABLE,           2043, "a table of localised strings could not be registered")               \
  ENTRY(EXCEPTION_MEMORY,       2051, "the memory is exhausted")                                            \
  ENTRY(EXCEPTION_OTHER,        2052, "an unexpected failure inside the importer or the host")              \
  ENTRY(UTILITY_NULL,           2061, "a utility service was given a null pointer or a handle that it does not know") \
  /* What the embedded host refuses. */                                                                     \
  ENTRY(BAD_HANDLE,             3001, "a null, foreign or stale handle was passed")                         \
  ENTRY(BAD_POINTER,            3002, "a null pointer was passed where a value is read or handed out")      \
  ENTRY(BAD_PLUGIN_ID,          3003, "a plug-in id was passed that is not the caller's")                   \
  ENTRY(BAD_SIZE,               3011, "a composition needs a width and a height of at least 1")             \
  ENTRY(BAD_RATIO,              3012, "a pixel aspect or a frame rate is not positive")                     \
  ENTRY(BAD_TIME,               3013, "a time has scale 0, or a duration is negative")                      \
  ENTRY(BAD_VALUE,              3014, "a value is not finite")                                              \
  ENTRY(BAD_FILM_SIZE,          3015, "a film size is not positive")                                        \
  ENTRY(BAD_DIRECTION,          3016, "a film size is measured neither horizontally nor vertically")        \
  ENTRY(NOT_A_FOLDER,           3021, "an item is not a folder")                                            \
  ENTRY(NOT_A_COMP,             3022, "an item is not a composition, or would contain itself")              \
  ENTRY(NOT_A_CAMERA,           3023, "a layer is not a camera layer")                                      \
  ENTRY(NO_SUCH_STREAM,         3024, "a layer has no stream of that kind")                                 \
  ENTRY(WRONG_COMP,             3025, "two layers are not of one composition")                              \
  ENTRY(PARENT_CIRCLE,          3026, "a parent would make a circle")                                       \
  ENTRY(BATCH_OPEN,             3027, "the stream already has an open batch")                               \
  ENTRY(BATCH_KEY,              3028, "a batch holds no key of that index, or the stream is not the batch's") \
  ENTRY(BAD_TIME_MODE,          3029, "a time mode is not 0")                                               \
  ENTRY(MEMORY,                 3031, "the host cannot allocate the memory")                                \
  ENTRY(MEMORY_STATE,           3032, "a memory handle was unlocked more often than it was locked") \
  ENTRY(BAD_MEMORY_SIZE,        3033, "a memory handle was asked for with a negative size or unknown flags") \
  ENTRY(TOO_MANY_LAYERS,        3034, "the host holds as many layers as its limit allows")                       \
  ENTRY(TOO_MANY_KEYS,          3035, "the host holds as many keys as its limit allows")                         \
  ENTRY(TOO_MUCH_MEMORY,        3036, "the importer asks for more memory than the host's limit allows")           \
  ENTRY(SILENT_ERRORS,          3041, "silent errors were ended that had not begun, or with another state record") \
  ENTRY(REGISTRATION,           3051, "an importer was registered with a wrong name, count or callback set") \
  ENTRY(SUITE_REFUSED,          3061, "the suite is not offered in that version")                           \
  ENTRY(SUITE_NOT_HELD,         3062, "a suite was released that had not been acquired")
/* clang-format on */

enum {
#define HOST_ERROR_ENUMERATOR(name, number, sentence) HOST_ERR_##name = number,
  HOST_ERROR_TABLE(HOST_ERROR_ENUMERATOR)
#undef HOST_ERROR_ENUMERATOR
      HOST_ERR_NONE = 0
};

#endif
