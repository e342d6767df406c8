#include <gtest/gtest.h>

#include <vector>

#include "command_runner.h"

namespace {

TEST(TestPrintTest, LogsThreeInfoMessagesAndNeverWritesTheResult) {
  const std::vector<LogEntry> expected = {
      {LogInfo, "Simple call to logInfo"},
      {LogInfo, "Call to logInfo with 2 arguments, woohoo "},
      {LogInfo, "Call to logInfo from HString::Format with 2 arguments, woohoo "},
  };
  for (const std::vector<Variable>& args :
       {std::vector<Variable>{}, {num(7), str("x")}, {Variable(Variable::TypeStringArray, 2)}}) {
    const CommandRun run = runCommand(command("testPrint"), args, {flag(0), flag(3)});
    EXPECT_TRUE(run.ok);
    EXPECT_TRUE(isUntouched(run.result));
    EXPECT_EQ(run.log, expected);
  }
}

}  // namespace
