#pragma once

#include "platform/base/Bytes.h"
#include "platform/ports/FrameConnection.h"
#include "platform/ports/MessagePort.h"

#include <chrono>
#include <functional>
#include <memory>

namespace orvane
{

// The end of a connection that sends requests and waits for their replies. Owns the connection.
//
// A reply belongs to the request of its serial; one that comes after its request was given up is
// dropped. A request from the other end is answered without data.
class FrameRequester
{
public:
    explicit FrameRequester(std::unique_ptr<FrameConnection> connection);
    FrameRequester(const FrameRequester&) = delete;
    FrameRequester& operator=(const FrameRequester&) = delete;

    // Called for each frame that is not a reply, also from within send(). Must not call this
    // object.
    void setMessageCallback(std::function<void(const FrameReader::View&)> callback);
    // As the connection's own, never from within a call.
    void setClosedCallback(std::function<void()> callback);

    [[nodiscard]] bool isOpen() const { return _connection->isOpen(); }
    void close() { _connection->close(); }
    // Sends one message, waiting at most `sendTimeout` for it to be taken. With `reply` given,
    // waits at most `receiveTimeout` for the answer and stores its data there (empty where the
    // receiver had no reply data). A frame cut short by a send time-out closes the connection. Data
    // beyond kFrameDataLimit is refused with an error line and TransportError; the connection stays
    // open.
    SendStatus send(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout,
                    std::chrono::milliseconds receiveTimeout, Bytes* reply);

private:
    struct Awaited {
        std::uint32_t serial;
        std::optional<Bytes> data;
    };

    void take(const FrameReader::View& frame);
    SendStatus push(std::int32_t messageId, std::uint32_t serial, bool wantsReply, ByteView data,
                    std::chrono::milliseconds timeout);

    std::unique_ptr<FrameConnection> _connection;
    std::function<void(const FrameReader::View&)> _messageCallback;
    std::uint32_t _lastSerial = 0;
    std::optional<Awaited> _awaited;
};

// Sends the one reply that a request gets, without data where there is none. Returns false, with an
// error line, when the peer leaves so many replies unread that the connection must end.
bool answerRequest(FrameConnection& connection, std::int32_t messageId, std::uint32_t serial,
                   const std::optional<Bytes>& reply);

} // namespace orvane
