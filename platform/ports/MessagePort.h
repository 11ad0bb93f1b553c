#pragma once

#include "platform/base/Bytes.h"
#include "platform/services/MainQueue.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

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
    virtual ~MessagePort() = default;
    [[nodiscard]] virtual bool isValid() const = 0;
    // Ends the port. The invalidation callback, if there is one, is then queued, never called from
    // within this call.
    virtual void invalidate() = 0;
    // Called once on the queue after the port has become invalid, for whatever reason. An empty
    // callback clears it; a call already queued for a cleared or destroyed port does not come.
    virtual void setInvalidationCallback(std::function<void(MessagePort&)> callback) = 0;
};

// A named local port, to which others send.
class LocalMessagePort : public MessagePort
{
public:
    // Takes one message and returns the reply's data, if any. `data` holds only during the call.
    using ReceiveCallback = std::function<std::optional<Bytes>(
        LocalMessagePort& port, std::int32_t messageId, ByteView data)>;
    // From here on messages are delivered on this queue; none before.
    virtual void setDispatchQueue(MainQueue& queue) = 0;
};

// A connection to somebody's local port. Valid until the peer closes or the transport fails.
class RemoteMessagePort : public MessagePort
{
public:
    // Sends one message, waiting at most `sendTimeout` for it to be taken. With `reply` given,
    // waits at most `receiveTimeout` for the answer and stores its data there (empty where the
    // receiver had no reply data). A frame cut short by a send time-out leaves the port invalid.
    virtual SendStatus send(std::int32_t messageId, ByteView data,
                            std::chrono::milliseconds sendTimeout,
                            std::chrono::milliseconds receiveTimeout, Bytes* reply) = 0;
};

// Makes ports in one ports directory.
class MessagePorts
{
public:
    virtual ~MessagePorts() = default;
    // Null (with an error line) when the name is unusable or a live port has it.
    virtual std::unique_ptr<LocalMessagePort>
    createLocal(const std::string& name, LocalMessagePort::ReceiveCallback callback) = 0;
    // Null when nothing answers to the name.
    virtual std::unique_ptr<RemoteMessagePort> createRemote(const std::string& name) = 0;
};

// A name of 1 to 64 bytes of letters, digits, '.', '-' and '_', other than "." and "..".
bool isUsablePortName(std::string_view name);

} // namespace orvane
