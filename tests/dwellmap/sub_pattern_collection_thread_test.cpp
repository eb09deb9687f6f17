#include "dwellmap_test_support.h"

#include <gtest/gtest.h>

#include <thread>
#include <vector>

using namespace dwellmap_test;

// Each thread fills its own lists (a list serves one writer) and adds them to the shared collection
// while reading it: 4 threads × 50 lists of 3 points give 200 sub patterns and 600 points.
TEST(SubPatternCollectionThreads, ConcurrentAddsAndReadsLoseNothing) {
    constexpr int kThreads = 4;
    constexpr int kListsPerThread = 50;
    auto collection = NewCollection();
    std::vector<std::thread> threads;
    for (int t = 0; t < kThreads; ++t) {
        threads.emplace_back([&collection, t] {
            for (int i = 0; i < kListsPerThread; ++i) {
                auto list = ListOf(PointsWithDwells({1, static_cast<std::uint16_t>(t + 2), 100}));
                EXPECT_EQ(collection->Add(list, t, 0, 0, 1), S_OK);
                std::uint32_t total = 0;
                EXPECT_EQ(collection->get_TotalPointCount(&total), S_OK);
                EXPECT_GE(total, 3u * static_cast<std::uint32_t>(i + 1));
            }
        });
    }
    for (auto& thread : threads)
        thread.join();

    std::int32_t count = 0;
    std::uint32_t total = 0;
    std::uint16_t maximum = 0;
    ASSERT_EQ(collection->get_Count(&count), S_OK);
    ASSERT_EQ(collection->get_TotalPointCount(&total), S_OK);
    ASSERT_EQ(collection->get_MaximumDwellTicks(&maximum), S_OK);
    EXPECT_EQ(count, kThreads * kListsPerThread);
    EXPECT_EQ(total, 600u);
    EXPECT_EQ(maximum, 100);
}
