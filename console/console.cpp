#include "console.h"

#include "out_of_memory.h"

Console::Console(PluginSession& session, ConsoleMode mode, OutputStream& out, OutputStream& err,
                 const char* source)
    : m_session(session),
      m_plain(out, err),
      m_json(out),
      m_check(out, err, source),
      m_renderer(mode == ConsoleMode::Json    ? static_cast<Renderer&>(m_json)
                 : mode == ConsoleMode::Check ? static_cast<Renderer&>(m_check)
                                              : static_cast<Renderer&>(m_plain)) {}

bool Console::runLine(int lineNumber, const char* line, size_t length) {
  ScriptLine read;
  Outcome outcome;
  try {
    readScriptLine(line, length, m_renderer.readsCases(), read);
    if (read.isEmpty()) return true;
    runScriptLine(m_session, read, outcome);
  } catch (const OutOfMemory&) {  // reading the line: the case, note and copies stand as read
    outcome.outOfMemory = true;
  }
  return m_renderer.show(lineNumber, line, read, outcome);
}

void Console::summarize(bool inputReadInFull) {
  if (&m_renderer == &m_check) m_check.summarize(inputReadInFull);
}
