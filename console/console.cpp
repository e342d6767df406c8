#include "console.h"

#include "out_of_memory.h"
#include "plugin_exports.h"
#include "byte_buffer.h"
#include "log_capture.h"
#include "script_line.h"
#include "script_values.h"
#include "text_escape.h"

namespace {

// What happened to one line.
struct Outcome {
  HString command;  // as written
  bool ran = false;
  bool ok = false;
  HString error;  // why the line was refused before running
  bool outOfMemory = false;
  Variable result;
  TArray<LogEntry> log;

  const char* reason() const { return outOfMemory ? "out of memory" : error.GetStr(); }
  bool stopped() const { return outOfMemory || !error.IsEmpty(); }
};

enum class Quoting { Script, ScriptAscii, Json };

void writeString(OutputStream& out, const char* text, Quoting quoting) {
  if (quoting == Quoting::Json) {
    writeJsonString(out, text);
  } else {
    writeScriptString(out, text, quoting == Quoting::ScriptAscii);
  }
}

// An integer in decimal, a string quoted, an array as a bracketed list of
// quoted strings; nothing for no value.
void writeValue(OutputStream& out, const Variable& value, Quoting quoting) {
  switch (value.getType()) {
    case Variable::TypeInt:
      out << value.getIntValue(-1);
      break;
    case Variable::TypeString:
      writeString(out, value.getStringValue(-1), quoting);
      break;
    case Variable::TypeStringArray:
      out << '[';
      for (int i = 0; i < value.getCount(); ++i) {
        if (i > 0) out << ", ";
        writeString(out, value.getStringValue(i), quoting);
      }
      out << ']';
      break;
    case Variable::TypeNone:
      break;
  }
}

const char* jsonBool(bool value) {
  return value ? "true" : "false";
}

// Builds the arguments and options of a line for its command, or says why
// not. The value of an option is the next word whole, whatever its kind.
bool buildCall(const Command& command, const TArray<ScriptWord>& words, TArray<Variable>& args,
               TArray<CommandOption>& options, HString& error) {
  for (int i = 1; i < words.count(); ++i) {
    const ScriptWord& word = words[i];
    if (word.kind != ScriptWord::Option) {
      args.add(word.kind == ScriptWord::Integer ? integerValue(word.number)
                                                : stringValue(word.text));
      continue;
    }
    int index = -1;
    Variable::VarType type = Variable::TypeNone;
    if (command.getOptionSyntax(word.text.GetStr() + 1, index, type) == 0) {
      error.Format("unknown option %s for %s", word.text.GetStr(), command.getName());
      return false;
    }
    Variable value;
    if (type != Variable::TypeNone) {
      if (++i == words.count()) {
        error.Format("option %s needs a value", word.text.GetStr());
        return false;
      }
      value = stringValue(words[i].text);
    }
    options.add(CommandOption::given(index, value));
  }
  return true;
}

// Runs the command the words name. The words are let go once the call is
// built, so that a long line is not held twice while the command runs.
void runWords(PluginSession& session, TArray<ScriptWord>& words, Outcome& outcome) {
  outcome.command = words[0].text;
  Command* command = session.find(words[0].text);
  if (command == nullptr) {
    outcome.error.Format("unknown command %s", words[0].text.GetStr());
    return;
  }
  TArray<Variable> args;
  TArray<CommandOption> options;
  if (!buildCall(*command, words, args, options, outcome.error)) return;
  words.removeAll();
  LogCapture capture(outcome.log);
  if (!command->checkArgSyntax(args, options)) {
    HString syntax;
    command->getArgSyntaxString(syntax);
    outcome.error.Format("usage: %s %s", command->getName(), syntax.GetStr());
    return;
  }
  outcome.ran = true;
  outcome.ok = command->execute(options, args, outcome.result);
}

// Runs a line into outcome; running out of memory anywhere fails the line
// and leaves the console as it was.
void runText(PluginSession& session, const char* line, size_t length, Outcome& outcome) {
  try {
    TArray<ScriptWord> words;
    if (!splitScriptLine(line, length, words, outcome.error)) {
      if (words.count() > 0) outcome.command = words[0].text;
    } else if (words.count() > 0) {
      runWords(session, words, outcome);
    }
  } catch (const OutOfMemory&) {
    outcome.outOfMemory = true;
  } catch (const char*) {  // E1224, the module's own out-of-memory exception
    outcome.outOfMemory = true;
  }
  if (outcome.outOfMemory) outcome.result = Variable();
}

// A line's outcome on one line, as a script case writes it after "# =>":
// the messages logged, the console's own reason when it refused or cut the
// line short, the result, and "failed" when execute returned false; strings
// quoted in ASCII. "nothing" when there is none of these.
void describe(OutputStream& out, const Outcome& outcome) {
  const size_t start = out.size();
  const auto separate = [&]() {
    if (out.size() > start) out << ' ';
  };
  for (int i = 0; i < outcome.log.count(); ++i) {
    separate();
    out << logLevelName(outcome.log[i].level) << ' ';
    writeScriptString(out, outcome.log[i].message, true);
  }
  if (outcome.stopped()) {
    separate();
    out << (outcome.ran || outcome.outOfMemory ? "aborted " : "refused ");
    writeScriptString(out, outcome.reason(), true);
  }
  if (outcome.result.getType() != Variable::TypeNone) {
    separate();
    writeValue(out, outcome.result, Quoting::ScriptAscii);
  }
  if (outcome.ran && !outcome.ok && !outcome.stopped()) {
    separate();
    out << "failed";
  }
  if (out.size() == start) out << "nothing";
}

// Writes what a line did: one JSON object on out, or the result on out and
// the messages and the console's own reason on err.
void show(OutputStream& out, OutputStream& err, bool json, int lineNumber, const Outcome& outcome) {
  if (json) {
    out << "{\"line\": " << lineNumber << ", \"command\": ";
    writeJsonString(out, outcome.command);
    out << ", \"ran\": " << jsonBool(outcome.ran) << ", \"ok\": " << jsonBool(outcome.ok)
        << ", \"type\": " << static_cast<int>(outcome.result.getType()) << ", \"value\": ";
    if (outcome.result.getType() == Variable::TypeNone) out << "null";
    writeValue(out, outcome.result, Quoting::Json);
    out << ", \"log\": [";
    for (int i = 0; i < outcome.log.count(); ++i) {
      out << (i == 0 ? "" : ", ") << "{\"level\": \"" << logLevelName(outcome.log[i].level)
          << "\", \"message\": ";
      writeJsonString(out, outcome.log[i].message);
      out << '}';
    }
    out << ']';
    if (outcome.stopped()) {
      out << ", \"error\": ";
      writeJsonString(out, outcome.reason());
    }
    out << "}\n";
    return;
  }
  if (outcome.log.count() > 0 || outcome.stopped()) {
    out.flush();  // keeps results and messages in order where both reach one terminal
    for (int i = 0; i < outcome.log.count(); ++i) {
      err << logLevelName(outcome.log[i].level) << ": ";
      writeMessageText(err, outcome.log[i].message);
      err << '\n';
    }
    if (outcome.stopped()) {
      err << "line " << lineNumber << ": ";
      writeMessageText(err, outcome.reason());
      err << '\n';
    }
    err.flush();
  }
  if (outcome.result.getType() != Variable::TypeNone) {
    writeValue(out, outcome.result, Quoting::Script);
    out << '\n';
  }
}

}  // namespace

bool Console::runLine(int lineNumber, const char* line, size_t length) {
  if (isSkippedLine(line, length)) return true;
  if (m_mode == ConsoleMode::Check) return check(lineNumber, line, length);
  Outcome outcome;
  runText(m_session, line, length, outcome);
  show(m_out, m_err, m_mode == ConsoleMode::Json, lineNumber, outcome);
  return outcome.ran && outcome.ok && !outcome.stopped();
}

bool Console::check(int lineNumber, const char* line, size_t length) {
  size_t caseLength = length;
  HString expected;
  const bool noted = splitExpectation(line, length, caseLength, expected);
  while (caseLength > 0 && (line[caseLength - 1] == ' ' || line[caseLength - 1] == '\t'))
    --caseLength;
  Outcome outcome;
  runText(m_session, line, caseLength, outcome);
  OutputStream actual;
  describe(actual, outcome);
  ++m_casesRun;
  if (noted && expected.Compare(actual.text()) == 0) return true;
  ++m_casesDiffering;
  ByteBuffer caseText;
  caseText.append(line, caseLength);
  m_out << m_source << ':' << lineNumber << ": ";
  writeMessageText(m_out, caseText.data());
  m_out << "\n  expected: " << (noted ? expected.GetStr() : "(no \"# =>\" note)")
        << "\n  actual:   " << actual.text() << '\n';
  return false;
}

namespace {

const char* typeName(Variable::VarType type) {
  switch (type) {
    case Variable::TypeInt:
      return "integer";
    case Variable::TypeString:
      return "string";
    case Variable::TypeStringArray:
      return "array of strings";
    case Variable::TypeNone:
      break;
  }
  return "none";
}

}  // namespace

void Console::list() {
  CommandPluginBase& plugin = m_session.plugin();
  const char* const keys[] = {"maker", "publisher", "buildDate", "version", "name", "release"};
  const HString values[] = {plugin.getMakerName(),  plugin.getPublisherName(),
                            plugin.getBuildDate(),  plugin.getVersionString(),
                            plugin.getPluginName(), plugin.getReleaseString()};
  const bool json = m_mode == ConsoleMode::Json;
  m_out << (json ? "{\"plugin\": {" : "");
  for (int i = 0; i < 6; ++i) {
    if (json) {
      m_out << '"' << keys[i] << "\": ";
      writeJsonString(m_out, values[i]);
      m_out << ", ";
    } else {
      m_out << keys[i] << ": " << values[i].GetStr() << '\n';
    }
  }
  m_out << (json ? "\"apiVersion\": " : "apiVersion: ") << m_session.apiVersion()
        << (json ? "}, \"commands\": [" : "\n");
  for (int i = 0; i < m_session.commandCount(); ++i) {
    const Command& c = m_session.command(i);
    HString syntax;
    c.getArgSyntaxString(syntax);
    if (!json) {
      m_out << '\n'
            << i << ' ' << c.getName() << " (" << c.getCategory() << "): " << c.getDescription()
            << "\n  usage: " << c.getName() << ' ' << syntax.GetStr();
      for (int o = 0; o < c.getNumOptions(); ++o) {
        m_out << (o == 0 ? "\n  options:" : "") << " -" << c.getOption(o)->getName()
              << (c.getOption(o)->takesValue() ? " VALUE" : "");
      }
      m_out << "\n  returns: " << typeName(c.getReturnType()) << " ("
            << static_cast<int>(c.getReturnType())
            << "), canExecuteSolo: " << jsonBool(c.canExecuteSolo()) << '\n';
      continue;
    }
    m_out << (i == 0 ? "" : ", ") << "{\"position\": " << i << ", \"name\": ";
    writeJsonString(m_out, c.getName());
    m_out << ", \"category\": ";
    writeJsonString(m_out, c.getCategory());
    m_out << ", \"description\": ";
    writeJsonString(m_out, c.getDescription());
    m_out << ", \"options\": [";
    for (int o = 0; o < c.getNumOptions(); ++o) {
      m_out << (o == 0 ? "" : ", ") << "{\"name\": ";
      writeJsonString(m_out, c.getOption(o)->getName());
      m_out << ", \"takesValue\": " << jsonBool(c.getOption(o)->takesValue()) << '}';
    }
    m_out << "], \"syntax\": ";
    writeJsonString(m_out, syntax);
    m_out << ", \"returnType\": " << static_cast<int>(c.getReturnType())
          << ", \"canExecuteSolo\": " << jsonBool(c.canExecuteSolo()) << '}';
  }
  if (json) m_out << "]}\n";
}
