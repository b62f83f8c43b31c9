#pragma once

/// Marks what leaves the library. Everything else is hidden.
#if defined(_WIN32)
#if defined(VRL_BUILDING)
#define VRL_API __declspec(dllexport)
#else
#define VRL_API __declspec(dllimport)
#endif
#else
#define VRL_API __attribute__((visibility("default")))
#endif
