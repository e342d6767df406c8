// Catches every message the host logs while it lives, with its level.
#pragma once

#include <string>
#include <vector>

#include "../host/log_sink.h"

struct LogEntry {
  LogLevel level;
  std::string message;
  bool operator==(const LogEntry& other) const {
    return level == other.level && message == other.message;
  }
};

class LogCapture {
 public:
  LogCapture();
  ~LogCapture();
  LogCapture(const LogCapture&) = delete;
  LogCapture& operator=(const LogCapture&) = delete;

  const std::vector<LogEntry>& entries() const { return m_entries; }

 private:
  static void receive(LogLevel level, const char* message, void* context);
  std::vector<LogEntry> m_entries;
};
