#pragma once

#include "platform/linux/QtEventLoop.h"

#include <gtest/gtest.h>

#include <chrono>
#include <functional>

namespace orvane
{

// A test within an event loop. What it waits for must come long before this limit.
class QtTest : public testing::Test
{
protected:
    bool runUntil(const std::function<bool()>& done)
    {
        return loop.runUntil(done, std::chrono::seconds{30});
    }
    // Serves whatever there is to serve now.
    void turnOnce()
    {
        loop.runUntil([] { return false; }, std::chrono::milliseconds{0});
    }

    QtEventLoop loop;
};

} // namespace orvane
