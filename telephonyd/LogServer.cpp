#include "telephonyd/LogServer.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "platform/ports/FrameRequester.h"
#include "platform/ports/MessagePort.h"
#include "platform/services/SystemLog.h"
#include "telephonyd/LogChannel.h"

#include <utility>
#include <vector>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;

constexpr auto kNotificationDelay = 100ms;

// A client's port must have a usable name, and not the name of a port of the server: messages would
// come back to the server.
bool isClientPort(const std::string& name)
{
    return isUsablePortName(name) && !name.starts_with(kTelephonyServerPort);
}

Bytes xmlBytes(const PropertyValue& value) { return xmlPropertyListBytes(value).value_or(Bytes()); }

} // namespace

LogServer::LogServer(FrameTransport& transport, MainQueue& queue, LogSourceFactory makeSource)
    : _transport(transport), _queue(queue), _makeSource(std::move(makeSource))
{
}

LogServer::~LogServer() { stop(); }

std::optional<std::string> LogServer::start()
{
    std::string error;
    _listener = _transport.listen(kTelephonyServerPort, error);
    if (!_listener)
        return error;
    _listener->setConnectionCallback([this](auto connection) { accept(std::move(connection)); });
    return std::nullopt;
}

void LogServer::stop()
{
    _listener.reset();
    _channels.clear();
    _clients.clear();
    _clientCheck.reset();
}

void LogServer::accept(std::unique_ptr<FrameConnection> connection)
{
    const ClientId client = ++_lastClient;
    FrameConnection& accepted = *(_clients[client].connection = std::move(connection));
    accepted.setFrameCallback(
        [this, client](const FrameReader::View& frame) { take(client, frame); });
    // By value: the callback and its captures are destroyed with the connection.
    accepted.setClosedCallback([this, client] { _clients.erase(ClientId(client)); });
    if (!_clientCheck)
        _clientCheck = _queue.repeatingTimer(kClientCheckInterval, [this] { checkClients(); });
}

void LogServer::checkClients()
{
    for (auto client = _clients.begin(); client != _clients.end();) {
        const auto checked = client++;
        if (!checked->second.watch.check(*checked->second.connection))
            continue;
        logWarning("A client does not finish a frame; closing its connection");
        _clients.erase(checked);
    }
    for (const auto& [number, channel] : _channels)
        channel->checkClient();
    if (_clients.empty() && _channels.empty())
        _clientCheck.reset(); // nobody to wait for
}

void LogServer::take(ClientId client, const FrameReader::View& frame)
{
    // Without a reply a client could not know its channel.
    if (frame.isReply || !frame.wantsReply)
        return;
    std::optional<Bytes> reply;
    if (frame.messageId == kCreateLogChannelMessage)
        reply = replyToRequest(client, frame.data);
    const auto found = _clients.find(client);
    if (found != _clients.end() &&
        !answerRequest(*found->second.connection, frame.messageId, frame.serial, reply))
        _clients.erase(found);
}

Bytes LogServer::replyToRequest(ClientId client, ByteView request)
{
    const PropertyListResult parsed = readPropertyList(request);
    const std::string* clientPort = parsed.value[kCreateLogChannelKey].asString();
    std::string port;
    std::int32_t error = kBadRequest;
    if (!parsed.value)
        logError("A request for a log channel is not a property list: %s", parsed.error.c_str());
    else if (!clientPort || !isClientPort(*clientPort))
        logError("A request for a log channel names no port to send to");
    else
        error = openChannel(client, *clientPort, port);
    if (error != 0)
        return xmlBytes(PropertyValue::dictionaryOf({
            {kLogChannelErrorKey, PropertyValue::integer(error)}
        }));
    return xmlBytes(PropertyValue::dictionaryOf({
        {kLogChannelErrorKey, PropertyValue::integer(0)},
        {kLogChannelPortKey,  port                     },
    }));
}

std::int32_t LogServer::openChannel(ClientId client, const std::string& clientPort,
                                    std::string& port)
{
    if (_channels.size() >= kMostChannels) {
        logError("No log channel for %s: there are already %zu", clientPort.c_str(),
                 _channels.size());
        return kNoChannel;
    }
    std::string error;
    auto toClient = _transport.connect(clientPort, error);
    if (!toClient) {
        logError("No log channel for %s: %s", clientPort.c_str(), error.c_str());
        return kClientUnreachable;
    }
    const ChannelNumber number = ++_lastChannel;
    port = std::string(kTelephonyServerPort) + ".Channel." + std::to_string(number);
    auto listener = _transport.listen(port, error);
    auto source = listener ? _makeSource() : nullptr;
    if (!source) {
        logError("No log channel for %s: %s", clientPort.c_str(),
                 listener ? "there is no source of messages" : error.c_str());
        return kNoChannel;
    }
    _channels[number] = std::make_unique<LogChannel>(
        port, std::move(listener), std::move(toClient), std::move(source),
        LogChannel::Events{[this, client] { channelStarted(client); },
                           [this, number] { channelEnded(number); }});
    logLine(LogPriority::Info, "%s is open for %s", port.c_str(), clientPort.c_str());
    if (_isModemMissing)
        _queue.async(
            _lifetime.whileAlive([this, client] { notify(client, kModemMissingNotification); }));
    return 0;
}

// Later, because the channel or its source may still be running.
void LogServer::channelEnded(ChannelNumber number)
{
    _queue.async(_lifetime.whileAlive([this, number] {
        const auto found = _channels.find(number);
        if (found == _channels.end())
            return;
        logLine(LogPriority::Info, "%s is closed", found->second->name().c_str());
        _channels.erase(found);
    }));
}

// The client need not wait for its timer to show the first messages.
void LogServer::channelStarted(ClientId client)
{
    _queue.after(kNotificationDelay, _lifetime.whileAlive([this, client] {
        notify(client, kChannelStreamingNotification);
    }));
}

void LogServer::technologyChanged()
{
    _channels.clear();
    // Clients must see the end of their channels before the notification, because it makes them
    // check.
    _queue.after(kNotificationDelay,
                 _lifetime.whileAlive([this] { notifyAll(kTechnologyChangedNotification); }));
}

void LogServer::setModemMissing(bool isMissing)
{
    if (std::exchange(_isModemMissing, isMissing) != isMissing)
        notifyAll(isMissing ? kModemMissingNotification : kModemPresentNotification);
}

void LogServer::notifyAll(const char* name)
{
    std::vector<ClientId> clients;
    for (const auto& [client, connection] : _clients)
        clients.push_back(client);
    for (const ClientId client : clients)
        notify(client, name);
}

void LogServer::notify(ClientId client, const char* name)
{
    const auto found = _clients.find(client);
    if (found == _clients.end())
        return;
    found->second.connection->send(kNotificationMessage, 0, false, false,
                                   xmlBytes(PropertyValue::dictionaryOf({
                                       {kNotificationNameKey, name}
    })));
}

} // namespace orvane
