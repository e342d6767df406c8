// The string array strTokArray collects its tokens in, the host's TArray.
#include "commands/hstring_array.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

std::vector<std::string> contents(const HStringArray& array) {
  std::vector<std::string> out;
  for (int i = 0; i < array.count(); ++i) out.emplace_back(array[i].GetStr());
  return out;
}

void fill(HStringArray& array, int n) {
  for (int i = array.count(); i < n; ++i) array.add(HString(std::to_string(i).c_str()));
}

TEST(HStringArrayTest, GrowsByEightThenDoublingKeepingOrder) {
  HStringArray array;
  EXPECT_EQ(array.growStep(), 8);
  EXPECT_EQ(array.capacity(), 0);
  const int counts[] = {1, 8, 9, 17, 33, 65};
  const int capacities[] = {8, 8, 16, 32, 64, 128};
  for (int step = 0; step < 6; ++step) {
    fill(array, counts[step]);
    EXPECT_EQ(array.capacity(), capacities[step]) << "after " << counts[step];
  }
  for (int i = 0; i < array.count(); ++i) EXPECT_EQ(array[i].GetStr(), std::to_string(i));
  array.removeAll();
  EXPECT_EQ(array.count(), 0);
  EXPECT_EQ(array.capacity(), 128);
  array.add(HString("again"));
  EXPECT_EQ(contents(array), std::vector<std::string>{"again"});
}

TEST(HStringArrayTest, RemoveAtClampsToWhatExists) {
  struct Case {
    int index;
    int n;
    std::vector<std::string> expected;
  };
  const std::vector<std::string> all = {"0", "1", "2", "3", "4"};
  const Case cases[] = {
      {1, 2, {"0", "3", "4"}},
      {3, 4, {"0", "1", "2"}},
      {0, 99, {}},
      {4, 1, {"0", "1", "2", "3"}},
      {5, 1, all},
      {-1, 2, all},
      {2, 0, all},
      {2, -3, all},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(std::to_string(c.index) + "," + std::to_string(c.n));
    HStringArray array;
    fill(array, 5);
    array.removeAt(c.index, c.n);
    EXPECT_EQ(contents(array), c.expected);
  }
}

}  // namespace
