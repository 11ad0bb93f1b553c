#pragma once

namespace orvane
{

// The one process-wide recursive lock around every change of, and every walk over, an array of the
// display. Only the main thread takes it.
class ArrayLock
{
public:
    static void lockArray();
    // Releases the lock once when the depth returns to 0 (modulo 256), however often it was taken.
    static void unlockArray();
    // Takes the lock once, without counting it, if no other thread holds it. For diagnosis.
    static bool tryLock();
    static void unlock();

    // Holds the lock while it lives.
    class Guard
    {
    public:
        Guard() { lockArray(); }
        ~Guard() { unlockArray(); }
        Guard(const Guard&) = delete;
        Guard& operator=(const Guard&) = delete;
    };
};

} // namespace orvane
