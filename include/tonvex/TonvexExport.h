// Export macro of the Tonvex shared library, and the language check that every
// public header passes through.
//
// The library is compiled with hidden visibility; only declarations marked
// TONVEX_API are visible to programs that load it.
#ifndef TONVEX_EXPORT_H
#define TONVEX_EXPORT_H

// The headers use C++17 (the _v type traits among others). An
// older language mode would fail deep inside them; say what is needed instead.
#if defined(_MSVC_LANG)
#define TONVEX_CPLUSPLUS _MSVC_LANG
#else
#define TONVEX_CPLUSPLUS __cplusplus
#endif
#if TONVEX_CPLUSPLUS < 201703L
#error "Tonvex needs C++17 or later: compile with -std=c++17 (or newer)"
#endif
#undef TONVEX_CPLUSPLUS

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
