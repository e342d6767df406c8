// A growable run of bytes, for what the host string cannot hold or should not
// be rebuilt for: a line as read (it may carry a NUL byte until the line
// parser refuses it) and a word while its escapes are decoded.
#pragma once

#include <stddef.h>

class ByteBuffer {
 public:
  ByteBuffer() : m_data(nullptr), m_size(0), m_capacity(0) {}
  ~ByteBuffer();
  ByteBuffer(const ByteBuffer&) = delete;
  ByteBuffer& operator=(const ByteBuffer&) = delete;

  // The bytes, always followed by a NUL that size() does not count.
  const char* data() const { return m_data == nullptr ? "" : m_data; }
  size_t size() const { return m_size; }

  // Appends; throws OutOfMemory when the buffer cannot grow, keeping what it held.
  void append(const char* bytes, size_t count);
  void append(char c) { append(&c, 1); }
  // Drops the first count bytes (all of them when count >= size()).
  void dropFront(size_t count);
  // Forgets the bytes and keeps the memory for reuse.
  void clear();
  // Forgets the bytes and returns the memory.
  void release();

 private:
  char* m_data;
  size_t m_size;
  size_t m_capacity;  // bytes usable, the NUL not counted
};
