#include "renderer.h"

#include "listing.h"
#include "log_sink.h"
#include "text_escape.h"
#include "value_text.h"

bool PlainRenderer::show(int lineNumber, const char* /*text*/, const ScriptLine& /*line*/,
                         const Outcome& outcome) {
  if (outcome.log.count() > 0 || outcome.stopped()) {
    m_out.flush();  // keeps results and messages in order where both reach one terminal
    for (int i = 0; i < outcome.log.count(); ++i) {
      m_err << logLevelName(outcome.log[i].level) << ": ";
      writeText(m_err, outcome.log[i].message, Escaping::Message);
      m_err << '\n';
    }
    if (outcome.stopped()) {
      m_err << "line " << lineNumber << ": ";
      writeText(m_err, outcome.reason(), Escaping::Message);
      m_err << '\n';
    }
    m_err.flush();
  }
  if (outcome.result.getType() != Variable::TypeNone) {
    writeValue(m_out, outcome.result, Escaping::Script);
    m_out << '\n';
  }
  return outcome.succeeded();
}

void PlainRenderer::list(PluginSession& session) {
  for (const IdentityField& field : kIdentityFields) {
    m_out << field.key << ": ";
    writeText(m_out, (session.plugin().*field.value)(), Escaping::Message);
    m_out << '\n';
  }
  m_out << "apiVersion: " << session.apiVersion() << '\n';
  for (int i = 0; i < session.commandCount(); ++i) {
    const Command& command = session.command(i);
    HString syntax;
    command.getArgSyntaxString(syntax);
    m_out << '\n'
          << i << ' ' << command.getName() << " (" << command.getCategory()
          << "): " << command.getDescription() << "\n  usage: " << command.getName() << ' '
          << syntax.GetStr();
    for (int o = 0; o < command.getNumOptions(); ++o) {
      m_out << (o == 0 ? "\n  options:" : "") << " -" << command.getOption(o)->getName()
            << (command.getOption(o)->takesValue() ? " VALUE" : "");
    }
    m_out << "\n  returns: " << typeName(command.getReturnType()) << " ("
          << static_cast<int>(command.getReturnType())
          << "), canExecuteSolo: " << boolText(command.canExecuteSolo()) << '\n';
  }
}
