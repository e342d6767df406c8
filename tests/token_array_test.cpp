#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "command_runner.h"

namespace {

using Tokens = std::vector<std::string>;

TEST(StrTokArrayTest, SplitsIntoExactlyTheTokens) {
  struct Case {
    const char* text;
    std::vector<Given> options;
    Tokens expected;
  };
  const Given comma = value(0, ",");
  const Given colons = value(0, "::");
  const Case cases[] = {
      {" a\tb\r\n", {}, {"a", "b"}},
      {"whole", {}, {"whole"}},
      {"a,,b", {comma}, {"a", "b"}},
      {",,a,,b,,", {comma}, {"a", "b"}},
      {"a,,b", {comma, flag(1)}, {"a", "", "b"}},
      {",a", {comma, flag(1)}, {"", "a"}},
      {"a,", {comma, flag(1)}, {"a"}},
      {",", {comma, flag(1)}, {""}},
      {",,,", {comma, flag(1)}, {"", "", ""}},
      {"a:::b", {colons, flag(1)}, {"a", ":b"}},
      {"::::", {colons, flag(1)}, {"", ""}},
      {"a b c", {flag(1)}, {"a b c"}},
      {"a \t\n\rb", {flag(1)}, {"a", "b"}},
      {"a\xFF"
       "b\xFF\xFF"
       "c",
       {value(0, "\xFF")},
       {"a", "b", "c"}},
      {"a;b,c", {value(0, ","), value(0, ";")}, {"a", "b,c"}},
      {"a,b", {comma, flag(5), flag(-2), flag(1)}, {"a", "b"}},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.text);
    const CommandRun run = runCommand(command("strTokArray"), {str(c.text)}, c.options);
    EXPECT_TRUE(run.ok);
    EXPECT_TRUE(run.log.empty());
    EXPECT_EQ(run.result.getType(), Variable::TypeStringArray);
    EXPECT_EQ(elements(run.result), c.expected);
  }
}

TEST(StrTokArrayTest, ManyTokensKeepTheirOrder) {
  std::string text;
  Tokens expected;
  for (int i = 0; i < 1000; ++i) {
    expected.push_back("t" + std::to_string(i));
    text += expected.back() + (i % 3 == 0 ? "  " : "\t");
  }
  const CommandRun run = runCommand(command("strTokArray"), {str(text.c_str())});
  EXPECT_EQ(elements(run.result), expected);
  const CommandRun twenty =
      runCommand(command("strTokArray"), {str("a b c d e f g h i j k l m n o p q r s t")});
  EXPECT_EQ(twenty.result.getCount(), 20);
  EXPECT_STREQ(twenty.result.getStringValue(19), "t");
}

TEST(StrTokArrayTest, NoTokenWarnsAndLeavesTheResult) {
  struct Case {
    const char* text;
    std::vector<Given> options;
  };
  const Case cases[] = {{"", {}}, {"", {flag(1)}}, {" \t \t", {}}, {",,,", {value(0, ",")}}};
  for (const Case& c : cases) {
    SCOPED_TRACE(c.text);
    const CommandRun run = runCommand(command("strTokArray"), {str(c.text)}, c.options);
    EXPECT_TRUE(run.ok);
    EXPECT_TRUE(isUntouched(run.result));
    EXPECT_EQ(run.log, (std::vector<LogEntry>{{LogWarning, "Couldn't find any string tokens"}}));
  }
}

TEST(StrTokArrayTest, EmptyDelimsIsAnError) {
  for (const std::vector<Given>& options : {std::vector<Given>{value(0, "")},
                                            {value(0, ","), value(0, "")},
                                            {value(0, ""), value(0, ",")}}) {
    const CommandRun run = runCommand(command("strTokArray"), {str("a,b")}, options);
    EXPECT_FALSE(run.ok);
    EXPECT_TRUE(isUntouched(run.result));
    EXPECT_EQ(run.log,
              (std::vector<LogEntry>{{LogError, "Empty string argument for -delims option"}}));
  }
}

}  // namespace
