// testPrint: writes the same three information messages to the host's log on
// every run and never touches the result.
#pragma once

#include "command.h"

class TestPrintCmd : public Command {
 public:
  TestPrintCmd();
  void deleteThis() override;
  const HRuntimeClass* getRuntimeClass() const override;
  bool execute(const TArray<CommandOption>& options, const TArray<Variable>& args,
               Variable& result) override;

 protected:
  ~TestPrintCmd() override;
};
