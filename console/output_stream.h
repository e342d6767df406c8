// Where the console writes: a stdio stream behind a buffer of its own, or
// memory. It remembers the first failure of the stream, so that output that
// was lost is never reported as success.
#pragma once

#include <stddef.h>
#include <stdio.h>

#include "byte_buffer.h"

class OutputStream {
 public:
  // Buffered writes to file; flush() hands them on.
  explicit OutputStream(FILE* file) : m_file(file), m_used(0), m_error(0) {}
  // Collects what is written, for text().
  OutputStream() : m_file(nullptr), m_used(0), m_error(0) {}
  ~OutputStream() { flush(); }
  OutputStream(const OutputStream&) = delete;
  OutputStream& operator=(const OutputStream&) = delete;

  void write(const char* bytes, size_t count) {
    if (m_file != nullptr && count <= sizeof(m_buffer) - m_used) {
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

  // In memory: what was written since the last clear().
  const char* text() const { return m_memory.data(); }
  size_t size() const { return m_memory.size(); }
  void clear() { m_memory.clear(); }

 private:
  void writeSlowly(const char* bytes, size_t count);

  FILE* m_file;
  ByteBuffer m_memory;
  char m_buffer[16384];
  size_t m_used;
  int m_error;  // errno of the first failure; 0 while there was none
};
