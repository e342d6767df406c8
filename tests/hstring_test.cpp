// The host string's edges that no script reaches: null operands, positions
// outside the string, NUL characters and formatting. Scripts drive the rest.
#include "hstring.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <string>

namespace {

TEST(HStringTest, IndexingAppendingAndAssigningStayInBounds) {
  HString text("ab");
  const HString& constText = text;
  EXPECT_EQ(constText[0], 'a');
  EXPECT_EQ(constText.ReverseFind('\0'), -1);
  EXPECT_EQ(constText[2], '\0');
  EXPECT_EQ(constText[-1], '\0');
  text[5] = 'x';  // lands in the string's spare byte, outside its text
  text[-3] = 'y';
  text += '\0';
  for (int i = 0; i < 1000; ++i) text += 'c';
  EXPECT_EQ(std::string(text.GetStr()), "ab" + std::string(1000, 'c'));
  text = text.GetStr() + 1000;  // assigning from its own text
  EXPECT_STREQ(text.GetStr(), "cc");
}

// Texts of up to 10 bytes live inside the string, longer ones on the heap;
// every way in or out of either keeps the text, and so does a write out of range.
TEST(HStringTest, TextsKeepTheirBytesAcrossTheInlineLimit) {
  for (const size_t length : {0, 1, 10, 11, 12, 13, 23, 24, 100}) {
    SCOPED_TRACE(length);
    const std::string text(length, 'x');
    HString built;
    for (size_t i = 0; i < length; ++i) built += 'x';
    built[static_cast<int>(length)] = '!';
    built[-1] = '!';
    HString copy(built);
    HString moved(static_cast<HString&&>(copy));
    EXPECT_EQ(std::string(copy.GetStr()) + "|" + std::to_string(copy.GetLength()), "|0");
    for (const char* other : {"", "short", "a text longer than eleven bytes"}) {
      HString target(other);
      target = moved;
      EXPECT_EQ(target.GetStr() + std::to_string(target.GetLength()),
                text + std::to_string(length));
      target = static_cast<HString&&>(HString(other));
      EXPECT_STREQ(target.GetStr(), other);
    }
    moved = moved.GetStr() + length / 2;  // from its own text
    EXPECT_EQ(moved.GetStr(), text.substr(length / 2));
  }
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
  const std::string wide(300, 'w');  // past the formatting buffer on the stack
  text.Format("<%s>", wide.c_str());
  EXPECT_EQ(text.GetStr(), "<" + wide + ">");
}

}  // namespace
