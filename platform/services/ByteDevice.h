#pragma once

#include "platform/base/Bytes.h"

#include <functional>
#include <memory>
#include <string>

namespace orvane
{

// An open device that carries bytes both ways, such as a serial port. Destroying it closes it. All
// operations belong to the thread of the event loop that serves it.
class ByteDevice
{
public:
    // Bytes from the device, in any pieces; the view is valid during the call.
    using ReceivedCallback = std::function<void(ByteView bytes)>;
    // The device is gone (unplugged, say) or broken, with the reason as a part of a sentence.
    using ClosedCallback = std::function<void(const std::string& reason)>;

    virtual ~ByteDevice() = default;
    // Neither callback comes from within a call of the owner, and none after the closed callback,
    // which comes at most once. A callback may destroy the device. Bytes that arrive before the
    // callbacks are set wait for them.
    virtual void setCallbacks(ReceivedCallback received, ClosedCallback closed) = 0;
    // Sends the bytes as the device takes them; they are copied. Does nothing once it is closed.
    virtual void write(ByteView bytes) = 0;
};

// Opens a certain device, for this program alone. Null, with one line in `error` that names the
// device, the cause and the remedy, where that fails.
using OpenByteDevice = std::function<std::unique_ptr<ByteDevice>(std::string& error)>;

} // namespace orvane
