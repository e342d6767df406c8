#include "renderer.h"

#include "listing.h"
#include "log_sink.h"
#include "text_escape.h"
#include "value_text.h"

bool JsonRenderer::show(int lineNumber, const char* /*text*/, const ScriptLine& /*line*/,
                        const Outcome& outcome) {
  m_out << "{\"line\": " << lineNumber << ", \"command\": ";
  writeText(m_out, outcome.command, Escaping::Json);
  m_out << ", \"ran\": " << boolText(outcome.ran) << ", \"ok\": " << boolText(outcome.ok)
        << ", \"type\": " << static_cast<int>(outcome.result.getType()) << ", \"value\": ";
  if (outcome.result.getType() == Variable::TypeNone) m_out << "null";
  writeValue(m_out, outcome.result, Escaping::Json);
  m_out << ", \"log\": [";
  for (int i = 0; i < outcome.log.count(); ++i) {
    m_out << (i == 0 ? "" : ", ") << "{\"level\": \"" << logLevelName(outcome.log[i].level)
          << "\", \"message\": ";
    writeText(m_out, outcome.log[i].message, Escaping::Json);
    m_out << '}';
  }
  m_out << ']';
  if (outcome.stopped()) {
    m_out << ", \"error\": ";
    writeText(m_out, outcome.reason(), Escaping::Json);
  }
  m_out << "}\n";
  return outcome.succeeded();
}

void JsonRenderer::list(PluginSession& session) {
  m_out << "{\"plugin\": {";
  for (const IdentityField& field : kIdentityFields) {
    m_out << '"' << field.key << "\": ";
    writeText(m_out, (session.plugin().*field.value)(), Escaping::Json);
    m_out << ", ";
  }
  m_out << "\"apiVersion\": " << session.apiVersion() << "}, \"commands\": [";
  for (int i = 0; i < session.commandCount(); ++i) {
    const Command& command = session.command(i);
    HString syntax;
    command.getArgSyntaxString(syntax);
    m_out << (i == 0 ? "" : ", ") << "{\"position\": " << i << ", \"name\": ";
    writeText(m_out, command.getName(), Escaping::Json);
    m_out << ", \"category\": ";
    writeText(m_out, command.getCategory(), Escaping::Json);
    m_out << ", \"description\": ";
    writeText(m_out, command.getDescription(), Escaping::Json);
    m_out << ", \"options\": [";
    for (int o = 0; o < command.getNumOptions(); ++o) {
      m_out << (o == 0 ? "" : ", ") << "{\"name\": ";
      writeText(m_out, command.getOption(o)->getName(), Escaping::Json);
      m_out << ", \"takesValue\": " << boolText(command.getOption(o)->takesValue()) << '}';
    }
    m_out << "], \"syntax\": ";
    writeText(m_out, syntax, Escaping::Json);
    m_out << ", \"returnType\": " << static_cast<int>(command.getReturnType())
          << ", \"canExecuteSolo\": " << boolText(command.canExecuteSolo()) << '}';
  }
  m_out << "]}\n";
}
