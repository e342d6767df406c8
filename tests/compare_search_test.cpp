#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "command_runner.h"

namespace {

struct IntCase {
  const char* what;
  const char* command;
  std::vector<Variable> args;
  std::vector<Given> options;
  int expected;
};

void expectIntResults(const std::vector<IntCase>& cases) {
  for (const IntCase& c : cases) {
    SCOPED_TRACE(c.what);
    const CommandRun run = runCommand(command(c.command), c.args, c.options);
    ASSERT_TRUE(run.accepted);
    EXPECT_TRUE(run.ok);
    EXPECT_TRUE(run.log.empty());
    EXPECT_EQ(run.result.getType(), Variable::TypeInt);
    EXPECT_EQ(run.result.getIntValue(-1), c.expected);
  }
}

TEST(CompareSearchTest, StrCompareKeepsTheHostsValue) {
  expectIntResults({
      {"equal", "strCompare", {str("abc"), str("abc")}, {}, 0},
      {"both empty", "strCompare", {str(""), str("")}, {}, 0},
      {"not reduced to -1", "strCompare", {str("a"), str("d")}, {}, 'a' - 'd'},
      {"first orders after", "strCompare", {str("b"), str("a")}, {}, 1},
      {"case counts", "strCompare", {str("ABC"), str("abc")}, {}, 'A' - 'a'},
      {"unsigned bytes", "strCompare", {str("\x80"), str("a")}, {}, 0x80 - 'a'},
      {"shorter first", "strCompare", {str("ab"), str("abc")}, {}, -'c'},
      {"noCase folds ASCII only", "strCompare", {str("\xC4"), str("\xE4")}, {flag(0)}, -0x20},
      {"noCase is no locale", "strCompare", {str("["), str("{")}, {flag(0)}, '[' - '{'},
      {"noCase", "strCompare", {str("ABC"), str("abc")}, {flag(0)}, 0},
      {"noCase twice", "strCompare", {str("ABC"), str("abc")}, {flag(0), flag(0)}, 0},
      {"unknown indexes passed over",
       "strCompare",
       {str("ABC"), str("abc")},
       {flag(1), flag(-1), flag(31), flag(32), flag(INT_MIN)},
       'A' - 'a'},
      {"noCase among unknown ones",
       "strCompare",
       {str("ABC"), str("abc")},
       {flag(7), flag(0), flag(-3)},
       0},
  });
}

TEST(CompareSearchTest, StrFindPassesItsStartOn) {
  expectIntResults({
      {"found", "strFind", {str("abcabc"), str("c"), num(0)}, {}, 2},
      {"from start", "strFind", {str("abcabc"), str("c"), num(3)}, {}, 5},
      {"absent", "strFind", {str("abc"), str("x"), num(0)}, {}, -1},
      {"negative start", "strFind", {str("abc"), str("b"), num(-5)}, {}, 1},
      {"INT_MIN start", "strFind", {str("abc"), str("b"), num(INT_MIN)}, {}, 1},
      {"start past end", "strFind", {str("abc"), str("b"), num(99)}, {}, -1},
      {"INT_MAX start", "strFind", {str("abc"), str("b"), num(INT_MAX)}, {}, -1},
      {"empty substring", "strFind", {str("abc"), str(""), num(2)}, {}, 2},
  });
}

TEST(CompareSearchTest, StrReverseFindUsesTheFirstCharacterOnly) {
  expectIntResults({
      {"slash", "strReverseFind", {str("a/b/c"), str("/")}, {}, 3},
      {"slash then x", "strReverseFind", {str("a/b/c"), str("/x")}, {}, 3},
      {"x absent", "strReverseFind", {str("a/b/c"), str("x")}, {}, -1},
      {"empty text", "strReverseFind", {str(""), str("a")}, {}, -1},
      {"8-bit", "strReverseFind", {str("\xE9t\xE9"), str("\xE9")}, {}, 2},
  });
}

TEST(CompareSearchTest, StrReverseFindRefusesAnEmptyCharacter) {
  const CommandRun run = runCommand(command("strReverseFind"), {str("abc"), str("")});
  EXPECT_FALSE(run.ok);
  EXPECT_TRUE(isUntouched(run.result));
  EXPECT_EQ(run.log,
            (std::vector<LogEntry>{{LogError, "Second argument cannot be an empty string"}}));
}

TEST(CompareSearchTest, StrLengthCountsBytes) {
  expectIntResults({
      {"empty", "strLength", {str("")}, {}, 0},
      {"three 8-bit bytes", "strLength", {str("\xE4\xF6\xFC")}, {}, 3},
      {"ascii", "strLength", {str("hello world")}, {}, 11},
  });
}

}  // namespace
