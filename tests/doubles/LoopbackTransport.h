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

// A frame transport inside one process, without sockets and in a test's own time.
//
// It has two sides, as a client's and a server's process have: this object is the one, peerSide()
// the other, each with a main queue of its own on one clock. Frames are serialised and parsed as on
// a socket. Nothing arrives within a call, but as tasks of the receiver's queue. While a connection
// waits (FrameConnection::waitUntil), only it and the other side are served, for as long as the
// other side has something to do within the timeout; a peer on the same side does not act
// meanwhile. A wait in vain turns the clock on by its timeout.
//
// Connections and listeners must not outlive the transport's queues.
class LoopbackTransport final : public FrameTransport
{
public:
    // `queue` is this side's.
    explicit LoopbackTransport(ManualMainQueue& queue);
    ~LoopbackTransport() override;

    std::unique_ptr<FrameListener> listen(const std::string& name, std::string& error) override;
    std::unique_ptr<FrameConnection> connect(const std::string& name, std::string& error) override;

    [[nodiscard]] FrameTransport& peerSide();
    [[nodiscard]] ManualMainQueue& peerQueue();

    // What a test does to connections. Each is named by the port that it leads to and may lie on
    // either side; what is set for a name holds for connections made later, too.

    // Whether anything listens on the name.
    [[nodiscard]] bool hasListener(const std::string& name) const;
    // How many connections to the name are open at the end that made them.
    [[nodiscard]] std::size_t openConnections(const std::string& name) const;
    // Connections to the name fail from here on although something listens, or no longer do.
    void refuseConnections(const std::string& name, bool refuse = true);
    // Nobody can listen on the name from here on, or somebody can again.
    void refuseListener(const std::string& name, bool refuse = true);
    // The port of the name no longer reads: of what is sent to it from here on, `room` more bytes a
    // connection are taken, the rest stays unsent with the sender.
    void stopReading(const std::string& name, std::size_t room = 0);
    void resumeReading(const std::string& name);
    // The same for the ends that connected to the name: what the port sends is not read.
    void stopReadingFromPort(const std::string& name, std::size_t room = 0);
    void resumeReadingFromPort(const std::string& name);
    // Breaks all connections to the name: both ends find them closed.
    void cutConnections(const std::string& name);
    // Bytes as though they had been sent on each connection to the name, to the port or from it.
    void injectToPort(const std::string& name, ByteView bytes);
    void injectFromPort(const std::string& name, ByteView bytes);
    // At most this many bytes arrive at once; nothing = all that are there.
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
