#pragma once

#include "platform/services/MainQueue.h"

#include <functional>
#include <memory>
#include <string_view>

namespace orvane
{

enum class SendStatus : int {
    Success = 0,
    SendTimeout = -1,
    ReceiveTimeout = -2,
    NotValid = -3,
    TransportError = -4,
    BecameInvalid = -5, // while waiting for the reply
};

// One end of a named message connection. Ports belong to the thread that made them.
class MessagePort
{
public:
    using InvalidationCallback = std::function<void(MessagePort&)>;

    virtual ~MessagePort() = default;
    MessagePort(const MessagePort&) = delete;
    MessagePort& operator=(const MessagePort&) = delete;

    [[nodiscard]] virtual bool isValid() const = 0;
    // Ends the port. The invalidation callback, if there is one, is then queued, never called from
    // within this call.
    virtual void invalidate() = 0;
    // Called once on the main queue after the port has become invalid, for whatever reason, also
    // where it was invalid before. An empty callback clears it; a call that is queued already does
    // not come to a cleared callback or for a destroyed port.
    void setInvalidationCallback(InvalidationCallback callback);

protected:
    explicit MessagePort(MainQueue& mainQueue);
    // Only the first call has an effect.
    void hasBecomeInvalid();

private:
    struct Notice {
        MessagePort& port;
        InvalidationCallback callback;
        bool isDue = false;
    };

    void queueCallback();

    MainQueue& _mainQueue;
    std::shared_ptr<Notice> _notice;
};

// A name of 1 to 64 bytes of letters, digits, '.', '-' and '_', other than "." and "..".
bool isUsablePortName(std::string_view name);

} // namespace orvane
