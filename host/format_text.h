// Inside TavixCore only: printf-style formatting into a standard string.
#pragma once

#include <stdarg.h>

#include <string>

#include "log_sink.h"

// The formatted text; empty for a null format or a format that fails to expand.
std::string formatText(const char* format, va_list arguments);

// Formats a printf-style message and sends it to the log sink at level.
void logFormatted(LogLevel level, const char* format, va_list arguments);
