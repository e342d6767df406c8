// Inside TavixCore only: printf-style formatting for the string class and the log.
#pragma once

#include <stdarg.h>

#include "hstring.h"
#include "log_sink.h"

// text becomes the formatted text; empty for a null format or a format that
// fails to expand. A NUL written by %c ends the text.
void formatInto(HString& text, const char* format, va_list arguments);

// Formats a printf-style message and sends it to the log sink at level.
void logFormatted(LogLevel level, const char* format, va_list arguments);
