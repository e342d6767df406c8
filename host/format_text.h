// Inside TavixCore only: printf-style formatting into a standard string.
#pragma once

#include <stdarg.h>

#include <string>

// The formatted text; empty for a null format or a format that fails to expand.
std::string formatText(const char* format, va_list arguments);
