#include "line_reader.h"

#include <errno.h>
#include <stdio.h>
#include <string.h>

#include "out_of_memory.h"

#if defined(_WIN32)
#include <io.h>
#else
#include <unistd.h>
#endif

LineReader::LineReader(int descriptor) : m_descriptor(descriptor), m_block(new char[kBlockSize]) {}

LineReader::~LineReader() {
  delete[] m_block;
}

bool LineReader::refill() {
  m_start = 0;
  m_end = 0;
  for (;;) {
#if defined(_WIN32)
    const int got = _read(m_descriptor, m_block, static_cast<unsigned>(kBlockSize));
#else
    const ssize_t got = read(m_descriptor, m_block, kBlockSize);
#endif
    if (got > 0) {
      m_end = static_cast<size_t>(got);
      return true;
    }
    if (got == 0) return false;
    if (errno != EINTR) {
      m_failure = strerror(errno);
      return false;
    }
  }
}

bool LineReader::next(ByteBuffer& line) {
  line.clear();
  bool any = false;
  try {
    while (m_failure == nullptr && (m_start < m_end || refill())) {
      any = true;
      const char* from = m_block + m_start;
      const auto* feed = static_cast<const char*>(memchr(from, '\n', m_end - m_start));
      const size_t count = feed == nullptr ? m_end - m_start : static_cast<size_t>(feed - from);
      line.append(from, count);
      m_start += count + (feed != nullptr);
      if (feed != nullptr) break;
    }
  } catch (const OutOfMemory&) {
    snprintf(m_reason, sizeof(m_reason), "line %d is too long to hold in memory", m_lineNumber + 1);
    m_failure = m_reason;
    line.release();
  }
  if (m_failure != nullptr || !any) return false;
  if (++m_lineNumber == 1 && strncmp(line.data(), "\xEF\xBB\xBF", 3) == 0) line.dropFront(3);
  return true;
}
