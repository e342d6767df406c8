#include "../tools/script_line.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

std::string describe(const std::vector<ScriptWord>& words) {
  std::string out;
  for (const ScriptWord& w : words) {
    const char* kind = w.kind == ScriptWord::String    ? "s"
                       : w.kind == ScriptWord::Integer ? "i"
                                                       : "o";
    out += std::string(kind) + ":" + w.text +
           (w.kind == ScriptWord::Integer ? "=" + std::to_string(w.number) : "") + " ";
  }
  return out;
}

TEST(ScriptLineTest, SplitsWordsByKind) {
  struct Case {
    std::string line;
    const char* words;
  };
  const Case cases[] = {
      {"strLeft \"a b\" -3", "s:strLeft s:a b i:-3=-3 "},
      {"  x\t-delims , -matchAll 007  ", "s:x o:delims s:, o:matchAll i:007=7 "},
      {"\"-x\" - -5x --y 2147483647", "s:-x s:- s:-5x s:--y i:2147483647=2147483647 "},
      {"\"\\\"\\\\\\t\\n\\r\\x41\\xff\"", "s:\"\\\t\n\rA\xff "},
      {"\"\"", "s: "},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.line);
    std::vector<ScriptWord> words;
    std::string error;
    ASSERT_TRUE(splitScriptLine(c.line, words, error)) << error;
    EXPECT_EQ(describe(words), c.words);
  }
}

TEST(ScriptLineTest, RefusesWhatCannotBeAWord) {
  struct Case {
    std::string line;
    const char* error;
  };
  const Case cases[] = {
      {"s \"abc", "unterminated string"},
      {"s \"a\"b", "a blank must follow a closing quote"},
      {"s \"\\q\"", "unknown escape \\q"},
      {"s \"\\x4\"", "\\x needs two hex digits"},
      {"s \"\\x00\"", "a string cannot hold a NUL byte"},
      {std::string("s \"a\0b\"", 7), "a line cannot hold a NUL byte"},
      {"s 2147483648", "integer out of range: 2147483648"},
      {"s -2147483649", "integer out of range: -2147483649"},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.line);
    std::vector<ScriptWord> words;
    std::string error;
    EXPECT_FALSE(splitScriptLine(c.line, words, error));
    EXPECT_EQ(error, c.error);
  }
}

TEST(ScriptLineTest, SkipsBlankAndCommentLines) {
  EXPECT_TRUE(isSkippedLine(""));
  EXPECT_TRUE(isSkippedLine(" \t\r"));
  EXPECT_TRUE(isSkippedLine("  # note"));
  EXPECT_FALSE(isSkippedLine("strLength \"#\""));
}

}  // namespace
