#pragma once

#include "platform/linux/QtEventLoop.h"

#include <gtest/gtest.h>

#include <chrono>
#include <functional>

namespace orvane
{

// A test with an event loop.
class QtTest : public testing::Test
{
protected:
    bool runUntil(const std::function<bool()>& done)
    {
        return loop.runUntil(done, std::chrono::seconds{30});
    }
    // Repeats attempts until one succeeds, for things that a busy machine sometimes prevents.
    static bool eventually(const std::function<bool()>& attempt)
    {
        const auto end = std::chrono::steady_clock::now() + std::chrono::seconds{30};
        do {
            if (attempt())
                return true;
        } while (std::chrono::steady_clock::now() < end);
        return false;
    }
    // Runs everything that is pending now.
    void turnOnce()
    {
        loop.runUntil([] { return false; }, std::chrono::milliseconds{0});
    }

    QtEventLoop loop;
};

} // namespace orvane
