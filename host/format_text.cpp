#include "format_text.h"

#include <cstdio>

std::string formatText(const char* format, va_list arguments) {
  if (format == nullptr) return std::string();
  va_list measuring;
  va_copy(measuring, arguments);
  const int needed = std::vsnprintf(nullptr, 0, format, measuring);
  va_end(measuring);
  if (needed <= 0) return std::string();
  std::string text(static_cast<size_t>(needed), '\0');
  std::vsnprintf(&text[0], text.size() + 1, format, arguments);
  return text;
}

void logFormatted(LogLevel level, const char* format, va_list arguments) {
  logMessage(level, formatText(format, arguments).c_str());
}
