// The plug-in's command list grows linearly by its step and keeps its order;
// what it does when the heap refuses is in boundary_test.
#include "plugin/simple_array.h"

#include <gtest/gtest.h>

namespace {

int g_targets[40];

TEST(SimpleArrayTest, GrowsLinearlyByItsStepAndKeepsOrder) {
  TSimpleArray<int*> list(16);
  const int counts[] = {0, 1, 16, 17, 33};
  const int capacities[] = {0, 16, 16, 32, 48};
  for (int step = 0, added = 0; step < 5; ++step) {
    while (added < counts[step]) EXPECT_TRUE(list.add(&g_targets[added++]));
    EXPECT_EQ(list.capacity(), capacities[step]) << "after " << added;
  }
  for (int i = 0; i < list.count(); ++i) EXPECT_EQ(list.at(i), &g_targets[i]);
  EXPECT_EQ(list.at(-1), nullptr);
  EXPECT_EQ(list.at(list.count()), nullptr);
}

}  // namespace
