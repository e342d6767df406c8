#include "database.h"

#include "format_text.h"
#include "log_sink.h"

namespace {

Database g_hostDatabase;

}  // namespace

Database* g_db = &g_hostDatabase;

void Database::logInfo(const char* format, ...) {
  va_list arguments;
  va_start(arguments, format);
  const ArgumentsEnd end(arguments);
  logMessage(LogLevel::Info, FormattedText(format, arguments).text());
}
