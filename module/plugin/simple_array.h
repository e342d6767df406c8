// A growable array of plain elements, grown linearly by its grow step, with
// its buffer on the general heap. It owns the buffer, not what the elements
// point to.
#pragma once

#include <limits.h>
#include <stdlib.h>
#include <string.h>

// Thrown, as a const char*, when the buffer cannot grow.
constexpr const char* kSimpleArrayOutOfMemory = "E1224: Out of memory in TSimpleArray::addSpace";

template <class T>
class TSimpleArray {
 public:
  explicit TSimpleArray(int growStep)
      : m_flags(0), m_count(0), m_capacity(0), m_growStep(growStep), m_buffer(nullptr) {}
  TSimpleArray(const TSimpleArray&) = delete;
  TSimpleArray& operator=(const TSimpleArray&) = delete;

  virtual ~TSimpleArray() {
    if (m_buffer != nullptr) free(m_buffer);
  }

  // Appends value unchanged and returns true. When the heap has no room, throws
  // kSimpleArrayOutOfMemory and keeps its elements, count and buffer.
  bool add(T value) {
    if (m_count >= m_capacity) addSpace();
    m_buffer[m_count] = value;
    ++m_count;
    return true;
  }

  int count() const { return m_count; }
  int capacity() const { return m_capacity; }
  // The element at index, or a value-initialised T (null) outside 0..count-1.
  T at(int index) const { return (index >= 0 && index < m_count) ? m_buffer[index] : T(); }

 private:
  void addSpace() {
    const int step = m_growStep > 0 ? m_growStep : 1;
    if (m_capacity > INT_MAX - step) throw kSimpleArrayOutOfMemory;
    const int capacity = m_capacity + step;
    T* buffer = static_cast<T*>(malloc(sizeof(T) * static_cast<size_t>(capacity)));
    if (buffer == nullptr) throw kSimpleArrayOutOfMemory;
    if (m_count > 0) memcpy(buffer, m_buffer, sizeof(T) * static_cast<size_t>(m_count));
    if (m_buffer != nullptr) free(m_buffer);
    m_buffer = buffer;
    m_capacity = capacity;
  }

  unsigned char m_flags;  // 0; kept for the host's layout, never read
  int m_count;
  int m_capacity;
  int m_growStep;
  T* m_buffer;
};
