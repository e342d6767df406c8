#include "../host/variable.h"

#include <gtest/gtest.h>

namespace {

TEST(VariableTest, ArrayElementsStayInRangeAndCopiesAreDeep) {
  Variable array(Variable::TypeStringArray, 2);
  array.setValue("a", 0);
  array.setValue("b", 1);
  array.setValue("lost", 2);
  array.setValue("lost", -2);
  array.setValue(7, 0);
  EXPECT_EQ(array.getCount(), 2);
  EXPECT_STREQ(array.getStringValue(0), "a");
  EXPECT_STREQ(array.getStringValue(1), "b");
  EXPECT_STREQ(array.getStringValue(2), "");
  EXPECT_STREQ(array.getStringValue(-1), "");
  EXPECT_EQ(array.getIntValue(-1), 0);

  Variable copy;
  copy = array;
  array.setValue("changed", 0);
  EXPECT_EQ(copy.getType(), Variable::TypeStringArray);
  EXPECT_STREQ(copy.getStringValue(0), "a");
  copy = copy;
  EXPECT_STREQ(copy.getStringValue(1), "b");
  copy.setValue(5, -1);
  EXPECT_EQ(copy.getCount(), 0);
  EXPECT_EQ(copy.getIntValue(-1), 5);
}

TEST(VariableTest, UnknownTypeCodesAreNone) {
  const Variable v(static_cast<Variable::VarType>(7), 3);
  EXPECT_EQ(v.getType(), Variable::TypeNone);
  EXPECT_EQ(v.getCount(), 0);
  EXPECT_STREQ(v.getStringValue(-1), "");
}

}  // namespace
