// Export macro of the Tonvex shared library.
//
// The library is compiled with hidden visibility; only declarations marked
// TONVEX_API are visible to programs that load it.
#ifndef TONVEX_EXPORT_H
#define TONVEX_EXPORT_H

#if defined(_WIN32)
#if defined(TONVEX_BUILDING_LIBRARY)
#define TONVEX_API __declspec(dllexport)
#else
#define TONVEX_API __declspec(dllimport)
#endif
#else
#define TONVEX_API __attribute__((visibility("default")))
#endif

#endif
