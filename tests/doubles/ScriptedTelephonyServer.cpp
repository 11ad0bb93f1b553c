#include "doubles/ScriptedTelephonyServer.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"

#include <algorithm>
#include <stdexcept>

namespace orvane
{

namespace
{

Bytes xmlBytes(const PropertyValue& value)
{
    const auto bytes = xmlPropertyListBytes(value);
    if (!bytes)
        throw std::invalid_argument("a test lets the server send what XML cannot carry");
    return *bytes;
}

Bytes garbage()
{
    constexpr std::string_view kText = "this is no property list";
    return Bytes(kText.begin(), kText.end());
}

} // namespace

struct ScriptedTelephonyServer::Client {
    std::shared_ptr<FrameConnection> connection;
};

struct ScriptedTelephonyServer::Channel {
    std::string port;
    std::string clientPort;
    std::unique_ptr<FrameListener> listener;
    std::shared_ptr<FrameConnection> fromClient;
    std::unique_ptr<FrameConnection> toClient;
};

ScriptedTelephonyServer::ScriptedTelephonyServer(LoopbackTransport& loopback)
    : ScriptedTelephonyServer(loopback.peerSide(), loopback.peerQueue())
{
}

ScriptedTelephonyServer::ScriptedTelephonyServer(FrameTransport& transport, MainQueue& queue)
    : _transport(transport), _queue(queue)
{
    if (!restart())
        throw std::runtime_error("the scripted telephony server cannot listen");
}

ScriptedTelephonyServer::~ScriptedTelephonyServer() = default;

bool ScriptedTelephonyServer::restart()
{
    if (_listener)
        return true;
    std::string error;
    _listener = _transport.listen(kTelephonyServerPort, error);
    if (!_listener)
        return false;
    _listener->setConnectionCallback([this](auto connection) { accept(std::move(connection)); });
    return true;
}

void ScriptedTelephonyServer::die()
{
    _listener.reset();
    _clients.clear();
    closeChannels();
}

void ScriptedTelephonyServer::closeChannels() { _channels.clear(); }

void ScriptedTelephonyServer::accept(std::unique_ptr<FrameConnection> connection)
{
    Client& client = *_clients.emplace_back(std::make_unique<Client>());
    client.connection = std::move(connection);
    client.connection->setFrameCallback(
        [this, &client](const FrameReader::View& frame) { takeRequest(client, frame); });
    client.connection->setClosedCallback([this, &client] {
        std::erase_if(_clients, [&client](const auto& each) { return each.get() == &client; });
    });
}

void ScriptedTelephonyServer::takeRequest(Client& client, const FrameReader::View& frame)
{
    if (frame.messageId != kCreateLogChannelMessage || !frame.wantsReply)
        return;
    const PropertyValue request = readPropertyList(frame.data).value;
    const std::string* clientPort = request[kCreateLogChannelKey].asString();
    _requestedPorts.push_back(clientPort ? *clientPort : std::string());
    if (channelAnswer != ChannelAnswer::None)
        answer(client.connection, frame.serial, channelReply(_requestedPorts.back()));
}

Bytes ScriptedTelephonyServer::channelReply(const std::string& clientPort)
{
    if (channelAnswer == ChannelAnswer::Garbage)
        return garbage();
    if (channelAnswer == ChannelAnswer::Empty)
        return {};
    PropertyValue reply = PropertyValue::newDictionary();
    reply.asDictionary()->set(kLogChannelErrorKey, PropertyValue::integer(channelError));
    if (channelError == 0 && channelAnswer == ChannelAnswer::EmptyPort)
        reply.asDictionary()->set(kLogChannelPortKey, "");
    if (channelError == 0 && channelAnswer == ChannelAnswer::Channel)
        reply.asDictionary()->set(kLogChannelPortKey, openChannel(clientPort));
    return xmlBytes(reply);
}

std::string ScriptedTelephonyServer::openChannel(const std::string& clientPort)
{
    Channel& channel = *_channels.emplace_back(std::make_unique<Channel>());
    channel.port = "TelephonyServer.channel-" + std::to_string(++_channelsOpened);
    channel.clientPort = clientPort;
    if (!channelPortExists)
        return channel.port;
    std::string error;
    channel.listener = _transport.listen(channel.port, error);
    if (!channel.listener)
        throw std::runtime_error("the scripted telephony server cannot listen for a channel");
    channel.listener->setConnectionCallback([this, &channel](auto connection) {
        channel.fromClient = std::move(connection);
        channel.fromClient->setFrameCallback([this, &channel](const FrameReader::View& frame) {
            takeChannelMessage(channel, frame);
        });
        channel.fromClient->setClosedCallback([this, &channel] { removeChannel(&channel); });
    });
    return channel.port;
}

void ScriptedTelephonyServer::takeChannelMessage(Channel& channel, const FrameReader::View& frame)
{
    if (frame.messageId != kChannelMessage)
        return;
    PropertyValue command = readPropertyList(frame.data).value;
    if (!frame.wantsReply) {
        _startCommands.push_back(std::move(command));
        return;
    }
    _technologyQueries.push_back(std::move(command));
    switch (technologyAnswer) {
    case TechnologyAnswer::Technology:
        answer(channel.fromClient, frame.serial,
               xmlBytes(PropertyValue::dictionaryOf({
                   {kGetTechnologyKey, technology}
        })));
        break;
    case TechnologyAnswer::NoKey:
        answer(channel.fromClient, frame.serial, xmlBytes(PropertyValue::newDictionary()));
        break;
    case TechnologyAnswer::Garbage:
        answer(channel.fromClient, frame.serial, garbage());
        break;
    case TechnologyAnswer::Empty:
        answer(channel.fromClient, frame.serial, {});
        break;
    case TechnologyAnswer::None:
        return;
    }
    if (afterTechnologyAnswer) {
        const auto hook = afterTechnologyAnswer; // it may replace itself
        hook();
    }
}

void ScriptedTelephonyServer::answer(const std::shared_ptr<FrameConnection>& connection,
                                     std::uint32_t serial, Bytes data)
{
    if (answerDelay.count() == 0) {
        connection->send(0, serial, false, true, data);
        return;
    }
    _queue.after(answerDelay, [weak = std::weak_ptr(connection), serial, data = std::move(data)] {
        if (const auto alive = weak.lock())
            alive->send(0, serial, false, true, data);
    });
}

void ScriptedTelephonyServer::removeChannel(const Channel* channel)
{
    std::erase_if(_channels, [channel](const auto& each) { return each.get() == channel; });
}

std::string ScriptedTelephonyServer::channelPort() const
{
    return _channels.empty() ? std::string() : _channels.back()->port;
}

std::string ScriptedTelephonyServer::clientPort() const
{
    return _channels.empty() ? std::string() : _channels.back()->clientPort;
}

bool ScriptedTelephonyServer::sendLogMessage(ByteView data, std::int32_t messageId)
{
    if (_channels.empty())
        return false;
    Channel& channel = *_channels.back();
    if (!channel.toClient) {
        std::string error;
        channel.toClient = _transport.connect(channel.clientPort, error);
        if (!channel.toClient)
            return false;
        channel.toClient->setFrameCallback([](const FrameReader::View&) {});
        channel.toClient->setClosedCallback([this, &channel] { removeChannel(&channel); });
    }
    return channel.toClient->send(messageId, 0, false, false, data);
}

void ScriptedTelephonyServer::notify(const std::string& name, const PropertyValue& info)
{
    PropertyValue notification = PropertyValue::dictionaryOf({
        {kNotificationNameKey, name}
    });
    if (info)
        notification.asDictionary()->set(kNotificationInfoKey, info);
    sendToClients(kNotificationMessage, xmlBytes(notification));
}

void ScriptedTelephonyServer::sendToClients(std::int32_t messageId, ByteView data)
{
    for (const auto& client : _clients)
        client->connection->send(messageId, 0, false, false, data);
}

} // namespace orvane
