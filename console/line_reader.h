// Reads a script line by line from an open file descriptor, whatever the
// lines hold and however long they are, and tells a read error from the end
// of the input. It asks the system for what is there, not for a whole block,
// so that on a terminal each line is read as soon as Enter ends it.
#pragma once

#include <stddef.h>

#include "byte_buffer.h"

class LineReader {
 public:
  // Throws OutOfMemory when there is no room for its read buffer.
  explicit LineReader(int descriptor);
  ~LineReader();
  LineReader(const LineReader&) = delete;
  LineReader& operator=(const LineReader&) = delete;

  // The next line into line, without its line feed; a UTF-8 byte-order mark
  // at the very start of the input is skipped. False at the end of the input
  // and after a failure, which failure() then names.
  bool next(ByteBuffer& line);
  // Why reading stopped early: the system's reason, or a line too long to
  // hold in memory; null at a plain end of the input.
  const char* failure() const { return m_failure; }

 private:
  static constexpr size_t kBlockSize = 65536;
  bool refill();

  int m_descriptor;
  char* m_block;
  size_t m_start = 0;
  size_t m_end = 0;
  int m_lineNumber = 0;
  const char* m_failure = nullptr;
  char m_reason[64];
};
