// Drives commands of the loaded module the way a host does: check the
// arguments, then run execute with a result value the test inspects, with
// every log message caught.
#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "../host/command.h"
#include "../tools/log_capture.h"
#include "../tools/plugin_session.h"
#include "../tools/script_values.h"

Variable str(const char* text);
Variable num(int value);

// An option given to a run: its declared-option index and value (none for a flag).
struct Given {
  int index;
  Variable value;
};
Given flag(int index);
Given value(int index, const char* text);

// The result value a run starts with, so that "left untouched" is visible.
Variable untouchedResult();
bool isUntouched(const Variable& result);

struct CommandRun {
  bool accepted = false;  // what checkArgSyntax answered
  bool ok = false;        // what execute returned; false when it did not run
  Variable result = untouchedResult();
  std::vector<LogEntry> log;
};

CommandRun runCommand(Command& command, const std::vector<Variable>& args,
                      const std::vector<Given>& options = {});

// A module loaded afresh, with new command objects; command() uses the
// program's shared one.
std::unique_ptr<PluginSession> freshModule();
Command& command(const char* name);

// The string elements of an array result.
std::vector<std::string> elements(const Variable& value);
