#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "command_runner.h"

namespace {

using Tokens = std::vector<std::string>;

// One strTok call; the result must be a string and no message logged.
std::string next(Command& tok, const std::vector<Variable>& args,
                 const std::vector<Given>& options) {
  const CommandRun run = runCommand(tok, args, options);
  EXPECT_TRUE(run.ok);
  EXPECT_TRUE(run.log.empty());
  EXPECT_EQ(run.result.getType(), Variable::TypeString);
  return run.result.getStringValue(-1);
}

// Gives text, then calls without an argument: calls results in all.
Tokens walk(const char* text, const std::vector<Given>& options, size_t calls) {
  Command& tok = command("strTok");
  Tokens results{next(tok, {str(text)}, options)};
  while (results.size() < calls) results.push_back(next(tok, {}, options));
  return results;
}

TEST(StrTokTest, WalksTokensInBothModes) {
  struct Case {
    const char* text;
    std::vector<Given> options;
    Tokens expected;
  };
  const Given comma = value(0, ",");
  const Given colons = value(0, "::");
  const Case cases[] = {
      {",,a,,b", {comma}, {"", "a", "b", "", ""}},
      {"a\tb\nc\r ", {}, {"a", "b", "c", ""}},
      {"  word more", {}, {"", "word", "more", ""}},
      {" \t\r\n", {}, {"", ""}},
      {"whole", {}, {"whole", ""}},
      {"a,,b", {comma}, {"a", "b", ""}},
      {"a,,b", {comma, flag(1)}, {"a", "", "b", ""}},
      {"a::b", {colons, flag(1)}, {"a", "b", ""}},
      {"a:::b", {colons, flag(1)}, {"a", ":b", ""}},
      {"a::", {colons, flag(1)}, {"a", "", ""}},
      {"::a", {colons, flag(1)}, {"", "a", ""}},
      {"a b c", {flag(1)}, {"a b c", ""}},  // the whole default sequence is the delimiter
      {"x \t\n\ry \t\n\r", {flag(1)}, {"x", "y", ""}},
      {"a\xFF\xFE"
       "b",
       {value(0, "\xFE\xFF")},
       {"a", "b", ""}},
      {"a;b", {value(0, ","), value(0, ";")}, {"a", "b"}},  // the later delims wins
      {"a,b", {comma, flag(9), flag(-1), flag(1), flag(1)}, {"a", "b", ""}},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(walk(c.text, c.options, c.expected.size()), c.expected);
  }
}

TEST(StrTokTest, EachCallAppliesOnlyItsOwnOptions) {
  Command& tok = command("strTok");
  EXPECT_EQ(next(tok, {str("a,b;c d")}, {value(0, ",")}), "a");
  EXPECT_EQ(next(tok, {}, {value(0, ";")}), "b");
  EXPECT_EQ(next(tok, {}, {}), "c");
  EXPECT_EQ(next(tok, {}, {}), "d");
  EXPECT_EQ(next(tok, {}, {}), "");
}

TEST(StrTokTest, EmptyDelimsFailsAfterTakingTheArgument) {
  Command& tok = command("strTok");
  next(tok, {str("old,text")}, {value(0, ",")});
  const CommandRun run = runCommand(tok, {str("p,q")}, {value(0, ""), value(0, ",")});
  EXPECT_FALSE(run.ok);
  EXPECT_TRUE(isUntouched(run.result));
  EXPECT_EQ(run.log,
            (std::vector<LogEntry>{{LogError, "Empty string argument for -delims option"}}));
  EXPECT_EQ(next(tok, {}, {value(0, ",")}), "p");
  EXPECT_EQ(next(tok, {}, {value(0, ",")}), "q");
}

TEST(StrTokTest, AnEmptyArgumentEmptiesTheRemainder) {
  Command& tok = command("strTok");
  EXPECT_EQ(next(tok, {str("a b")}, {}), "a");
  EXPECT_EQ(next(tok, {str("")}, {}), "");
  EXPECT_EQ(next(tok, {}, {}), "");
}

TEST(StrTokTest, RemainderBelongsToOneCommandObject) {
  std::unique_ptr<PluginSession> other = freshModule();
  ASSERT_TRUE(other);
  Command& fresh = *other->find("strTok");
  EXPECT_EQ(next(fresh, {}, {}), "");  // a new object starts empty
  EXPECT_EQ(next(command("strTok"), {str("x y")}, {}), "x");
  EXPECT_EQ(next(fresh, {str("p q")}, {}), "p");
  EXPECT_EQ(next(command("strTok"), {}, {}), "y");
  EXPECT_EQ(next(fresh, {}, {}), "q");
}

}  // namespace
