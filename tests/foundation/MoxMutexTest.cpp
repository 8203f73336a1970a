#include "foundation/common/MoxMutex.h"

#include <climits>
#include <gtest/gtest.h>
#include <thread>

namespace {

using MoxCommonNS::MoxMutex;

TEST(MoxMutex, ReturnsTheNewValue) {
    int count = 0;
    EXPECT_EQ(MoxMutex::interlockedIncrement(count), 1);
    EXPECT_EQ(MoxMutex::interlockedIncrement(count), 2);
    EXPECT_EQ(MoxMutex::interlockedDecrement(count), 1);
    EXPECT_EQ(MoxMutex::interlockedDecrement(count), 0);
    EXPECT_EQ(MoxMutex::interlockedDecrement(count), -1);
    EXPECT_EQ(count, -1);
}

TEST(MoxMutex, LosesNoChangeOfTwoThreads) {
    constexpr int changes = 200000;
    int count = 0;
    const auto raise = [&count] {
        for (int i = 0; i < changes; ++i) {
            MoxMutex::interlockedIncrement(count);
        }
    };
    std::thread one(raise);
    std::thread other(raise);
    one.join();
    other.join();
    EXPECT_EQ(count, 2 * changes);

    const auto lower = [&count] {
        for (int i = 0; i < changes; ++i) {
            MoxMutex::interlockedDecrement(count);
        }
    };
    std::thread third(lower);
    std::thread fourth(lower);
    third.join();
    fourth.join();
    EXPECT_EQ(count, 0);
}

} // namespace
