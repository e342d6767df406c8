#include "test_print.h"

#include "database.h"
#include "command_frame.h"

TestPrintCmd::TestPrintCmd() : Command("testPrint", "Tests print command", "") {
  setCategory(*this, kTestingCategory);
}

TestPrintCmd::~TestPrintCmd() = default;

void TestPrintCmd::deleteThis() {
  releaseCommand(*this);
}

const HRuntimeClass* TestPrintCmd::getRuntimeClass() const {
  return commandRuntimeClass();
}

bool TestPrintCmd::execute(const TArray<CommandOption>& /*options*/,
                           const TArray<Variable>& /*args*/, Variable& /*result*/) {
  g_db->logInfo("Simple call to logInfo");
  {
    const HString word("woohoo");
    g_db->logInfo("Call to logInfo with %d arguments, %s ", 2, word.GetStr());
  }
  HString message;
  {
    const HString word("woohoo");
    message.Format("Call to logInfo from HString::Format with %d arguments, %s ", 2, word.GetStr());
  }
  g_db->logInfo(message.GetStr());
  return true;
}
