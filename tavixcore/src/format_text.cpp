#include "format_text.h"

#include <stdio.h>

void formatInto(HString& text, const char* format, va_list arguments) {
  // The arguments may point into text itself: it changes only at the end.
  if (format == nullptr) {
    text.Empty();
    return;
  }
  // Most texts fit a buffer on the stack, formatted in one pass; a longer
  // one is formatted again into a heap buffer of its size.
  char local[256];
  va_list again;
  va_copy(again, arguments);
  const int needed = vsnprintf(local, sizeof(local), format, arguments);
  if (needed < 0) {
    text.Empty();
  } else if (static_cast<size_t>(needed) < sizeof(local)) {
    text = local;
  } else {
    struct Buffer {
      char* bytes;
      ~Buffer() { delete[] bytes; }
    } buffer{new char[static_cast<size_t>(needed) + 1]};
    vsnprintf(buffer.bytes, static_cast<size_t>(needed) + 1, format, again);
    text = buffer.bytes;
  }
  va_end(again);
}

void logFormatted(LogLevel level, const char* format, va_list arguments) {
  HString message;
  formatInto(message, format, arguments);
  logMessage(level, message.GetStr());
}
