#include "console.h"

#include <ostream>
#include <sstream>
#include <vector>

#include "../host/plugin_exports.h"
#include "log_capture.h"
#include "script_line.h"
#include "script_values.h"
#include "text_escape.h"

namespace {

// What happened to one line.
struct LineOutcome {
  std::string command;
  bool ran = false;
  bool ok = false;
  std::string error;  // why the line was refused before running
  Variable result;
  std::vector<LogEntry> log;
};

// Builds the arguments and options of a line for its command, or says why not.
bool buildCall(const Command& command, const std::vector<ScriptWord>& words, TArray<Variable>& args,
               TArray<CommandOption>& options, std::string& error) {
  for (size_t i = 1; i < words.size(); ++i) {
    const ScriptWord& word = words[i];
    if (word.kind != ScriptWord::Option) {
      args.add(word.kind == ScriptWord::Integer ? integerValue(word.number)
                                                : stringValue(word.text.c_str()));
      continue;
    }
    int index = -1;
    Variable::VarType type = Variable::TypeNone;
    if (command.getOptionSyntax(word.text.c_str(), index, type) == 0) {
      error = "unknown option -" + word.text + " for " + command.getName();
      return false;
    }
    Variable value;
    if (type != Variable::TypeNone) {
      if (++i == words.size()) {
        error = "option -" + word.text + " needs a value";
        return false;
      }
      value = stringValue(words[i].text.c_str());
    }
    options.add(CommandOption::given(index, value));
  }
  return true;
}

LineOutcome runWords(PluginSession& session, const std::vector<ScriptWord>& words) {
  LineOutcome outcome;
  outcome.command = words[0].text;
  Command* command = session.find(outcome.command);
  if (command == nullptr) {
    outcome.error = "unknown command " + outcome.command;
    return outcome;
  }
  TArray<Variable> args;
  TArray<CommandOption> options;
  if (!buildCall(*command, words, args, options, outcome.error)) return outcome;

  LogCapture capture;
  if (!command->checkArgSyntax(args, options)) {
    HString syntax;
    command->getArgSyntaxString(syntax);
    outcome.error = "usage: " + outcome.command + " " + syntax.GetStr();
  } else {
    outcome.ran = true;
    outcome.ok = command->execute(options, args, outcome.result);
  }
  outcome.log = capture.entries();
  return outcome;
}

std::string jsonBool(bool value) {
  return value ? "true" : "false";
}

// An integer in decimal, a string quoted by quote, an array as a bracketed
// list of quoted strings; the empty text for no value.
template <class Quote>
std::string formatValue(const Variable& value, Quote quote) {
  switch (value.getType()) {
    case Variable::TypeInt:
      return std::to_string(value.getIntValue(-1));
    case Variable::TypeString:
      return quote(value.getStringValue(-1));
    case Variable::TypeStringArray: {
      std::string out = "[";
      for (int i = 0; i < value.getCount(); ++i) {
        out += (i == 0 ? "" : ", ") + quote(value.getStringValue(i));
      }
      return out + "]";
    }
    case Variable::TypeNone:
      break;
  }
  return std::string();
}

std::string jsonValue(const Variable& value) {
  return value.getType() == Variable::TypeNone ? "null" : formatValue(value, quoteJsonString);
}

std::string jsonLine(int lineNumber, const LineOutcome& outcome) {
  std::ostringstream out;
  out << "{\"line\": " << lineNumber << ", \"command\": " << quoteJsonString(outcome.command)
      << ", \"ran\": " << jsonBool(outcome.ran) << ", \"ok\": " << jsonBool(outcome.ok)
      << ", \"type\": " << static_cast<int>(outcome.result.getType())
      << ", \"value\": " << jsonValue(outcome.result) << ", \"log\": [";
  for (size_t i = 0; i < outcome.log.size(); ++i) {
    out << (i == 0 ? "" : ", ") << "{\"level\": \"" << logLevelName(outcome.log[i].level)
        << "\", \"message\": " << quoteJsonString(outcome.log[i].message) << "}";
  }
  out << "]";
  if (!outcome.error.empty()) out << ", \"error\": " << quoteJsonString(outcome.error);
  out << "}";
  return out.str();
}

// A line's outcome on one line, as a script case writes it after "# =>":
// the messages logged, the console's own reason when it refused or cut the
// line short, the result, and "failed" when execute returned false; strings
// quoted in ASCII. "nothing" when there is none of these.
std::string describeOutcome(const LineOutcome& outcome) {
  const auto quote = [](const std::string& text) { return quoteScriptString(text, true); };
  std::string out;
  const auto add = [&out](const std::string& piece) { out += (out.empty() ? "" : " ") + piece; };
  for (const LogEntry& entry : outcome.log)
    add(std::string(logLevelName(entry.level)) + " " + quote(entry.message));
  if (!outcome.error.empty()) add((outcome.ran ? "aborted " : "refused ") + quote(outcome.error));
  if (outcome.result.getType() != Variable::TypeNone) add(formatValue(outcome.result, quote));
  if (outcome.ran && !outcome.ok && outcome.error.empty()) add("failed");
  return out.empty() ? "nothing" : out;
}

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

LineOutcome runText(PluginSession& session, const std::string& line) {
  std::vector<ScriptWord> words;
  LineOutcome outcome;
  if (!splitScriptLine(line, words, outcome.error)) {
    if (!words.empty()) outcome.command = words[0].text;
  } else if (!words.empty()) {
    outcome = runWords(session, words);
  }
  return outcome;
}

bool Console::runLine(int lineNumber, const std::string& line) {
  if (isSkippedLine(line)) return true;
  if (m_mode == ConsoleMode::Check) return checkLine(lineNumber, line);
  const LineOutcome outcome = runText(m_session, line);

  if (m_mode == ConsoleMode::Json) {
    m_out << jsonLine(lineNumber, outcome) << std::endl;
  } else {
    for (const LogEntry& entry : outcome.log) {
      m_err << logLevelName(entry.level) << ": " << entry.message << std::endl;
    }
    if (!outcome.error.empty())
      m_err << "line " << lineNumber << ": " << outcome.error << std::endl;
    if (outcome.result.getType() != Variable::TypeNone)
      m_out << formatValue(outcome.result, [](const std::string& text) {
        return quoteScriptString(text);
      }) << std::endl;
  }
  return outcome.ran && outcome.ok;
}

bool Console::checkLine(int lineNumber, const std::string& line) {
  std::string caseText = line;
  std::string expected;
  const bool noted = splitExpectation(line, caseText, expected);
  const std::string actual = describeOutcome(runText(m_session, caseText));
  ++m_casesRun;
  if (noted && actual == expected) return true;
  ++m_casesDiffering;
  m_out << m_source << ":" << lineNumber << ": "
        << caseText.substr(0, caseText.find_last_not_of(" \t") + 1)
        << "\n  expected: " << (noted ? expected : "(no \"# =>\" note)")
        << "\n  actual:   " << actual << std::endl;
  return false;
}

void Console::list() {
  CommandPluginBase& plugin = m_session.plugin();
  const std::pair<const char*, std::string> identity[] = {
      {"maker", plugin.getMakerName().GetStr()},
      {"publisher", plugin.getPublisherName().GetStr()},
      {"buildDate", plugin.getBuildDate().GetStr()},
      {"version", plugin.getVersionString().GetStr()},
      {"name", plugin.getPluginName().GetStr()},
      {"release", plugin.getReleaseString().GetStr()},
  };
  const std::vector<Command*>& commands = m_session.commands();

  if (m_mode != ConsoleMode::Json) {
    for (const auto& [key, text] : identity) m_out << key << ": " << text << "\n";
    m_out << "apiVersion: " << m_session.apiVersion() << "\n";
    for (size_t i = 0; i < commands.size(); ++i) {
      const Command& c = *commands[i];
      HString syntax;
      c.getArgSyntaxString(syntax);
      m_out << "\n"
            << i << " " << c.getName() << " (" << c.getCategory() << "): " << c.getDescription()
            << "\n  usage: " << c.getName() << " " << syntax.GetStr();
      for (int o = 0; o < c.getNumOptions(); ++o) {
        m_out << (o == 0 ? "\n  options:" : "") << " -" << c.getOption(o)->getName()
              << (c.getOption(o)->takesValue() ? " VALUE" : "");
      }
      m_out << "\n  returns: " << typeName(c.getReturnType()) << " ("
            << static_cast<int>(c.getReturnType())
            << "), canExecuteSolo: " << jsonBool(c.canExecuteSolo()) << "\n";
    }
    m_out.flush();
    return;
  }

  m_out << "{\"plugin\": {";
  for (const auto& [key, text] : identity)
    m_out << "\"" << key << "\": " << quoteJsonString(text) << ", ";
  m_out << "\"apiVersion\": " << m_session.apiVersion() << "}, \"commands\": [";
  for (size_t i = 0; i < commands.size(); ++i) {
    const Command& c = *commands[i];
    HString syntax;
    c.getArgSyntaxString(syntax);
    m_out << (i == 0 ? "" : ", ") << "{\"position\": " << i
          << ", \"name\": " << quoteJsonString(c.getName())
          << ", \"category\": " << quoteJsonString(c.getCategory())
          << ", \"description\": " << quoteJsonString(c.getDescription()) << ", \"options\": [";
    for (int o = 0; o < c.getNumOptions(); ++o) {
      m_out << (o == 0 ? "" : ", ") << "{\"name\": " << quoteJsonString(c.getOption(o)->getName())
            << ", \"takesValue\": " << jsonBool(c.getOption(o)->takesValue()) << "}";
    }
    m_out << "], \"syntax\": " << quoteJsonString(syntax.GetStr())
          << ", \"returnType\": " << static_cast<int>(c.getReturnType())
          << ", \"canExecuteSolo\": " << jsonBool(c.canExecuteSolo()) << "}";
  }
  m_out << "]}" << std::endl;
}
