#include "log_sink.h"

#include <stdio.h>

namespace {

LogSinkFn g_sink = nullptr;
void* g_sinkContext = nullptr;

}  // namespace

void setLogSink(LogSinkFn sink, void* context) {
  g_sink = sink;
  g_sinkContext = context;
}

const char* logLevelName(LogLevel level) {
  switch (level) {
    case LogLevel::Error:
      return "error";
    case LogLevel::Warning:
      return "warning";
    case LogLevel::Info:
      return "info";
  }
  return "log";
}

void logMessage(LogLevel level, const char* message) {
  const char* text = message == nullptr ? "" : message;
  if (g_sink != nullptr) {
    g_sink(level, text, g_sinkContext);
    return;
  }
  fprintf(stderr, "%s: %s\n", logLevelName(level), text);
}
