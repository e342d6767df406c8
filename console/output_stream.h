// Where the console writes: a stdio stream behind a buffer of its own, which
// remembers the first failure of the stream, so that output that was lost is
// never reported as success. Or, for comparing what would be written with an
// expected text, a stream that keeps nothing and only tells whether what was
// written matches it byte for byte.
#pragma once

#include <stddef.h>
#include <stdio.h>

class OutputStream {
 public:
  // Buffered writes to file; flush() hands them on.
  explicit OutputStream(FILE* file);
  // Compares what is written with the length bytes of expected.
  OutputStream(const char* expected, size_t length);
  ~OutputStream();
  OutputStream(const OutputStream&) = delete;
  OutputStream& operator=(const OutputStream&) = delete;

  void write(const char* bytes, size_t count) {
    if (count <= kBufferSize - m_used && m_buffer != nullptr) {
      for (size_t i = 0; i < count; ++i) m_buffer[m_used + i] = bytes[i];
      m_used += count;
    } else {
      writeSlowly(bytes, count);
    }
  }
  OutputStream& operator<<(const char* text);
  OutputStream& operator<<(char c) {
    write(&c, 1);
    return *this;
  }
  OutputStream& operator<<(long long number);
  OutputStream& operator<<(int number) { return *this << static_cast<long long>(number); }

  // Writes out what is buffered and flushes the stream; false once any write failed.
  bool flush();
  // The reason of the first failure (strerror text), or null while there was none.
  const char* failure() const;
  // Comparing: whether everything written so far is the whole expected text.
  bool matches() const { return !m_mismatch && m_compared == m_expectedLength; }

 private:
  static constexpr size_t kBufferSize = 16384;
  void writeSlowly(const char* bytes, size_t count);

  FILE* m_file = nullptr;
  char* m_buffer = nullptr;  // on the heap, for a file
  size_t m_used = 0;
  int m_error = 0;  // errno of the first failure; 0 while there was none
  const char* m_expected = nullptr;
  size_t m_expectedLength = 0;
  size_t m_compared = 0;
  bool m_mismatch = false;
};
