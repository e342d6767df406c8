// The host string's edges that no script reaches: null operands, positions
// outside the string, NUL characters and formatting. Scripts drive the rest.
#include "../host/hstring.h"

#include <gtest/gtest.h>

#include <string>

namespace {

TEST(HStringTest, IndexingAppendingAndAssigningStayInBounds) {
  const HString empty;
  EXPECT_EQ(empty.GetLength(), 0);
  EXPECT_STREQ(empty.GetStr(), "");
  HString text("ab");
  const HString& constText = text;
  EXPECT_EQ(constText[0], 'a');
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

TEST(HStringTest, NullOperandsCountAsEmpty) {
  HString text("hello");
  EXPECT_EQ(text.Find(nullptr, 1), 1);
  EXPECT_GT(text.Compare(nullptr), 0);
  EXPECT_EQ(HString().CompareNoCase(nullptr), 0);
  EXPECT_EQ(text.Replace(nullptr, "x"), 0);
  EXPECT_EQ(text.Replace("l", nullptr), 2);
  EXPECT_STREQ(text.GetStr(), "heo");
  EXPECT_EQ(text.GetLength(), 3);
  EXPECT_STREQ(HString(nullptr).GetStr(), "");
}

TEST(HStringTest, FormatBuildsPrintfText) {
  HString text("old");
  text.Format("%d-%s-%c", 42, "x", 'y');
  EXPECT_STREQ(text.GetStr(), "42-x-y");
  text.Format("<%s>", text.GetStr());  // from its own text
  EXPECT_STREQ(text.GetStr(), "<42-x-y>");
  text.Format("%s", "");
  EXPECT_TRUE(text.IsEmpty());
  text.Format(nullptr);
  EXPECT_TRUE(text.IsEmpty());
}

}  // namespace
