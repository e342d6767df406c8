// Runs script lines against the commands of a loaded module and shows the
// outcome, as text for a person, as one JSON object per line, or checked
// against the expected outcome written beside each line.
#pragma once

#include <stddef.h>

#include "output_stream.h"
#include "plugin_session.h"
#include "renderer.h"

enum class ConsoleMode { Plain, Json, Check };

class Console {
 public:
  // Results go to out, messages to err; source names where the lines come
  // from, in check reports.
  Console(PluginSession& session, ConsoleMode mode, OutputStream& out, OutputStream& err,
          const char* source);
  Console(const Console&) = delete;
  Console& operator=(const Console&) = delete;

  // Runs one line of length bytes (blank and comment lines are skipped and
  // count as run). Returns false when the line was refused, execute returned
  // false or memory ran out; in check mode, when its outcome differs from
  // the one written beside it.
  bool runLine(int lineNumber, const char* line, size_t length);

  // The plug-in's identity and every command's registration.
  void list() { m_renderer.list(m_session); }

  // Check mode's summary at the end of the input; nothing in other modes.
  void summarize(bool inputReadInFull);

 private:
  PluginSession& m_session;
  PlainRenderer m_plain;
  JsonRenderer m_json;
  CheckRenderer m_check;
  Renderer& m_renderer;
};
