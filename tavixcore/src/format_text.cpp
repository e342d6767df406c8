#include "format_text.h"

#include <stdio.h>

FormattedText::FormattedText(const char* format, va_list arguments) {
  if (format == nullptr) return;
  // Most texts fit the local buffer, formatted in one pass; a longer one is
  // formatted again into a heap buffer of its size.
  va_list again;
  va_copy(again, arguments);
  const ArgumentsEnd endAgain(again);
  const int needed = vsnprintf(m_local, sizeof(m_local), format, arguments);
  if (needed < 0) return;
  if (static_cast<size_t>(needed) < sizeof(m_local)) {
    m_text = m_local;
    return;
  }
  m_heap = new char[static_cast<size_t>(needed) + 1];
  vsnprintf(m_heap, static_cast<size_t>(needed) + 1, format, again);
  m_text = m_heap;
}

FormattedText::~FormattedText() {
  delete[] m_heap;
}
