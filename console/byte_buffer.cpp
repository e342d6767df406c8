#include "byte_buffer.h"

#include <stdlib.h>
#include <string.h>

#include "out_of_memory.h"

ByteBuffer::~ByteBuffer() {
  free(m_data);
}

void ByteBuffer::append(const char* bytes, size_t count) {
  if (count == 0) return;
  if (count > m_capacity - m_size) {
    // Doubling keeps a run of appends linear in the final size.
    if (count > (static_cast<size_t>(-1) >> 2) - m_size) throw OutOfMemory();
    size_t capacity = m_capacity < 64 ? 64 : m_capacity * 2;
    if (capacity < m_size + count) capacity = m_size + count;
    char* grown = static_cast<char*>(realloc(m_data, capacity + 1));
    if (grown == nullptr) throw OutOfMemory();
    m_data = grown;
    m_capacity = capacity;
  }
  memcpy(m_data + m_size, bytes, count);
  m_size += count;
  m_data[m_size] = '\0';
}

void ByteBuffer::dropFront(size_t count) {
  if (count >= m_size) {
    clear();
    return;
  }
  memmove(m_data, m_data + count, m_size - count + 1);
  m_size -= count;
}

void ByteBuffer::clear() {
  m_size = 0;
  if (m_data != nullptr) m_data[0] = '\0';
}

void ByteBuffer::release() {
  free(m_data);
  m_data = nullptr;
  m_size = 0;
  m_capacity = 0;
}
