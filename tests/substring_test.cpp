#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "command_runner.h"

namespace {

struct StringCase {
  const char* command;
  std::vector<Variable> args;
  const char* expected;
};

TEST(SubstringTest, SizesAreSignExtendedAndClampedByTheHostString) {
  const StringCase cases[] = {
      {"strLeft", {str("abcdef"), num(2)}, "ab"},
      {"strLeft", {str("abcdef"), num(0)}, ""},
      {"strLeft", {str("abcdef"), num(99)}, "abcdef"},
      {"strLeft", {str("abcdef"), num(-1)}, "abcdef"},  // 2^64 - 1
      {"strLeft", {str("abcdef"), num(-5)}, "abcdef"},
      {"strLeft", {str("abcdef"), num(INT_MIN)}, "abcdef"},
      {"strLeft", {str(""), num(3)}, ""},
      {"strRight", {str("abcdef"), num(2)}, "ef"},
      {"strRight", {str("abcdef"), num(0)}, ""},
      {"strRight", {str("abcdef"), num(-1)}, "abcdef"},
      {"strRight", {str("abcdef"), num(INT_MIN)}, "abcdef"},
      {"strRight", {str("abcdef"), num(INT_MAX)}, "abcdef"},
      {"strMid", {str("abcdef"), num(2), num(-1)}, "cdef"},  // only -1 means "to the end"
      {"strMid", {str("abcdef"), num(2), num(-2)}, "cdef"},  // size 2^64 - 2, clamped
      {"strMid", {str("abcdef"), num(2), num(0)}, ""},
      {"strMid", {str("abcdef"), num(1), num(3)}, "bcd"},
      {"strMid", {str("abcdef"), num(-1), num(-1)}, ""},  // first 2^64 - 1
      {"strMid", {str("abcdef"), num(-2), num(3)}, ""},
      {"strMid", {str("abcdef"), num(INT_MIN), num(INT_MIN)}, ""},
      {"strMid", {str("abcdef"), num(6), num(1)}, ""},
      {"strMid", {str("abcdef"), num(INT_MAX), num(-1)}, ""},
      {"strReplace", {str("a-b-c"), str("-"), str("+")}, "a+b+c"},
      {"strReplace", {str("abc"), str("x"), str("y")}, "abc"},
      {"strReplace", {str("abc"), str(""), str("y")}, "abc"},
      {"strReplace", {str("abc"), str("b"), str("")}, "ac"},
      {"strReplace", {str("aaaa"), str("aa"), str("a")}, "aa"},
  };
  for (const StringCase& c : cases) {
    SCOPED_TRACE(std::string(c.command) + " " + c.args[0].getStringValue(-1) + " " +
                 std::to_string(c.args[1].getIntValue(-1)) + " -> " + c.expected);
    const CommandRun run = runCommand(command(c.command), c.args);
    ASSERT_TRUE(run.accepted);
    EXPECT_TRUE(run.ok);
    EXPECT_TRUE(run.log.empty());
    EXPECT_EQ(run.result.getType(), Variable::TypeString);
    EXPECT_STREQ(run.result.getStringValue(-1), c.expected);
  }
}

TEST(SubstringTest, ArgumentsAreNeverChanged) {
  TArray<Variable> args;
  args.add(str("a-b"));
  args.add(str("-"));
  args.add(str("+"));
  Variable result;
  EXPECT_TRUE(command("strReplace").execute(TArray<CommandOption>(), args, result));
  EXPECT_STREQ(result.getStringValue(-1), "a+b");
  EXPECT_STREQ(args[0].getStringValue(-1), "a-b");
}

}  // namespace
