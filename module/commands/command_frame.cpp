#include "command_frame.h"

#include <stdint.h>

void releaseCommand(Command& command) {
  command.unref();
}

const HRuntimeClass* commandRuntimeClass() {
  return &Command::s_classCommand;
}

void setCategory(Command& command, const char* category) {
  command.setCommandCategory(HString(category), HString(""));
}

void declareFlagOption(Command& command, const char* name) {
  command.addOption(CommandOption::createInstance(HString(name), 0, Variable::TypeNone, false), 0,
                    false);
}

void declareStringOption(Command& command, const char* name) {
  command.addOption(CommandOption::createInstance(HString(name), 1, Variable::TypeString, false), 0,
                    false);
}

bool argumentsMatch(const TArray<Variable>& args, const Variable::VarType* expected, int count) {
  if (args.count() != count) return false;
  for (int i = 0; i < count; ++i) {
    if (args[i].getType() != expected[i]) return false;
  }
  return true;
}

int declaredOptionIndex(const CommandOption& given, int declaredCount) {
  const int index = given.getIndex();
  return (index >= 0 && index < declaredCount) ? index : -1;
}

size_t widenToSize(int value) {
  return static_cast<size_t>(static_cast<uint64_t>(static_cast<int64_t>(value)));
}
