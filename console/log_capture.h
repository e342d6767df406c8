// Catches every message the host logs while it lives, with its level.
#pragma once

#include "hstring.h"
#include "log_sink.h"
#include "tarray.h"

struct LogEntry {
  LogLevel level = LogLevel::Info;
  HString message;
};

class LogCapture {
 public:
  // Appends each message to entries until the capture ends.
  explicit LogCapture(TArray<LogEntry>& entries);
  ~LogCapture();
  LogCapture(const LogCapture&) = delete;
  LogCapture& operator=(const LogCapture&) = delete;

 private:
  static void receive(LogLevel level, const char* message, void* context);
  TArray<LogEntry>& m_entries;
};
