// Runs script lines against the commands of a loaded module and shows the
// outcome, as text for a person, as one JSON object per line, or checked
// against the expected outcome written beside each line.
#pragma once

#include <iosfwd>
#include <string>
#include <utility>

#include "plugin_session.h"

enum class ConsoleMode { Plain, Json, Check };

class Console {
 public:
  // source names where the lines come from, in check reports.
  Console(PluginSession& session, ConsoleMode mode, std::ostream& out, std::ostream& err,
          std::string source = std::string())
      : m_session(session), m_mode(mode), m_out(out), m_err(err), m_source(std::move(source)) {}

  // Runs one line (blank and comment lines are skipped and count as run).
  // Returns false when the line was refused or execute returned false; in
  // check mode, when its outcome differs from the one written beside it.
  bool runLine(int lineNumber, const std::string& line);

  // Check mode: how many cases ran, and how many of them differed.
  int casesRun() const { return m_casesRun; }
  int casesDiffering() const { return m_casesDiffering; }

  // The plug-in's identity and every command's registration.
  void list();

 private:
  bool checkLine(int lineNumber, const std::string& line);

  PluginSession& m_session;
  ConsoleMode m_mode;
  std::ostream& m_out;
  std::ostream& m_err;
  std::string m_source;
  int m_casesRun = 0;
  int m_casesDiffering = 0;
};
