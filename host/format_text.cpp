#include "format_text.h"

#include <cstdio>
#include <vector>

void formatInto(HString& text, const char* format, va_list arguments) {
  // The arguments may point into text itself: it changes only at the end.
  int needed = 0;
  if (format != nullptr) {
    va_list measuring;
    va_copy(measuring, arguments);
    needed = std::vsnprintf(nullptr, 0, format, measuring);
    va_end(measuring);
  }
  if (needed <= 0) {
    text.Empty();
    return;
  }
  std::vector<char> buffer(static_cast<size_t>(needed) + 1);
  std::vsnprintf(buffer.data(), buffer.size(), format, arguments);
  text = buffer.data();
}

void logFormatted(LogLevel level, const char* format, va_list arguments) {
  HString message;
  formatInto(message, format, arguments);
  logMessage(level, message.GetStr());
}
