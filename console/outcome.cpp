#include "outcome.h"

#include "command.h"
#include "command_option.h"
#include "out_of_memory.h"
#include "script_values.h"

namespace {

// Builds the arguments and options of a line for its command, or says why
// not. The value of an option is the next word whole, whatever its kind.
bool buildCall(const Command& command, const TArray<ScriptWord>& words, TArray<Variable>& args,
               TArray<CommandOption>& options, HString& refusal) {
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
      refusal.Format("unknown option %s for %s", word.text.GetStr(), command.getName());
      return false;
    }
    Variable value;
    if (type != Variable::TypeNone) {
      if (++i == words.count()) {
        refusal.Format("option %s needs a value", word.text.GetStr());
        return false;
      }
      value = stringValue(words[i].text);
    }
    options.add(CommandOption::given(index, value));
  }
  return true;
}

void runWords(PluginSession& session, TArray<ScriptWord>& words, Outcome& outcome) {
  Command* command = session.find(words[0].text);
  if (command == nullptr) {
    outcome.refusal.Format("unknown command %s", words[0].text.GetStr());
    return;
  }
  TArray<Variable> args;
  TArray<CommandOption> options;
  if (!buildCall(*command, words, args, options, outcome.refusal)) return;
  words.removeAll();
  LogCapture capture(outcome.log);
  if (!command->checkArgSyntax(args, options)) {
    HString syntax;
    command->getArgSyntaxString(syntax);
    outcome.refusal.Format("usage: %s %s", command->getName(), syntax.GetStr());
    return;
  }
  outcome.ran = true;
  outcome.ok = command->execute(options, args, outcome.result);
}

}  // namespace

void runScriptLine(PluginSession& session, ScriptLine& line, Outcome& outcome) {
  try {
    if (line.words.count() > 0) outcome.command = line.words[0].text;
    if (!line.error.IsEmpty()) {
      outcome.refusal = line.error;
    } else if (line.words.count() > 0) {
      runWords(session, line.words, outcome);
    }
  } catch (const OutOfMemory&) {
    outcome.outOfMemory = true;
  } catch (const char*) {  // E1224, the module's own out-of-memory exception
    outcome.outOfMemory = true;
  }
  if (outcome.outOfMemory) outcome.result = Variable();
}
