#include "renderer.h"

#include "log_sink.h"
#include "text_escape.h"
#include "value_text.h"

namespace {

// A line's outcome on one line, as a script case writes it after "# =>":
// the messages logged, the console's own reason when it refused or cut the
// line short, the result, and "failed" when execute returned false; strings
// quoted in ASCII. "nothing" when there is none of these.
void describe(OutputStream& out, const Outcome& outcome) {
  const char* separator = "";
  for (int i = 0; i < outcome.log.count(); ++i) {
    out << separator << logLevelName(outcome.log[i].level) << ' ';
    writeText(out, outcome.log[i].message, Escaping::ScriptAscii);
    separator = " ";
  }
  if (outcome.stopped()) {
    out << separator << (outcome.ran || outcome.outOfMemory ? "aborted " : "refused ");
    writeText(out, outcome.reason(), Escaping::ScriptAscii);
    separator = " ";
  }
  if (outcome.result.getType() != Variable::TypeNone) {
    out << separator;
    writeValue(out, outcome.result, Escaping::ScriptAscii);
    separator = " ";
  }
  if (outcome.ran && !outcome.ok && !outcome.stopped()) {
    out << separator << "failed";
    separator = " ";
  }
  if (*separator == '\0') out << "nothing";
}

}  // namespace

bool CheckRenderer::show(int lineNumber, const char* text, const ScriptLine& line,
                         const Outcome& outcome) {
  ++m_casesRun;
  // The outcome is compared as it is described, without being held.
  OutputStream comparison(line.note, line.noteLength);
  describe(comparison, outcome);
  if (line.noted && comparison.matches()) return true;
  ++m_casesDiffering;
  writeText(m_out, m_source, Escaping::Message);
  m_out << ':' << lineNumber << ": ";
  writeText(m_out, text, line.caseLength, Escaping::Message);
  m_out << "\n  expected: ";
  if (line.noted) {
    writeText(m_out, line.note, line.noteLength, Escaping::Message);
  } else {
    m_out << "(no \"# =>\" note)";
  }
  m_out << "\n  actual:   ";
  describe(m_out, outcome);
  m_out << '\n';
  return false;
}

void CheckRenderer::summarize(bool inputReadInFull) {
  writeText(m_out, m_source, Escaping::Message);
  if (!inputReadInFull) {
    m_out << ": reading stopped after " << m_casesRun << " cases, " << m_casesDiffering
          << " of them differing\n";
  } else if (m_casesDiffering == 0) {
    m_out << ": " << m_casesRun << " cases as expected\n";
  } else {
    m_out << ": " << m_casesDiffering << " of " << m_casesRun << " cases differ\n";
  }
}
