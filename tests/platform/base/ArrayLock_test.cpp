#include "platform/base/ArrayLock.h"

#include <gtest/gtest.h>
#include <thread>

namespace orvane
{
namespace
{

// Whether another thread can take the lock. It releases the lock again.
bool isFreeForAnotherThread()
{
    bool isFree = false;
    std::thread([&isFree] {
        isFree = ArrayLock::tryLock();
        if (isFree)
            ArrayLock::unlock();
    }).join();
    return isFree;
}

TEST(ArrayLockTest, LockOnceThenUnlockFreesIt)
{
    EXPECT_TRUE(isFreeForAnotherThread());
    ArrayLock::lockArray();
    EXPECT_FALSE(isFreeForAnotherThread());
    ArrayLock::unlockArray();
    EXPECT_TRUE(isFreeForAnotherThread());
}

// Deliberate: nested pairs take the lock several times but release it only once.
TEST(ArrayLockTest, LockTwiceThenUnlockTwiceLeavesItTakenOnce)
{
    ArrayLock::lockArray();
    ArrayLock::lockArray();
    ArrayLock::unlockArray();
    EXPECT_FALSE(isFreeForAnotherThread());
    ArrayLock::unlockArray();
    EXPECT_FALSE(isFreeForAnotherThread());
    ArrayLock::unlock();
    EXPECT_TRUE(isFreeForAnotherThread());
}

TEST(ArrayLockTest, ThreadThatHoldsTheLeftoverTakesTheLockAgain)
{
    ArrayLock::lockArray();
    ArrayLock::lockArray();
    ArrayLock::unlockArray();
    ArrayLock::unlockArray();

    EXPECT_TRUE(ArrayLock::tryLock());
    ArrayLock::unlock();
    ArrayLock::lockArray();
    ArrayLock::unlockArray();
    EXPECT_FALSE(isFreeForAnotherThread());
    ArrayLock::unlock();
    EXPECT_TRUE(isFreeForAnotherThread());
}

// Deliberate: the depth is counted in 8 bits.
TEST(ArrayLockTest, DepthIsCountedModulo256)
{
    constexpr int kTimes = 257;
    for (int i = 0; i < kTimes; ++i)
        ArrayLock::lockArray();
    ArrayLock::unlockArray(); // the depth is back at 0, so this releases the lock once
    for (int i = 0; i < kTimes - 2; ++i)
        ArrayLock::unlock();
    EXPECT_FALSE(isFreeForAnotherThread());
    ArrayLock::unlock();
    EXPECT_TRUE(isFreeForAnotherThread());
}

TEST(ArrayLockTest, TryLockDoesNotCount)
{
    ArrayLock::lockArray();
    EXPECT_TRUE(ArrayLock::tryLock());
    ArrayLock::unlock();
    ArrayLock::unlockArray();
    EXPECT_TRUE(isFreeForAnotherThread());
}

TEST(ArrayLockTest, GuardHoldsTheLockWhileItLives)
{
    {
        const ArrayLock::Guard guard;
        EXPECT_FALSE(isFreeForAnotherThread());
    }
    EXPECT_TRUE(isFreeForAnotherThread());
}

TEST(ArrayLockTest, OtherThreadWaitsForTheLock)
{
    ArrayLock::lockArray();
    int guarded = 0;
    std::thread other([&guarded] {
        const ArrayLock::Guard guard;
        guarded *= 10;
    });
    guarded = 7;
    ArrayLock::unlockArray();
    other.join();
    EXPECT_EQ(guarded, 70);
}

} // namespace
} // namespace orvane
