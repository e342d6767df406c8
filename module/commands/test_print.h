// testPrint: writes the same three information messages to the host's log on
// every run and never touches the result. Its argument syntax, argument check,
// result type and solo answer are the host's defaults.
#pragma once

#include "command_frame.h"

class TestPrintCmd : public CommandFrame<TestPrintCmd> {
 public:
  static const CommandDescription kDescription;
  static CommandRun run;
};
