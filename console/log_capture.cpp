#include "log_capture.h"

LogCapture::LogCapture(TArray<LogEntry>& entries) : m_entries(entries) {
  setLogSink(&LogCapture::receive, this);
}

LogCapture::~LogCapture() {
  setLogSink(nullptr, nullptr);
}

void LogCapture::receive(LogLevel level, const char* message, void* context) {
  LogEntry entry;
  entry.level = level;
  entry.message = message;
  static_cast<LogCapture*>(context)->m_entries.add(entry);
}
