// The string array strTokArray collects its tokens in, the host's TArray:
// growing keeps every string, short and long, and removing closes the gap.
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

// n elements "0", "1", ...; every third one long enough for the heap.
std::vector<std::string> fill(HStringArray& array, int n) {
  std::vector<std::string> added;
  for (int i = 0; i < n; ++i) {
    added.push_back(std::to_string(i) + std::string(i % 3 == 0 ? 20 : 0, 'x'));
    array.add(HString(added.back().c_str()));
  }
  return added;
}

TEST(HStringArrayTest, GrowsAndRemovesKeepingOrder) {
  HStringArray grown;
  EXPECT_EQ(contents(grown), fill(grown, 100));
  struct Case {
    int index;
    int n;
    std::vector<int> kept;
  };
  const Case cases[] = {
      {1, 2, {0, 3, 4}},       {3, 4, {0, 1, 2}},        {0, 99, {}},
      {5, 1, {0, 1, 2, 3, 4}}, {-1, 2, {0, 1, 2, 3, 4}}, {2, -3, {0, 1, 2, 3, 4}}};
  for (const Case& c : cases) {
    SCOPED_TRACE(std::to_string(c.index) + "," + std::to_string(c.n));
    HStringArray array;
    const std::vector<std::string> added = fill(array, 5);
    array.removeAt(c.index, c.n);
    std::vector<std::string> expected;
    for (int i : c.kept) expected.push_back(added[static_cast<size_t>(i)]);
    EXPECT_EQ(contents(array), expected);
  }
  grown.removeAll();
  grown.add(HString("again"));
  EXPECT_EQ(contents(grown), std::vector<std::string>{"again"});
}

}  // namespace
