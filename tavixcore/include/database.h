// The host's database, here only its information log.
#pragma once

#include "core_export.h"

class TAVIXCORE_API Database {
 public:
  // printf-style; the message goes to the log sink as information.
  void logInfo(const char* format, ...) TAVIX_PRINTF(2, 3);
};

// The host's one database; a command may rely on it while it runs.
extern TAVIXCORE_API Database* g_db;
