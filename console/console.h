// Runs script lines against the commands of a loaded module and shows the
// outcome, as text for a person, as one JSON object per line, or checked
// against the expected outcome written beside each line.
#pragma once

#include <stddef.h>

#include "output_stream.h"
#include "plugin_session.h"

enum class ConsoleMode { Plain, Json, Check };

class Console {
 public:
  // Results go to out, messages to err; source names where the lines come
  // from, in check reports.
  Console(PluginSession& session, ConsoleMode mode, OutputStream& out, OutputStream& err,
          const char* source)
      : m_session(session), m_mode(mode), m_out(out), m_err(err), m_source(source) {}

  // Runs one line of length bytes (blank and comment lines are skipped and
  // count as run). Returns false when the line was refused, execute returned
  // false or memory ran out; in check mode, when its outcome differs from
  // the one written beside it.
  bool runLine(int lineNumber, const char* line, size_t length);

  // The plug-in's identity and every command's registration.
  void list();

  // Check mode: how many cases ran, and how many of them differed.
  int casesRun() const { return m_casesRun; }
  int casesDiffering() const { return m_casesDiffering; }

 private:
  bool check(int lineNumber, const char* line, size_t length);

  PluginSession& m_session;
  ConsoleMode m_mode;
  OutputStream& m_out;
  OutputStream& m_err;
  const char* m_source;
  int m_casesRun = 0;
  int m_casesDiffering = 0;
};
