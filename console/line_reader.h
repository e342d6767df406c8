// Reads a script line by line from a stdio stream, whatever the lines hold
// and however long they are, and tells a read error from the end of the input.
#pragma once

#include <stdio.h>

#include "byte_buffer.h"

class LineReader {
 public:
  explicit LineReader(FILE* file) : m_file(file) {}
  LineReader(const LineReader&) = delete;
  LineReader& operator=(const LineReader&) = delete;

  // The next line into line, without its line feed; a UTF-8 byte-order mark
  // at the very start of the input is skipped. False at the end of the input
  // and after a failure, which failure() then names.
  bool next(ByteBuffer& line);
  // Why reading stopped early: the stream's error, or a line too long to
  // hold in memory; null at a plain end of the input.
  const char* failure() const { return m_failure; }

 private:
  bool refill();

  FILE* m_file;
  char m_block[65536];
  size_t m_start = 0;
  size_t m_end = 0;
  int m_lineNumber = 0;
  const char* m_failure = nullptr;
  char m_reason[64];
};
