#pragma once

#include "platform/base/Reading.h"

#include <cstdint>
#include <utility>

namespace orvane
{

// The time of the message that is being decoded, which its readings carry: when it arrived, or when
// it was recorded. It holds from the constructor to the destructor. Without one, readings have no
// time.
class MessageTime
{
public:
    // Milliseconds since 1970 in UTC.
    explicit MessageTime(std::int64_t milliseconds) : _before(std::exchange(_current, milliseconds))
    {
    }
    ~MessageTime() { _current = _before; }
    MessageTime(const MessageTime&) = delete;
    MessageTime& operator=(const MessageTime&) = delete;

    // kNoReadingTime where no message is being decoded.
    [[nodiscard]] static std::int64_t current() { return _current; }

private:
    // Each thread decodes its own messages.
    inline static thread_local std::int64_t _current = kNoReadingTime;
    std::int64_t _before;
};

} // namespace orvane
