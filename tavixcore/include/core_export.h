// Marks what the host framework library exports: inside TavixCore it exports,
// everywhere else it imports (Windows) or keeps default visibility (ELF).
// Marks its printf-style functions too.
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

// Lets the compiler check the calls of a printf-style function: its format is
// parameter formatIndex (a member function's object counts as parameter 1),
// and the arguments begin at firstArgument.
#if defined(__GNUC__) || defined(__clang__)
#define TAVIX_PRINTF(formatIndex, firstArgument) \
  __attribute__((format(printf, formatIndex, firstArgument)))
#else
#define TAVIX_PRINTF(formatIndex, firstArgument)
#endif
