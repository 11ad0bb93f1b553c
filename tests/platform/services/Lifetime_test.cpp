#include "platform/services/Lifetime.h"

#include <functional>
#include <gtest/gtest.h>
#include <memory>

namespace orvane
{

namespace
{

struct Owner {
    explicit Owner(int& calls) : count(calls) {}
    std::function<void()> counting()
    {
        return lifetime.whileAlive([this] { ++count; });
    }
    int& count;
    Lifetime lifetime;
};

} // namespace

TEST(LifetimeTest, ATaskRunsAsOftenAsItIsCalledWhileItsOwnerLives)
{
    int count = 0;
    Owner owner(count);
    const auto task = owner.counting();
    task();
    task();
    EXPECT_EQ(count, 2);
}

TEST(LifetimeTest, ATaskDoesNothingOnceItsOwnerIsGone)
{
    int count = 0;
    auto owner = std::make_unique<Owner>(count);
    const auto task = owner->counting();
    owner.reset();
    task();
    EXPECT_EQ(count, 0);
}

TEST(LifetimeTest, ATaskMayDestroyItsOwner)
{
    int count = 0;
    auto owner = std::make_unique<Owner>(count);
    const std::function<void()> task = owner->lifetime.whileAlive([&] { owner.reset(); });
    task();
    EXPECT_EQ(owner, nullptr);
    task();
    EXPECT_EQ(owner, nullptr);
}

} // namespace orvane
