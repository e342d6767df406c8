#include "variable.h"

#include <gtest/gtest.h>

#include <string>

#include "tarray.h"

namespace {

TEST(VariableTest, ArrayElementsStayInRangeAndCopiesShareUntilWritten) {
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
  copy.setValue(copy.getStringValue(1), 1);  // from the shared text itself
  EXPECT_EQ(copy.getType(), Variable::TypeStringArray);
  EXPECT_STREQ(copy.getStringValue(0), "a");
  EXPECT_STREQ(array.getStringValue(0), "changed");
  copy = copy;
  EXPECT_STREQ(copy.getStringValue(1), "b");
  Variable moved(static_cast<Variable&&>(copy));
  EXPECT_EQ(copy.getType(), Variable::TypeNone);
  EXPECT_EQ(copy.getCount(), 0);
  moved.setValue(moved.getStringValue(0), -1);
  EXPECT_EQ(moved.getCount(), 0);
  EXPECT_STREQ(moved.getStringValue(-1), "a");
  moved.setValue(5, -1);
  EXPECT_EQ(moved.getIntValue(-1), 5);
}

TEST(VariableTest, NewValuesReadEmpty) {
  const Variable unknown(static_cast<Variable::VarType>(7), 3);
  EXPECT_EQ(unknown.getType(), Variable::TypeNone);
  EXPECT_EQ(unknown.getCount(), 0);
  EXPECT_STREQ(unknown.getStringValue(-1), "");
  EXPECT_EQ(Variable(Variable::TypeInt).getIntValue(-1), 0);
  Variable array(Variable::TypeStringArray, 3);
  for (int i = 0; i < 3; ++i) EXPECT_STREQ(array.getStringValue(i), "");
  array.setValue(5, -1);
  EXPECT_EQ(array.getCount(), 0);
}

// Values move by their constructors when an array of them grows.
TEST(VariableTest, ArraysOfValuesKeepThemAsTheyGrow) {
  TArray<Variable> values;
  for (int i = 0; i < 40; ++i) {
    Variable value;
    value.setValue(("value " + std::to_string(i) + " of forty").c_str(), -1);
    values.add(value);
  }
  values.removeAt(0, 1);
  ASSERT_EQ(values.count(), 39);
  for (int i = 0; i < 39; ++i)
    EXPECT_EQ(values[i].getStringValue(-1), "value " + std::to_string(i + 1) + " of forty");
}

}  // namespace
