#include "platform/ports/InvalidationNotice.h"

#include <utility>

namespace orvane
{

InvalidationNotice::InvalidationNotice(MainQueue& queue, MessagePort& port)
    : _queue(queue), _state(std::make_shared<State>(State{port, nullptr}))
{
}

void InvalidationNotice::setCallback(Callback callback)
{
    _state->callback = std::move(callback);
    if (_state->invalid)
        queueCall();
}

void InvalidationNotice::portIsInvalid()
{
    if (std::exchange(_state->invalid, true))
        return;
    queueCall();
}

void InvalidationNotice::queueCall()
{
    if (!_state->callback)
        return;
    _queue.async([weak = std::weak_ptr(_state)] {
        const auto state = weak.lock();
        if (!state)
            return;
        // Taken out first: it is called once, however often queued, and it may destroy the port.
        const Callback callback = std::exchange(state->callback, nullptr);
        if (callback)
            callback(state->port);
    });
}

} // namespace orvane
