// What one script line did, and how the console runs it: it finds the
// command the line names, builds its arguments and options, checks them with
// the command's own check and, when they pass, runs it.
#pragma once

#include "hstring.h"
#include "log_capture.h"
#include "plugin_session.h"
#include "script_line.h"
#include "tarray.h"
#include "variable.h"

struct Outcome {
  HString command;  // as written
  bool ran = false;
  bool ok = false;
  HString refusal;  // why the line was refused before running
  bool outOfMemory = false;
  Variable result;
  TArray<LogEntry> log;

  // Whether the console refused the line or cut it short.
  bool stopped() const { return outOfMemory || !refusal.IsEmpty(); }
  // Why it did: the refusal, or "out of memory".
  const char* reason() const { return outOfMemory ? "out of memory" : refusal.GetStr(); }
  // Whether the line ran and succeeded.
  bool succeeded() const { return ran && ok && !stopped(); }
};

// Runs a read line into outcome. The line's words are let go once the call
// is built, so that a long line is not held twice while the command runs.
// Running out of memory anywhere fails the line alone and leaves the console
// as it was.
void runScriptLine(PluginSession& session, ScriptLine& line, Outcome& outcome);
