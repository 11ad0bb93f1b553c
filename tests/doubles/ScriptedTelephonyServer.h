#pragma once

#include "doubles/LoopbackTransport.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/ports/FrameConnection.h"
#include "platform/services/MainQueue.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace orvane
{

// A telephony server that answers as the test chooses and records what clients send.
//
// It uses the real wire format over any frame transport. The public fields set the answers from
// then on; a test may change them at any time.
class ScriptedTelephonyServer
{
public:
    enum class ChannelAnswer { Channel, EmptyPort, NoPort, Garbage, Empty, None };
    enum class TechnologyAnswer { Technology, NoKey, Garbage, Empty, None };

    // Listens at once. With LoopbackTransport the server is on the peer side.
    explicit ScriptedTelephonyServer(LoopbackTransport& loopback);
    ScriptedTelephonyServer(FrameTransport& transport, MainQueue& queue);
    ~ScriptedTelephonyServer();
    ScriptedTelephonyServer(const ScriptedTelephonyServer&) = delete;
    ScriptedTelephonyServer& operator=(const ScriptedTelephonyServer&) = delete;

    // The answer to a request for a log channel. With an error other than 0 it has no port.
    ChannelAnswer channelAnswer = ChannelAnswer::Channel;
    std::int32_t channelError = 0;
    // Whether the port that the answer names exists.
    bool channelPortExists = true;
    // The answer to the technology query; the value may be of any type.
    TechnologyAnswer technologyAnswer = TechnologyAnswer::Technology;
    PropertyValue technology = kTSLogChannelTechnology_Varnel_LTE;
    // How long each answer takes.
    std::chrono::milliseconds answerDelay{0};
    // Called after each answer to a technology query is sent, before the client receives it: here
    // the channel's port can stop reading, or the server die, before the start command.
    std::function<void()> afterTechnologyAnswer;

    // What clients sent, in order of arrival.
    [[nodiscard]] const std::vector<std::string>& requestedPorts() const { return _requestedPorts; }
    [[nodiscard]] const std::vector<PropertyValue>& technologyQueries() const
    {
        return _technologyQueries;
    }
    // A command that is not a property list is an absent value.
    [[nodiscard]] const std::vector<PropertyValue>& startCommands() const { return _startCommands; }

    // The number of clients connected to the server port.
    [[nodiscard]] std::size_t clientCount() const { return _clients.size(); }
    [[nodiscard]] std::size_t channelCount() const { return _channels.size(); }
    // Names of the newest channel's ports, the server's and the client's; empty without a channel.
    [[nodiscard]] std::string channelPort() const;
    [[nodiscard]] std::string clientPort() const;

    // Sends a message to the client's port of the newest channel, whether or not a start command
    // has come. False when there is no channel or nothing accepts on the port.
    bool sendLogMessage(ByteView data, std::int32_t messageId = 0);
    // Sends a notification to every client, without the info if that is absent.
    void notify(const std::string& name, const PropertyValue& info = {});
    // Sends the bytes to every client as a message.
    void sendToClients(std::int32_t messageId, ByteView data);
    // Closes every channel; the server goes on.
    void closeChannels();
    // Closes everything, as the end of the server process does.
    void die();
    // Listens again. Returns false while something else uses the name.
    bool restart();

private:
    struct Client;
    struct Channel;

    void accept(std::unique_ptr<FrameConnection> connection);
    void takeRequest(Client& client, const FrameReader::View& frame);
    Bytes channelReply(const std::string& clientPort);
    std::string openChannel(const std::string& clientPort);
    void takeChannelMessage(Channel& channel, const FrameReader::View& frame);
    void removeChannel(const Channel* channel);
    void answer(const std::shared_ptr<FrameConnection>& connection, std::uint32_t serial,
                Bytes data);

    FrameTransport& _transport;
    MainQueue& _queue;
    std::unique_ptr<FrameListener> _listener;
    std::vector<std::unique_ptr<Client>> _clients;
    std::vector<std::unique_ptr<Channel>> _channels;
    std::uint64_t _channelsOpened = 0;
    std::vector<std::string> _requestedPorts;
    std::vector<PropertyValue> _technologyQueries;
    std::vector<PropertyValue> _startCommands;
};

} // namespace orvane
