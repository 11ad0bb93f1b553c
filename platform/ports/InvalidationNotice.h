#pragma once

#include "platform/ports/MessagePort.h"
#include "platform/services/MainQueue.h"

#include <functional>
#include <memory>

namespace orvane
{

// Tells a port's owner once, on the main queue, that the port has become invalid. A member of the
// port: the call does not come once the port is gone or the callback cleared. A callback set on a
// port that is invalid already is called as well.
class InvalidationNotice
{
public:
    using Callback = std::function<void(MessagePort&)>;

    InvalidationNotice(MainQueue& queue, MessagePort& port);
    void setCallback(Callback callback);
    // Only the first call has an effect.
    void portIsInvalid();

private:
    struct State {
        MessagePort& port;
        Callback callback;
        bool invalid = false;
    };

    void queueCall();

    MainQueue& _queue;
    std::shared_ptr<State> _state;
};

} // namespace orvane
