// Inside TavixCore only: printf-style formatting for the string class and the log.
#pragma once

#include <stdarg.h>
#include <stddef.h>

// Ends a va_list on every way out of the function that started it, an
// exception included.
class ArgumentsEnd {
 public:
  explicit ArgumentsEnd(va_list& list) : m_list(list) {}
  ~ArgumentsEnd() { va_end(m_list); }
  ArgumentsEnd(const ArgumentsEnd&) = delete;
  ArgumentsEnd& operator=(const ArgumentsEnd&) = delete;

 private:
  va_list& m_list;
};

// A printf-style text, formatted once: in a buffer of its own when it fits,
// on the heap when it is longer. Empty for a null format or a format that
// fails to expand; a NUL written by %c ends the text.
class FormattedText {
 public:
  FormattedText(const char* format, va_list arguments);
  ~FormattedText();
  FormattedText(const FormattedText&) = delete;
  FormattedText& operator=(const FormattedText&) = delete;

  const char* text() const { return m_text; }

 private:
  char m_local[256];
  char* m_heap = nullptr;
  const char* m_text = "";
};
