// Runs script lines against the commands of a loaded module and shows the
// outcome, as text for a person or as one JSON object per line.
#pragma once

#include <iosfwd>
#include <string>

#include "plugin_session.h"

class Console {
 public:
  Console(PluginSession& session, bool json, std::ostream& out, std::ostream& err)
      : m_session(session), m_json(json), m_out(out), m_err(err) {}

  // Runs one line (blank and comment lines are skipped and count as run).
  // Returns false when the line was refused or execute returned false.
  bool runLine(int lineNumber, const std::string& line);

  // The plug-in's identity and every command's registration.
  void list();

 private:
  PluginSession& m_session;
  bool m_json;
  std::ostream& m_out;
  std::ostream& m_err;
};
