// Where the host's log messages go. A host or a test installs a sink to
// receive each error, warning and info message with its level; without one,
// messages go to standard error, each prefixed with "error: ", "warning: " or
// "info: ".
#pragma once

#include "core_export.h"

enum class LogLevel { Error = 0, Warning = 1, Info = 2 };

typedef void (*LogSinkFn)(LogLevel level, const char* message, void* context);

// Installs sink (null restores standard error); context is handed back on each call.
TAVIXCORE_API void setLogSink(LogSinkFn sink, void* context);

// Sends one finished message to the current sink.
TAVIXCORE_API void logMessage(LogLevel level, const char* message);

// The name of a level as the default sink writes it: "error", "warning", "info".
TAVIXCORE_API const char* logLevelName(LogLevel level);
