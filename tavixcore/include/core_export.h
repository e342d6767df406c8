// Marks what the host framework library exports. Inside TavixCore it exports,
// everywhere else it imports (Windows) or keeps default visibility (ELF).
#pragma once

#if defined(_WIN32)
#if defined(TAVIXCORE_BUILDING)
#define TAVIXCORE_API __declspec(dllexport)
#else
#define TAVIXCORE_API __declspec(dllimport)
#endif
#else
#define TAVIXCORE_API __attribute__((visibility("default")))
#endif
