#include "platform/ports/FrameRequester.h"

#include "platform/base/Bytes.h"
#include "platform/services/SystemLog.h"

namespace orvane
{

namespace
{

// Bytes of replies that a peer may leave unread: room for two of the largest.
constexpr std::size_t kUnreadLimit = 2 * kFrameDataLimit;

} // namespace

FrameRequester::FrameRequester(std::unique_ptr<FrameConnection> connection)
    : _connection(std::move(connection))
{
    _connection->setFrameCallback([this](const FrameReader::View& frame) { take(frame); });
}

void FrameRequester::setMessageCallback(std::function<void(const FrameReader::View&)> callback)
{
    _messageCallback = std::move(callback);
}

void FrameRequester::setClosedCallback(std::function<void()> callback)
{
    _connection->setClosedCallback(std::move(callback));
}

void FrameRequester::take(const FrameReader::View& frame)
{
    if (frame.isReply) {
        if (_awaited && _awaited->serial == frame.serial && !_awaited->data)
            _awaited->data.emplace(frame.data.begin(), frame.data.end());
        return;
    }
    if (frame.wantsReply &&
        !answerRequest(*_connection, frame.messageId, frame.serial, std::nullopt)) {
        _connection->close();
        return;
    }
    if (_messageCallback)
        _messageCallback(frame);
}

SendStatus FrameRequester::send(std::int32_t messageId, ByteView data,
                                std::chrono::milliseconds sendTimeout,
                                std::chrono::milliseconds receiveTimeout, Bytes* reply)
{
    if (!isOpen())
        return SendStatus::NotValid;
    if (data.size() > kFrameDataLimit) {
        logError("Message of %zu bytes is larger than the limit of %zu; not sent", data.size(),
                 kFrameDataLimit);
        return SendStatus::TransportError;
    }
    const std::uint32_t serial = ++_lastSerial;
    if (!reply)
        return push(messageId, serial, false, data, sendTimeout);

    // The reply may come while the last bytes of the request are still on their way out.
    _awaited = Awaited{serial, std::nullopt};
    SendStatus status = push(messageId, serial, true, data, sendTimeout);
    if (status == SendStatus::Success) {
        const auto answered = [this] { return _awaited->data.has_value(); };
        if (!answered() && !_connection->waitUntil(answered, receiveTimeout))
            status = isOpen() ? SendStatus::ReceiveTimeout : SendStatus::BecameInvalid;
    }
    if (status == SendStatus::Success)
        *reply = std::move(*_awaited->data);
    _awaited.reset();
    return status;
}

// Sends one frame and waits until the transport has taken all of it.
SendStatus FrameRequester::push(std::int32_t messageId, std::uint32_t serial, bool wantsReply,
                                ByteView data, std::chrono::milliseconds timeout)
{
    if (!_connection->send(messageId, serial, wantsReply, false, data))
        return SendStatus::TransportError;
    // A failed transport may report an empty queue.
    const auto taken = [this] { return isOpen() && _connection->queuedBytes() == 0; };
    if (taken() || _connection->waitUntil(taken, timeout))
        return SendStatus::Success;
    if (!isOpen())
        return SendStatus::TransportError;
    // After half a frame the stream is useless. A frame of which nothing was sent is taken back.
    if (!_connection->withdrawLast())
        _connection->close();
    return SendStatus::SendTimeout;
}

bool answerRequest(FrameConnection& connection, std::int32_t messageId, std::uint32_t serial,
                   const std::optional<Bytes>& reply)
{
    const bool fits = !reply || reply->size() <= kFrameDataLimit;
    if (!fits)
        logError("Reply of %zu bytes is larger than the limit of %zu; answering with no data",
                 reply->size(), kFrameDataLimit);
    connection.send(messageId, serial, false, true, reply && fits ? ByteView(*reply) : ByteView());
    if (connection.queuedBytes() <= kUnreadLimit)
        return true;
    logError("A peer leaves %zu bytes of replies unread; closing the connection",
             connection.queuedBytes());
    return false;
}

} // namespace orvane
