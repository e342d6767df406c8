#include "test_print.h"

#include "database.h"
#include "hstring.h"

const CommandDescription TestPrintCmd::kDescription{
    "testPrint",        "Tests print command", "Testing", nullptr,
    Variable::TypeNone, kHostSoloAnswer,       nullptr,   0};

bool TestPrintCmd::run(const TArray<CommandOption>& /*options*/, const TArray<Variable>& /*args*/,
                       Variable& /*result*/) {
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
  g_db->logInfo("%s", message.GetStr());
  return true;
}
