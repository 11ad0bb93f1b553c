#include "platform/ports/LocalMessagePort.h"

#include "platform/base/Bytes.h"
#include "platform/ports/FrameRequester.h"
#include "platform/services/SystemLog.h"

#include <deque>
#include <map>
#include <utility>

namespace orvane
{

// The connections of the port and the messages that wait for the queue. A delivery keeps it alive,
// since a receive callback may destroy the port.
class LocalMessagePort::Inbox : public std::enable_shared_from_this<LocalMessagePort::Inbox>
{
public:
    Inbox(LocalMessagePort& port, ReceiveCallback callback)
        : _port(&port), _callback(std::move(callback))
    {
    }

    void accept(std::unique_ptr<FrameConnection> connection)
    {
        const std::uint64_t id = ++_lastConnection;
        FrameConnection& accepted = *(_connections[id] = std::move(connection));
        accepted.setFrameCallback([this, id](const FrameReader::View& frame) { hold(id, frame); });
        accepted.setClosedCallback([this, id] { remove(id); });
    }

    void setQueue(MainQueue& queue)
    {
        _queue = &queue;
        schedule();
    }

    void close()
    {
        _port = nullptr;
        _connections.clear();
        _waiting.clear();
    }

private:
    static constexpr std::size_t kHeldLimit = 2 * kFrameDataLimit;

    struct Message {
        std::uint64_t connection;
        std::int32_t id;
        std::uint32_t serial;
        bool wantsReply;
        Bytes data;

        [[nodiscard]] std::size_t cost() const { return sizeof(Message) + data.size(); }
    };

    // By value: the connection's callbacks end with it, and so does what they captured.
    void remove(std::uint64_t connection) { _connections.erase(connection); }

    void hold(std::uint64_t connection, const FrameReader::View& frame)
    {
        if (frame.isReply)
            return;
        Message message{connection, frame.messageId, frame.serial, frame.wantsReply,
                        Bytes(frame.data.begin(), frame.data.end())};
        if (_heldBytes + message.cost() > kHeldLimit) {
            logError("More than %zu bytes of messages wait to be taken; closing the connection",
                     kHeldLimit);
            remove(connection);
            return;
        }
        _heldBytes += message.cost();
        _waiting.push_back(std::move(message));
        schedule();
    }

    void schedule()
    {
        if (!_queue || !_port || _waiting.empty() || std::exchange(_scheduled, true))
            return;
        _queue->async([weak = weak_from_this()] {
            if (const auto inbox = weak.lock())
                inbox->deliverWaiting();
        });
    }

    // What comes during the deliveries waits for the next task: a busy sender must not keep the
    // queue's other tasks waiting.
    void deliverWaiting()
    {
        _scheduled = false;
        const struct Reschedule {
            ~Reschedule() { inbox.schedule(); } // also where a callback has thrown
            Inbox& inbox;
        } reschedule{*this};
        for (std::size_t count = _waiting.size(); count > 0 && !_waiting.empty(); --count)
            deliverFirst();
    }

    void deliverFirst()
    {
        const Message message = std::move(_waiting.front());
        _waiting.pop_front();
        _heldBytes -= message.cost();
        const std::optional<Bytes> reply =
            _callback ? _callback(*_port, message.id, message.data) : std::nullopt;
        if (!message.wantsReply)
            return;
        const auto connection = _connections.find(message.connection);
        if (connection != _connections.end() &&
            !answerRequest(*connection->second, message.id, message.serial, reply))
            remove(message.connection);
    }

    LocalMessagePort* _port; // null once closed
    const ReceiveCallback _callback;
    MainQueue* _queue = nullptr;
    std::uint64_t _lastConnection = 0;
    std::map<std::uint64_t, std::unique_ptr<FrameConnection>> _connections;
    std::deque<Message> _waiting;
    std::size_t _heldBytes = 0;
    bool _scheduled = false;
};

LocalMessagePort::LocalMessagePort(std::unique_ptr<FrameListener> listener,
                                   ReceiveCallback callback, MainQueue& mainQueue)
    : MessagePort(mainQueue), _listener(std::move(listener)),
      _inbox(std::make_shared<Inbox>(*this, std::move(callback)))
{
    _listener->setConnectionCallback(
        [inbox = _inbox.get()](auto connection) { inbox->accept(std::move(connection)); });
}

LocalMessagePort::~LocalMessagePort() { end(); }

void LocalMessagePort::invalidate()
{
    end();
    hasBecomeInvalid();
}

void LocalMessagePort::end()
{
    _listener.reset();
    _inbox->close();
    _kept.reset();
}

void LocalMessagePort::setDispatchQueue(MainQueue& queue) { _inbox->setQueue(queue); }

} // namespace orvane
