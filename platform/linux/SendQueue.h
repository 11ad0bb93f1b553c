#pragma once

#include "platform/base/Bytes.h"
#include "platform/ports/Frame.h"

namespace orvane
{

// The bytes that a connection has still to write.
class SendQueue
{
public:
    enum class Result { Done, Blocked, Failed };

    [[nodiscard]] std::size_t size() const { return _bytes.size() - _start; }
    // As appendFrame() does.
    void add(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
             ByteView data);
    // Takes the frame added last away again, unless some of it has been written.
    bool withdrawLast();
    // Writes what the socket takes without waiting.
    Result writeTo(int socket);
    void clear();

private:
    Bytes _bytes;
    std::size_t _start = 0;          // of what is not written yet
    std::size_t _lastFrameBytes = 0; // 0 once it cannot be withdrawn
};

} // namespace orvane
