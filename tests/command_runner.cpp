#include "command_runner.h"

#include <gtest/gtest.h>

Variable str(const char* text) {
  return stringValue(text);
}

Variable num(int value) {
  return integerValue(value);
}

Given flag(int index) {
  return Given{index, Variable()};
}

Given value(int index, const char* text) {
  return Given{index, str(text)};
}

namespace {
const char kUntouched[] = "<untouched>";
}  // namespace

Variable untouchedResult() {
  return str(kUntouched);
}

bool isUntouched(const Variable& result) {
  return result.getType() == Variable::TypeString &&
         std::string(result.getStringValue(-1)) == kUntouched;
}

CommandRun runCommand(Command& command, const std::vector<Variable>& args,
                      const std::vector<Given>& options) {
  TArray<Variable> argArray;
  for (const Variable& arg : args) argArray.add(arg);
  TArray<CommandOption> optionArray;
  for (const Given& given : options)
    optionArray.add(CommandOption::given(given.index, given.value));

  CommandRun run;
  LogCapture capture;
  run.accepted = command.checkArgSyntax(argArray, optionArray);
  if (run.accepted) run.ok = command.execute(optionArray, argArray, run.result);
  run.log = capture.entries();
  return run;
}

std::unique_ptr<PluginSession> freshModule() {
  std::string error;
  std::unique_ptr<PluginSession> session = PluginSession::open(defaultModulePath(), error);
  if (!session) ADD_FAILURE() << error;
  return session;
}

Command& command(const char* name) {
  Command* found = sharedDefaultSession().find(name);
  if (found == nullptr) {
    ADD_FAILURE() << "no command " << name;
    std::abort();
  }
  return *found;
}

std::vector<std::string> elements(const Variable& value) {
  std::vector<std::string> out;
  for (int i = 0; i < value.getCount(); ++i) out.emplace_back(value.getStringValue(i));
  return out;
}
