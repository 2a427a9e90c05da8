/* Marks the functions that the utility library exports. */
#ifndef HOSTUTIL_EXPORT_H
#define HOSTUTIL_EXPORT_H

#if defined(__GNUC__)
#define HOSTUTIL_API __attribute__((visibility("default")))
#else
#define HOSTUTIL_API
#endif

#endif
