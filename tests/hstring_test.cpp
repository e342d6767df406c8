#include "../host/hstring.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

namespace {

constexpr size_t kMaxSize = SIZE_MAX;

TEST(HStringTest, CutsStayInsideTheString) {
  struct Case {
    const char* name;
    HString (*cut)(const HString&);
    const char* expected;
  };
  const Case cases[] = {
      {"Left 0", [](const HString& s) { return s.Left(0); }, ""},
      {"Left 3", [](const HString& s) { return s.Left(3); }, "abc"},
      {"Left past end", [](const HString& s) { return s.Left(99); }, "abcdef"},
      {"Left 2^64-1", [](const HString& s) { return s.Left(kMaxSize); }, "abcdef"},
      {"Right 2", [](const HString& s) { return s.Right(2); }, "ef"},
      {"Right 2^64-5", [](const HString& s) { return s.Right(kMaxSize - 4); }, "abcdef"},
      {"Mid 2", [](const HString& s) { return s.Mid(2); }, "cdef"},
      {"Mid at end", [](const HString& s) { return s.Mid(6); }, ""},
      {"Mid 2^64-1", [](const HString& s) { return s.Mid(kMaxSize); }, ""},
      {"Mid 1,2", [](const HString& s) { return s.Mid(1, 2); }, "bc"},
      {"Mid 4,2^64-2", [](const HString& s) { return s.Mid(4, kMaxSize - 1); }, "ef"},
      {"Mid 2^64-3,2", [](const HString& s) { return s.Mid(kMaxSize - 2, 2); }, ""},
  };
  const HString text("abcdef");
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    EXPECT_STREQ(c.cut(text).GetStr(), c.expected);
    EXPECT_STREQ(text.GetStr(), "abcdef");
  }
}

TEST(HStringTest, FindClampsItsStart) {
  struct Case {
    const char* text;
    const char* sub;
    int start;
    int expected;
  };
  const Case cases[] = {
      {"abcabc", "bc", 0, 1},   {"abcabc", "bc", 2, 4},     {"abcabc", "bc", -7, 1},
      {"abcabc", "bc", 6, -1},  {"abcabc", "bc", 99, -1},   {"abcabc", "", 3, 3},
      {"abcabc", "", -1, 0},    {"abcabc", "", 7, -1},      {"", "", 0, 0},
      {"aaab", "aab", 0, 1},    {"abababc", "ababc", 0, 2}, {"ab", "abc", 0, -1},
      {"x\x80y", "\x80", 0, 1},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(std::string(c.text) + " / " + c.sub + " @" + std::to_string(c.start));
    EXPECT_EQ(HString(c.text).Find(c.sub, c.start), c.expected);
  }
  EXPECT_EQ(HString("abc").Find(nullptr, 1), 1);
}

TEST(HStringTest, FindHandlesLongRepetitiveNeedles) {
  const std::string needle = std::string(4096, 'a') + "b";
  const std::string text = std::string(65536, 'a') + "b";
  EXPECT_EQ(HString(text.c_str()).Find(needle.c_str()),
            static_cast<int>(text.size() - needle.size()));
  EXPECT_EQ(HString(std::string(65536, 'a').c_str()).Find(needle.c_str()), -1);
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
      {"abc", "x", "y", "abc", 0},        {"abcabc", "abc", "", "", 2}, {"", "a", "b", "", 0},
      {"hello", "l", nullptr, "heo", 2},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(std::string(c.text) + " / " + c.oldText);
    HString text(c.text);
    EXPECT_EQ(text.Replace(c.oldText, c.newText), c.count);
    EXPECT_STREQ(text.GetStr(), c.expected);
  }
}

TEST(HStringTest, CompareOrdersUnsignedBytesAndFoldsOnlyAscii) {
  EXPECT_EQ(HString("abc").Compare("abc"), 0);
  EXPECT_EQ(HString("").Compare(""), 0);
  EXPECT_EQ(HString("a").Compare("c"), -2);  // the byte difference, not just -1
  EXPECT_GT(HString("\x80").Compare("a"), 0);
  EXPECT_LT(HString("ab").Compare("abc"), 0);
  EXPECT_LT(HString("ABC").Compare("abc"), 0);
  EXPECT_EQ(HString("ABC").CompareNoCase("abc"), 0);
  EXPECT_EQ(HString("[").CompareNoCase("{"), '[' - '{');
  EXPECT_NE(HString("\xC4").CompareNoCase("\xE4"), 0);
  EXPECT_GT(HString("a").Compare(nullptr), 0);
}

TEST(HStringTest, IndexingAndAppendingStayInBounds) {
  HString text("ab");
  const HString& constText = text;
  EXPECT_EQ(constText[1], 'b');
  EXPECT_EQ(constText[2], '\0');
  EXPECT_EQ(constText[-1], '\0');
  text[5] = 'x';  // lands in scratch, not in the string
  text[-3] = 'y';
  EXPECT_STREQ(text.GetStr(), "ab");
  text += '\0';
  text += 'c';
  EXPECT_STREQ(text.GetStr(), "abc");
  EXPECT_EQ(text.GetLength(), 3);
  EXPECT_EQ(text.ReverseFind('b'), 1);
  EXPECT_EQ(text.ReverseFind('z'), -1);
  EXPECT_EQ(HString().ReverseFind('a'), -1);
}

TEST(HStringTest, AppendingManyCharactersKeepsThemAll) {
  HString text;
  std::string expected;
  for (int i = 0; i < 1000; ++i) {
    const char c = static_cast<char>('a' + i % 26);
    text += c;
    expected += c;
  }
  EXPECT_EQ(std::string(text.GetStr()), expected);
  HString copy(text);
  copy = copy.GetStr() + 10;  // assigning from its own text
  EXPECT_EQ(std::string(copy.GetStr()), expected.substr(10));
}

TEST(HStringTest, FormatBuildsPrintfText) {
  HString text("old");
  text.Format("%d-%s-%c", 42, "x", 'y');
  EXPECT_STREQ(text.GetStr(), "42-x-y");
  text.Format("%s", "");
  EXPECT_TRUE(text.IsEmpty());
}

}  // namespace
