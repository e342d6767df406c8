// The host's growable array: a count and contiguous elements. Arguments reach
// a command as TArray<Variable>, given options as TArray<CommandOption>.
// Elements must move without throwing.
#pragma once

#include <stdlib.h>

#include "out_of_memory.h"
#include "relocatable.h"

template <class T>
class TArray {
 public:
  explicit TArray(int growStep = 8)
      : m_flags(0), m_count(0), m_capacity(0), m_growStep(growStep), m_buffer(nullptr) {}
  TArray(const TArray&) = delete;
  TArray& operator=(const TArray&) = delete;

  virtual ~TArray() {
    destroy(0, m_count);
    free(m_buffer);
  }

  // Removes up to n elements from index on and closes the gap. Arguments
  // outside the array are clamped to what exists: an index outside
  // 0..count-1 or an n below 1 removes nothing, and elements before index
  // are never touched.
  virtual void removeAt(int index, int n) {
    if (index < 0 || index >= m_count || n <= 0) return;
    const int removed = n < m_count - index ? n : m_count - index;
    for (int i = index; i < m_count - removed; ++i)
      m_buffer[i] = static_cast<T&&>(m_buffer[i + removed]);
    destroy(m_count - removed, m_count);
    m_count -= removed;
  }

  // Removes every element; the buffer stays for reuse.
  virtual void removeAll() {
    destroy(0, m_count);
    m_count = 0;
  }

  // Appends value, moved into place. Growth adds the grow step to an empty
  // array and at least doubles after that, so n appends move O(n) elements
  // in all; elements of a relocatable type do not move at all where the heap
  // can grow the buffer in place. When growing fails, the array keeps its
  // elements and buffer.
  void add(T value) {
    if (m_count >= m_capacity) grow();
    new (m_buffer + m_count) T(static_cast<T&&>(value));
    ++m_count;
  }

  int count() const { return m_count; }
  int capacity() const { return m_capacity; }
  int growStep() const { return m_growStep; }

  // Elements 0..count-1; callers check the index against count().
  const T& operator[](int index) const { return m_buffer[index]; }
  T& operator[](int index) { return m_buffer[index]; }

 private:
  void destroy(int from, int to) {
    for (int i = from; i < to; ++i) m_buffer[i].~T();
  }

  void grow() {
    const long long step = m_growStep > 0 ? m_growStep : 1;
    long long capacity = m_capacity + step;
    if (capacity < 2LL * m_capacity) capacity = 2LL * m_capacity;
    const long long limit = 0x7fffffff;
    if (capacity > limit) capacity = limit;
    if (capacity <= m_count) throw OutOfMemory();
    // Only the slots in use hold elements; the rest of the buffer is raw.
    const size_t bytes = sizeof(T) * static_cast<size_t>(capacity);
    void* buffer = nullptr;
    if constexpr (IsRelocatable<T>::value) {
      buffer = realloc(static_cast<void*>(m_buffer), bytes);
      if (buffer == nullptr) throw OutOfMemory();
    } else {
      buffer = malloc(bytes);
      if (buffer == nullptr) throw OutOfMemory();
      for (int i = 0; i < m_count; ++i) {
        new (static_cast<T*>(buffer) + i) T(static_cast<T&&>(m_buffer[i]));
        m_buffer[i].~T();
      }
      free(m_buffer);
    }
    m_buffer = static_cast<T*>(buffer);
    m_capacity = static_cast<int>(capacity);
  }

 protected:
  unsigned char m_flags;  // 0; kept for the host's layout, never read
  int m_count;
  int m_capacity;
  int m_growStep;
  T* m_buffer;
};
