#include "output_stream.h"

#include <errno.h>
#include <string.h>

OutputStream::OutputStream(FILE* file) : m_file(file), m_buffer(new char[kBufferSize]) {}

OutputStream::OutputStream(const char* expected, size_t length)
    : m_expected(expected), m_expectedLength(length) {}

OutputStream::~OutputStream() {
  flush();
  delete[] m_buffer;
}

void OutputStream::writeSlowly(const char* bytes, size_t count) {
  if (m_file == nullptr) {
    if (count == 0) return;
    m_mismatch = m_mismatch || count > m_expectedLength - m_compared ||
                 memcmp(m_expected + m_compared, bytes, count) != 0;
    if (!m_mismatch) m_compared += count;
    return;
  }
  flush();
  if (count > kBufferSize) {
    errno = 0;
    if (m_error == 0 && fwrite(bytes, 1, count, m_file) != count) m_error = errno ? errno : EIO;
    return;
  }
  memcpy(m_buffer, bytes, count);
  m_used = count;
}

OutputStream& OutputStream::operator<<(const char* text) {
  write(text, strlen(text));
  return *this;
}

OutputStream& OutputStream::operator<<(long long number) {
  char digits[24];
  const int length = snprintf(digits, sizeof(digits), "%lld", number);
  write(digits, static_cast<size_t>(length));
  return *this;
}

bool OutputStream::flush() {
  if (m_file == nullptr) return true;
  // After a failure nothing more is written: what follows would have a gap before it.
  errno = 0;
  if (m_error == 0 && m_used > 0 && fwrite(m_buffer, 1, m_used, m_file) != m_used) {
    m_error = errno ? errno : EIO;
  }
  m_used = 0;
  errno = 0;
  if (m_error == 0 && fflush(m_file) != 0) m_error = errno ? errno : EIO;
  return m_error == 0;
}

const char* OutputStream::failure() const {
  return m_error == 0 ? nullptr : strerror(m_error);
}
