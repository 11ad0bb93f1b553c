#pragma once

#include "doubles/ManualMainQueue.h"
#include "platform/base/Bytes.h"
#include "platform/ports/FrameConnection.h"

#include <cstddef>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// A frame transport inside one process, without sockets, on a clock that the test advances.
//
// It has two sides, like a client process and a server process: this object is one, peerSide() is
// the other. Each has its own main queue on the same clock. Frames are serialised and parsed as on
// a socket. Data never arrives during a call, always as a task of the receiver's queue. While a
// connection waits (FrameConnection::waitUntil), only that connection and the other side run, and
// only while the other side has tasks due within the timeout; peers on the same side are paused. A
// wait that times out advances the clock by its timeout.
//
// Connections and listeners must not outlive the transport's queues.
class LoopbackTransport final : public FrameTransport
{
public:
    // `queue` is the queue of this side.
    explicit LoopbackTransport(ManualMainQueue& queue);
    ~LoopbackTransport() override;

    std::unique_ptr<FrameListener> listen(const std::string& name, std::string& error) override;
    std::unique_ptr<FrameConnection> connect(const std::string& name, std::string& error) override;

    [[nodiscard]] FrameTransport& peerSide();
    [[nodiscard]] ManualMainQueue& peerQueue();

    // Faults that a test sets. A name selects all connections to the port of that name, on either
    // side, also those made later.

    // Whether anything listens on the name.
    [[nodiscard]] bool hasListener(const std::string& name) const;
    // The number of connections to the name that are open at the connecting end.
    [[nodiscard]] std::size_t openConnections(const std::string& name) const;
    // Makes new connections to the name fail although something listens, or work again.
    void refuseConnections(const std::string& name, bool refuse = true);
    // Makes listening on the name fail, or work again.
    void refuseListener(const std::string& name, bool refuse = true);
    // The port of that name stops reading. Each connection takes `room` more bytes; the sender
    // keeps the rest unsent.
    void stopReading(const std::string& name, std::size_t room = 0);
    void resumeReading(const std::string& name);
    // The same for the connecting ends: they stop reading what the port sends.
    void stopReadingFromPort(const std::string& name, std::size_t room = 0);
    void resumeReadingFromPort(const std::string& name);
    // Breaks all connections to the name: both ends see them close.
    void cutConnections(const std::string& name);
    // Inserts bytes into each connection to the name, as sent to the port or by it.
    void injectToPort(const std::string& name, ByteView bytes);
    void injectFromPort(const std::string& name, ByteView bytes);
    // At most this many bytes arrive at once; nullopt: no limit.
    void setSegmentBytes(std::optional<std::size_t> bytes);

private:
    class Network;
    class Side;

    ManualMainQueue _peerQueue;
    std::shared_ptr<Network> _network;
    std::unique_ptr<Side> _side;
    std::unique_ptr<Side> _peerSide;
};

} // namespace orvane
