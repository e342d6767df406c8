#include "plugin/simple_array.h"

#include <gtest/gtest.h>

#include <cstdlib>

namespace {

// A heap that can be told to refuse its next requests.
struct TestHeap {
  static inline bool refuse = false;
  static void* allocate(size_t bytes) { return refuse ? nullptr : std::malloc(bytes); }
  static void release(void* block) { std::free(block); }
};

using CommandList = TSimpleArray<int*, TestHeap>;

int g_targets[40];

TEST(SimpleArrayTest, GrowsLinearlyByItsStepAndKeepsOrder) {
  TestHeap::refuse = false;
  CommandList list(16);
  const int counts[] = {0, 1, 16, 17, 33};
  const int capacities[] = {0, 16, 16, 32, 48};
  for (int step = 0, added = 0; step < 5; ++step) {
    while (added < counts[step]) EXPECT_TRUE(list.add(&g_targets[added++]));
    EXPECT_EQ(list.capacity(), capacities[step]) << "after " << added;
  }
  for (int i = 0; i < list.count(); ++i) EXPECT_EQ(list.at(i), &g_targets[i]);
  EXPECT_EQ(list.at(-1), nullptr);
  EXPECT_EQ(list.at(list.count()), nullptr);
  CommandList stepless(0);  // a step below 1 still grows
  for (int i = 0; i < 3; ++i) stepless.add(&g_targets[i]);
  EXPECT_GE(stepless.capacity(), stepless.count());
  EXPECT_EQ(stepless.at(2), &g_targets[2]);
}

TEST(SimpleArrayTest, RefusedGrowthThrowsE1224AndKeepsTheList) {
  TestHeap::refuse = false;
  CommandList list(16);
  for (int i = 0; i < 16; ++i) list.add(&g_targets[i]);
  int* const* bufferBefore = list.data();
  TestHeap::refuse = true;
  try {
    list.add(&g_targets[16]);
    FAIL() << "no exception";
  } catch (const char* message) {
    EXPECT_STREQ(message, "E1224: Out of memory in TSimpleArray::addSpace");
  }
  TestHeap::refuse = false;
  EXPECT_EQ(list.count(), 16);
  EXPECT_EQ(list.capacity(), 16);
  EXPECT_EQ(list.data(), bufferBefore);
  EXPECT_TRUE(list.add(&g_targets[16]));
  for (int i = 0; i <= 16; ++i) EXPECT_EQ(list.at(i), &g_targets[i]);
}

}  // namespace
