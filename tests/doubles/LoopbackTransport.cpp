#include "doubles/LoopbackTransport.h"

#include "doubles/LoopbackConnection.h"
#include "platform/base/Bytes.h"
#include "platform/ports/MessagePort.h"

#include <map>
#include <utility>
#include <vector>

namespace orvane
{

namespace
{

// The state that both ends of a listening name share.
struct LoopbackListening {
    explicit LoopbackListening(ManualMainQueue& listenersQueue) : queue(listenersQueue) {}
    ManualMainQueue& queue;
    std::function<void(std::unique_ptr<FrameConnection>)> callback;
};

class LoopbackListener final : public FrameListener
{
public:
    explicit LoopbackListener(std::shared_ptr<LoopbackListening> listening)
        : _listening(std::move(listening))
    {
    }
    void
    setConnectionCallback(std::function<void(std::unique_ptr<FrameConnection>)> callback) override
    {
        _listening->callback = std::move(callback);
    }

private:
    std::shared_ptr<LoopbackListening> _listening;
};

} // namespace

// The names and connections of both sides.
class LoopbackTransport::Network
{
public:
    std::shared_ptr<LoopbackListening> listen(const std::string& name, ManualMainQueue& queue)
    {
        if (hasListener(name) || _ports[name].refusesListener)
            return nullptr;
        const auto listening = std::make_shared<LoopbackListening>(queue);
        _ports[name].listening = listening;
        return listening;
    }

    [[nodiscard]] bool hasListener(const std::string& name) const
    {
        const auto found = _ports.find(name);
        return found != _ports.end() && !found->second.listening.expired();
    }

    std::unique_ptr<FrameConnection> connect(const std::string& name, ManualMainQueue& queue)
    {
        const auto found = _ports.find(name);
        const auto listening = found == _ports.end() ? nullptr : found->second.listening.lock();
        if (!listening || found->second.refuses)
            return nullptr;
        const auto connector = std::make_shared<LoopbackEnd>(queue);
        const auto accepted = std::make_shared<LoopbackEnd>(listening->queue);
        LoopbackEnd::join(connector, accepted);
        connector->setSegmentBytes(_segmentBytes);
        accepted->setSegmentBytes(_segmentBytes);
        connector->setRoom(found->second.roomFromPort);
        accepted->setRoom(found->second.room);
        auto& connections = found->second.connections;
        std::erase_if(connections, [](const Connection& each) {
            return each.connector.expired() && each.accepted.expired();
        });
        connections.push_back({connector, accepted});

        // If the listener goes first, the task is dropped with this, and the connector sees its
        // connection close.
        auto connection = std::make_shared<std::unique_ptr<FrameConnection>>(
            std::make_unique<LoopbackConnection>(accepted));
        listening->queue.async([weak = std::weak_ptr(listening), connection] {
            const auto alive = weak.lock();
            if (!alive || !alive->callback)
                return;
            const auto callback = alive->callback; // it may destroy its listener
            callback(std::move(*connection));
        });
        return std::make_unique<LoopbackConnection>(connector);
    }

    // The other settings belong to the name and hold before anything listens there.
    void refuse(const std::string& name, bool refuses) { _ports[name].refuses = refuses; }

    void refuseListener(const std::string& name, bool refuses)
    {
        _ports[name].refusesListener = refuses;
    }

    void setRoom(const std::string& name, std::optional<std::size_t> room)
    {
        _ports[name].room = room;
        forPort(name, [room](LoopbackEnd& end) { end.setRoom(room); });
    }

    void setRoomFromPort(const std::string& name, std::optional<std::size_t> room)
    {
        _ports[name].roomFromPort = room;
        forConnectors(name, [room](LoopbackEnd& end) { end.setRoom(room); });
    }

    void setSegmentBytes(std::optional<std::size_t> bytes)
    {
        _segmentBytes = bytes;
        for (const auto& [name, port] : _ports) {
            const auto set = [bytes](LoopbackEnd& end) { end.setSegmentBytes(bytes); };
            forConnectors(name, set);
            forPort(name, set);
        }
    }

    // Calls action(end) for each existing end of the name, connecting or listening.
    template <typename Action>
    void forConnectors(const std::string& name, const Action& action) const
    {
        forEnds(name, &Connection::connector, action);
    }
    template <typename Action>
    void forPort(const std::string& name, const Action& action) const
    {
        forEnds(name, &Connection::accepted, action);
    }

private:
    struct Connection {
        std::weak_ptr<LoopbackEnd> connector;
        std::weak_ptr<LoopbackEnd> accepted;
    };
    struct Port {
        std::weak_ptr<LoopbackListening> listening;
        bool refuses = false;
        bool refusesListener = false;
        std::optional<std::size_t> room; // nothing = it reads
        std::optional<std::size_t> roomFromPort;
        std::vector<Connection> connections;
    };

    template <typename Action>
    void forEnds(const std::string& name, std::weak_ptr<LoopbackEnd> Connection::*which,
                 const Action& action) const
    {
        const auto found = _ports.find(name);
        if (found == _ports.end())
            return;
        const auto connections = found->second.connections; // the action may connect
        for (const Connection& connection : connections)
            if (const auto end = (connection.*which).lock())
                action(*end);
    }

    std::map<std::string, Port> _ports;
    std::optional<std::size_t> _segmentBytes;
};

class LoopbackTransport::Side final : public FrameTransport
{
public:
    Side(std::shared_ptr<Network> network, ManualMainQueue& queue)
        : _network(std::move(network)), _queue(queue)
    {
    }

    std::unique_ptr<FrameListener> listen(const std::string& name, std::string& error) override
    {
        if (!isUsablePortName(name)) {
            error = "\"" + name + "\" is no usable port name";
            return nullptr;
        }
        auto listening = _network->listen(name, _queue);
        if (!listening) {
            error = "a live port has the name";
            return nullptr;
        }
        return std::make_unique<LoopbackListener>(std::move(listening));
    }

    std::unique_ptr<FrameConnection> connect(const std::string& name, std::string& error) override
    {
        auto connection = _network->connect(name, _queue);
        if (!connection)
            error = "nothing accepts on \"" + name + "\"";
        return connection;
    }

private:
    std::shared_ptr<Network> _network;
    ManualMainQueue& _queue;
};

LoopbackTransport::LoopbackTransport(ManualMainQueue& queue)
    : _peerQueue(queue), _network(std::make_shared<Network>()),
      _side(std::make_unique<Side>(_network, queue)),
      _peerSide(std::make_unique<Side>(_network, _peerQueue))
{
}

LoopbackTransport::~LoopbackTransport() = default;

std::unique_ptr<FrameListener> LoopbackTransport::listen(const std::string& name,
                                                         std::string& error)
{
    return _side->listen(name, error);
}

std::unique_ptr<FrameConnection> LoopbackTransport::connect(const std::string& name,
                                                            std::string& error)
{
    return _side->connect(name, error);
}

FrameTransport& LoopbackTransport::peerSide() { return *_peerSide; }

ManualMainQueue& LoopbackTransport::peerQueue() { return _peerQueue; }

bool LoopbackTransport::hasListener(const std::string& name) const
{
    return _network->hasListener(name);
}

std::size_t LoopbackTransport::openConnections(const std::string& name) const
{
    std::size_t count = 0;
    _network->forConnectors(name,
                            [&count](const LoopbackEnd& end) { count += end.isOpen() ? 1 : 0; });
    return count;
}

void LoopbackTransport::refuseConnections(const std::string& name, bool refuse)
{
    _network->refuse(name, refuse);
}

void LoopbackTransport::refuseListener(const std::string& name, bool refuse)
{
    _network->refuseListener(name, refuse);
}

void LoopbackTransport::stopReading(const std::string& name, std::size_t room)
{
    _network->setRoom(name, room);
}

void LoopbackTransport::resumeReading(const std::string& name)
{
    _network->setRoom(name, std::nullopt);
}

void LoopbackTransport::stopReadingFromPort(const std::string& name, std::size_t room)
{
    _network->setRoomFromPort(name, room);
}

void LoopbackTransport::resumeReadingFromPort(const std::string& name)
{
    _network->setRoomFromPort(name, std::nullopt);
}

void LoopbackTransport::cutConnections(const std::string& name)
{
    const auto fail = [](LoopbackEnd& end) { end.fail(); };
    _network->forConnectors(name, fail);
    _network->forPort(name, fail);
}

void LoopbackTransport::injectToPort(const std::string& name, ByteView bytes)
{
    _network->forPort(name, [bytes](LoopbackEnd& end) { end.arrive(bytes); });
}

void LoopbackTransport::injectFromPort(const std::string& name, ByteView bytes)
{
    _network->forConnectors(name, [bytes](LoopbackEnd& end) { end.arrive(bytes); });
}

void LoopbackTransport::setSegmentBytes(std::optional<std::size_t> bytes)
{
    _network->setSegmentBytes(bytes);
}

} // namespace orvane
