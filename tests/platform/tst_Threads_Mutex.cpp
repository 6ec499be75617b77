#include "Threads_Mutex.h"
#include "Threads_MutexTenure.h"

#include <gtest/gtest.h>

#include <atomic>
#include <thread>

TEST(Threads_MutexTest, IsRecursiveAndExcludesOtherThreads)
{
    Threads::Mutex mutex("Test Mutex", false);
    EXPECT_EQ(mutex.name(), "Test Mutex");
    std::atomic<bool> otherGotIn(false);
    {
        Threads::MutexTenure outer(mutex, nullptr);
        Threads::MutexTenure inner(mutex, "again"); // same thread: no deadlock
        std::thread other([&] { otherGotIn = mutex.try_lock(); if (otherGotIn) mutex.unlock(); });
        other.join();
    }
    EXPECT_FALSE(otherGotIn.load());
    std::thread after([&] { otherGotIn = mutex.try_lock(); if (otherGotIn) mutex.unlock(); });
    after.join();
    EXPECT_TRUE(otherGotIn.load());
}
