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

// A telephony server whose answers a test chooses and which keeps what clients sent it.
//
// It speaks the true wire format over any frame transport. The public fields say what it answers
// from then on; they may be changed at any time.
class ScriptedTelephonyServer
{
public:
    enum class ChannelAnswer { Channel, EmptyPort, NoPort, Garbage, Empty, None };
    enum class TechnologyAnswer { Technology, NoKey, Garbage, Empty, None };

    // Listens at once. On a loopback the server is on the peer's side.
    explicit ScriptedTelephonyServer(LoopbackTransport& loopback);
    ScriptedTelephonyServer(FrameTransport& transport, MainQueue& queue);
    ~ScriptedTelephonyServer();
    ScriptedTelephonyServer(const ScriptedTelephonyServer&) = delete;
    ScriptedTelephonyServer& operator=(const ScriptedTelephonyServer&) = delete;

    // The answer to a request for a log channel. One with an error other than 0 has no port.
    ChannelAnswer channelAnswer = ChannelAnswer::Channel;
    std::int32_t channelError = 0;
    // Whether the port that the answer names is really there.
    bool channelPortExists = true;
    // The answer to the technology query; the value may be of any type.
    TechnologyAnswer technologyAnswer = TechnologyAnswer::Technology;
    PropertyValue technology = kTSLogChannelTechnology_Varnel_LTE;
    // How long each answer takes.
    std::chrono::milliseconds answerDelay{0};
    // Called once each answer to a technology query is sent, before the client has it: the place to
    // let the channel's port stop reading or the server die ahead of the start command.
    std::function<void()> afterTechnologyAnswer;

    // What clients have sent, in order of arrival.
    [[nodiscard]] const std::vector<std::string>& requestedPorts() const { return _requestedPorts; }
    [[nodiscard]] const std::vector<PropertyValue>& technologyQueries() const
    {
        return _technologyQueries;
    }
    // Absent values stand for commands that are no property lists.
    [[nodiscard]] const std::vector<PropertyValue>& startCommands() const { return _startCommands; }

    // How many clients are connected to the server itself.
    [[nodiscard]] std::size_t clientCount() const { return _clients.size(); }
    [[nodiscard]] std::size_t channelCount() const { return _channels.size(); }
    // Names of the newest channel's ports, the server's and the client's; empty without a channel.
    [[nodiscard]] std::string channelPort() const;
    [[nodiscard]] std::string clientPort() const;

    // Sends a message to the client's port of the newest channel, whether or not a start command
    // has come. False when there is no channel or nothing accepts on the port.
    bool sendLogMessage(ByteView data, std::int32_t messageId = 0);
    // Sends a notification to every client; an absent info is left out.
    void notify(const std::string& name, const PropertyValue& info = {});
    // Sends the bytes to every client as a message.
    void sendToClients(std::int32_t messageId, ByteView data);
    // Ends every channel, while the server lives on.
    void closeChannels();
    // Closes everything, as at the end of the server's process.
    void die();
    // Listens again. False while something else has the name.
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
