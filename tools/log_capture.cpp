#include "log_capture.h"

LogCapture::LogCapture() {
  setLogSink(&LogCapture::receive, this);
}

LogCapture::~LogCapture() {
  setLogSink(nullptr, nullptr);
}

void LogCapture::receive(LogLevel level, const char* message, void* context) {
  static_cast<LogCapture*>(context)->m_entries.push_back(LogEntry{level, message});
}
