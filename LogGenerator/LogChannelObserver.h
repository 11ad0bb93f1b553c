#pragma once

#include "platform/base/PropertyValue.h"

namespace orvane
{

// Sees what comes in on the log channel, whatever the decoders make of it. On the main queue.
class LogChannelObserver
{
public:
    virtual ~LogChannelObserver() = default;
    // A channel of that technology (as the server names it) is about to be started.
    virtual void channelOpened(const PropertyValue& technology) = 0;
    // One message, as it came (see LogMessage.h). The bytes are there for this call only.
    virtual void messageReceived(ByteView message) = 0;
};

} // namespace orvane
