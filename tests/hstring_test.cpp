// The host string's own edges; the cuts with huge sizes are driven through
// the module's strLeft, strRight and strMid tests.
#include "../host/hstring.h"

#include <gtest/gtest.h>

#include <string>

namespace {

TEST(HStringTest, FindMatchesPartialOverlapsAndClampsItsStart) {
  struct Case {
    const char* text;
    const char* sub;
    int start;
    int expected;
  };
  const Case cases[] = {
      {"aaab", "aab", 0, 1},
      {"abababc", "ababc", 0, 2},
      {"ab", "abc", 0, -1},
      {"abcabc", "bc", 2, 4},
      {"abcabc", "", -1, 0},
      {"abcabc", "", 6, 6},
      {"abcabc", "", 7, -1},
      {"x\x80y", "\x80", 0, 1},
      // Needles longer than 16 bytes take the table-driven search.
      {"aaaaaaaaaaaaaaaaaaaaab", "aaaaaaaaaaaaaaaaab", 0, 4},
      {"abcabcabcabcabcabcab.abcabcabcabcabcabcabd", "abcabcabcabcabcabd", 0, 24},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(std::string(c.text) + " / " + c.sub + " @" + std::to_string(c.start));
    EXPECT_EQ(HString(c.text).Find(c.sub, c.start), c.expected);
  }
  EXPECT_EQ(HString("abc").Find(nullptr, 1), 1);
  const std::string needle = std::string(4096, 'a') + "b";
  const std::string text = std::string(65536, 'a') + "b";
  EXPECT_EQ(HString(text.c_str()).Find(needle.c_str()),
            static_cast<int>(text.size() - needle.size()));
}

TEST(HStringTest, ReplaceGoesLeftToRightWithoutRescanning) {
  struct Case {
    const char* text;
    const char* oldText;
    const char* newText;
    const char* expected;
    int count;
  };
  const Case cases[] = {
      {"a.b.c", ".", "--", "a--b--c", 2}, {"aaa", "aa", "b", "ba", 1},  // no overlaps
      {"aaa", "a", "aa", "aaaaaa", 3},  // inserted text is not searched
      {"abc", "", "x", "abc", 0},       // empty old text changes nothing
      {"abcabc", "abc", "", "", 2},       {"hello", "l", nullptr, "heo", 2},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(std::string(c.text) + " / " + c.oldText);
    HString text(c.text);
    EXPECT_EQ(text.Replace(c.oldText, c.newText), c.count);
    EXPECT_STREQ(text.GetStr(), c.expected);
  }
}

TEST(HStringTest, IndexingAndAppendingStayInBounds) {
  HString text("ab");
  const HString& constText = text;
  EXPECT_EQ(constText[2], '\0');
  EXPECT_EQ(constText[-1], '\0');
  text[5] = 'x';  // lands in scratch, not in the string
  text[-3] = 'y';
  text += '\0';
  for (int i = 0; i < 1000; ++i) text += 'c';
  EXPECT_EQ(std::string(text.GetStr()), "ab" + std::string(1000, 'c'));
  text = text.GetStr() + 1000;  // assigning from its own text
  EXPECT_STREQ(text.GetStr(), "cc");
}

TEST(HStringTest, FormatBuildsPrintfText) {
  HString text("old");
  text.Format("%d-%s-%c", 42, "x", 'y');
  EXPECT_STREQ(text.GetStr(), "42-x-y");
  text.Format("<%s>", text.GetStr());  // from its own text
  EXPECT_STREQ(text.GetStr(), "<42-x-y>");
  text.Format("%s", "");
  EXPECT_TRUE(text.IsEmpty());
}

}  // namespace
