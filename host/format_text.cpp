#include "format_text.h"

#include <stdio.h>

void formatInto(HString& text, const char* format, va_list arguments) {
  // The arguments may point into text itself: it changes only at the end.
  int needed = 0;
  if (format != nullptr) {
    va_list measuring;
    va_copy(measuring, arguments);
    needed = vsnprintf(nullptr, 0, format, measuring);
    va_end(measuring);
  }
  if (needed <= 0) {
    text.Empty();
    return;
  }
  struct Buffer {
    char* bytes;
    ~Buffer() { delete[] bytes; }
  } buffer{new char[static_cast<size_t>(needed) + 1]};
  vsnprintf(buffer.bytes, static_cast<size_t>(needed) + 1, format, arguments);
  text = buffer.bytes;
}

void logFormatted(LogLevel level, const char* format, va_list arguments) {
  HString message;
  formatInto(message, format, arguments);
  logMessage(level, message.GetStr());
}
